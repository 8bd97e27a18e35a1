#include "write/scales.h"

#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>

namespace vantrel::sheets {

void add_tones(Lines &lines, const std::vector<ToneStep> &tones)
{
    if (tones.empty())
        return;
    const bool spots =
        std::any_of(tones.begin(), tones.end(), [](const ToneStep &step) { return step.sctv; });
    lines.add(fmt::format("\n{:<22}{:>8}{:>8}{:>8}{}", "Tone values", "nominal", "aim", "sample",
                          spots ? fmt::format("{:>10}{:>8}", "SCTV aim", "SCTV") : ""));
    for (const ToneStep &step : tones)
        lines.add(fmt::format("{:<22}{:>8g}{:>8}{:>8}{:>10}{:>8}{}", cut(step.ink, 21),
                              step.nominal, fixed(step.aim), fixed(step.area), fixed(step.aim_sctv),
                              fixed(step.sctv),
                              step.patches > 1 ? fmt::format("  mean of {}", step.patches) : ""));
}

void add_greys(Lines &lines, const std::vector<GreyStep> &greys)
{
    if (!greys.empty())
        lines.add(fmt::format("\n{:<22}{:>8}{:>8}{:>8}{:>8}{:>8}  {}", "Grey scales", "nominal",
                              "ΔCh", "ΔL*", "D aim", "D", "patch"));
    for (const GreyStep &step : greys)
        lines.add(fmt::format("{:<22}{:>8g}{:>8}{:>8}{:>8}{:>8}  {}", step.scale, step.nominal,
                              fixed(step.delta_ch), fixed(step.delta_l), fixed(step.aim_density, 3),
                              fixed(step.density, 3), cut(step.name, kWidestInText)));
}

Json tones_json(const std::vector<ToneStep> &tones)
{
    Json out = Json::array();
    for (const ToneStep &step : tones)
        out.push_back({{"ink", step.ink},
                       {"nominal", step.nominal},
                       {"reference", or_null(step.aim)},
                       {"sample", or_null(step.area)},
                       {"reference_sctv", or_null(step.aim_sctv)},
                       {"sample_sctv", or_null(step.sctv)},
                       {"patches", step.patches}});
    return out;
}

Json greys_json(const std::vector<GreyStep> &greys)
{
    Json out = Json::array();
    for (const GreyStep &step : greys)
        out.push_back({{"scale", step.scale},
                       {"nominal", step.nominal},
                       {"name", step.name},
                       {"delta_ch", step.delta_ch},
                       {"delta_l", step.delta_l},
                       {"reference_density", or_null(step.aim_density)},
                       {"density", or_null(step.density)}});
    return out;
}

Flat flat_of(const std::vector<ToneStep> &tones)
{
    Flat flat;
    flat.description = "Tone values";
    flat.rows = tones.size();
    const auto number = [&](const char *name, const char *cgats, auto of) {
        flat.number(name, cgats, [&tones, of](std::size_t i) { return tones[i].*of; });
    };
    flat.text("name", "TONE_VALUE", [&tones](std::size_t i) {
        return fmt::format("Tone value {} {:g} %", tones[i].ink, tones[i].nominal);
    });
    flat.exact("nominal", "NOMINAL", [&tones](std::size_t i) { return tones[i].nominal; });
    number("dot_area", "DOT_AREA", &ToneStep::area);
    number("reference_dot_area", "REFERENCE_DOT_AREA", &ToneStep::aim);
    number("sctv", "SCTV", &ToneStep::sctv);
    number("reference_sctv", "REFERENCE_SCTV", &ToneStep::aim_sctv);
    flat.exact("repeats", "REPEATS",
               [&tones](std::size_t i) { return static_cast<double>(tones[i].patches); });
    return flat;
}

Flat flat_of(const std::vector<GreyStep> &greys)
{
    Flat flat;
    flat.description = "Grey scales";
    flat.rows = greys.size();
    flat.text("name", "GREY", [&greys](std::size_t i) {
        return fmt::format("Grey scale {}: {}", greys[i].scale, greys[i].name);
    });
    flat.exact("nominal", "NOMINAL", [&greys](std::size_t i) { return greys[i].nominal; });
    flat.number("dCh", "DCH", [&greys](std::size_t i) { return greys[i].delta_ch; });
    flat.number("dL", "DL", [&greys](std::size_t i) { return greys[i].delta_l; });
    flat.text("response", "RESPONSE", [](std::size_t) { return "Visual"; });
    flat.number("density", "DENSITY", [&greys](std::size_t i) { return greys[i].density; });
    flat.number("reference_density", "REFERENCE_DENSITY",
                [&greys](std::size_t i) { return greys[i].aim_density; });
    return flat;
}

} // namespace vantrel::sheets
