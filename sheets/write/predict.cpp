// Predictions as table, JSON and columns.

#include "judge/names.h"
#include "read/text.h"
#include "write/json_text.h"
#include "write/result.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kLongestInkInName = 200; // of a row in CSV and CGATS text

// "Magenta 100 40 % + Yellow 100 70 %", each name cut to a number of characters.
std::string inks_of(const Prediction &prediction, std::size_t most)
{
    std::string out;
    for (const InkTint &ink : prediction.inks)
        out += fmt::format("{}{} {} %", out.empty() ? "" : " + ", cut(ink.name, most), ink.percent);
    return out;
}

std::string colour_columns(const Colour &shown, bool colour)
{
    return fmt::format(" {}{:>7}{:>7}{:>7}", colour ? swatch(shown.rgb) : "", fixed(shown.lab.L),
                       fixed(shown.lab.a), fixed(shown.lab.b));
}

std::string shown(const DensityReading &reading, int status)
{
    return reading.density ? fmt::format("{} {}", response_code(status, *reading.response),
                                         fixed(reading.density, 3))
                           : "none";
}

// The densities of the one prediction.
std::string densities_of(const Predictions &predictions)
{
    const Prediction &only = predictions.all[0];
    std::string out =
        fmt::format("\nDensity ({}): halftone {}, film {}", status_name(predictions.status),
                    shown(only.halftone.reading, predictions.status),
                    shown(only.film.reading, predictions.status));
    if (only.measured)
        out += ", measured " + shown(only.measured->reading, predictions.status);
    return out;
}

// The mean and the largest difference of one model.
std::string summary(const Predictions &predictions, const char *name, Estimate Prediction::*model)
{
    double sum = 0, largest = 0;
    for (const Prediction &prediction : predictions.all) {
        const double delta_e = (prediction.*model).to_measured.value_or(0);
        sum += delta_e;
        largest = std::max(largest, delta_e);
    }
    return fmt::format("{}: mean ΔE00 {}, largest {}", name,
                       fixed(sum / static_cast<double>(predictions.all.size())), fixed(largest));
}

Json estimate_json(const Estimate &estimate, int status)
{
    Json out = {{"rgb", hex(estimate.colour.rgb)},
                {"lab", lab_json(estimate.colour.lab)},
                {"de00_to_measured", or_null(estimate.to_measured)},
                {"refl", estimate.refl}};
    add_reading(out, estimate.reading, status);
    return out;
}

Json prediction_json(const Prediction &prediction, int status)
{
    Json inks = Json::array();
    for (const InkTint &ink : prediction.inks)
        inks.push_back({{"name", ink.name}, {"percent", ink.percent}});
    Json measured;
    if (prediction.measured) {
        measured = {{"name", prediction.measured->patch},
                    {"rgb", hex(prediction.measured->colour.rgb)},
                    {"lab", lab_json(prediction.measured->colour.lab)}};
        add_reading(measured, prediction.measured->reading, status);
    }
    return {{"inks", inks},
            {"halftone", estimate_json(prediction.halftone, status)},
            {"film", estimate_json(prediction.film, status)},
            {"measured", measured}};
}

} // namespace

void write_table(const Predictions &predictions, const Sink &sink, const TableStyle &style)
{
    const bool colour = style.colour;
    const std::size_t widest = colour ? 26 : 38; // 120 columns in all
    const auto title = [&](const Prediction &prediction) {
        return cut(prediction.measured ? prediction.measured->patch
                                       : inks_of(prediction, kWidestInText),
                   widest);
    };
    std::size_t width = 11;
    for (const Prediction &prediction : predictions.all)
        width = std::max(width, characters(title(prediction)));
    Lines lines(sink);
    lines.add(fmt::format("{}: {}, on {}", predictions.file, said(predictions.illuminant),
                          said(predictions.paper)));
    if (predictions.all.size() == 1)
        lines.add(inks_of(predictions.all[0], kWidestInText));
    const std::string gap = colour ? "    " : "";
    const std::string lab = fmt::format(" {}{:>7}{:>7}{:>7}", gap, "L*", "a*", "b*");
    lines.add(fmt::format("\n{:<{}} {}{:>28} {}{:>28} {}{:>21}", "", width, gap, "Halftone", gap,
                          "Film", gap, "Measured"));
    lines.add(
        fmt::format("{:<{}}{}{:>7}{}{:>7}{}", "Combination", width, lab, "ΔE00", lab, "ΔE00", lab));
    for (const Prediction &prediction : predictions.all) {
        std::string line = fmt::format("{:<{}}", title(prediction), width);
        for (const Estimate *estimate : {&prediction.halftone, &prediction.film})
            line += colour_columns(estimate->colour, colour) +
                    fmt::format("{:>7}", fixed(estimate->to_measured));
        if (prediction.measured)
            line += colour_columns(prediction.measured->colour, colour);
        lines.add(line);
    }
    if (predictions.all.size() > 1) { // every one of them measured
        lines.add("");
        lines.add(summary(predictions, "Halftone", &Prediction::halftone));
        lines.add(summary(predictions, "Film", &Prediction::film));
    }
    if (predictions.all.size() == 1)
        lines.add(densities_of(predictions));
    if (predictions.left_out)
        lines.add(fmt::format("Left out: {} overprints of more than three inks, of fractions of a "
                              "percent, or without a solid",
                              predictions.left_out));
}

void write_json(const Predictions &predictions, const Sink &sink)
{
    const Json head = {
        {"command", "predict"},
        {"file", predictions.file},
        {"illuminant", name_of(predictions.illuminant)},
        {"illuminant_by", predictions.illuminant.by},
        {"status", status_name(predictions.status)},
        {"warnings", predictions.warnings},
        {"paper", name_json(predictions.paper)},
        {"paper_chosen", predictions.paper.reason},
        {"left_out", predictions.left_out},
    };
    write_with_array(
        head, "predictions", predictions.all.size(),
        [&](std::size_t i) { return prediction_json(predictions.all[i], predictions.status); },
        sink);
    sink.write("\n");
}

std::vector<Flat> flat_of(const Predictions &predictions)
{
    // Each prediction is a row for each model.
    const std::vector<Prediction> &all = predictions.all;
    const int status = predictions.status;
    const auto is_halftone = [](std::size_t i) { return i % 2 == 0; };
    const auto estimate = [&all, is_halftone](std::size_t i) -> const Estimate & {
        return is_halftone(i) ? all[i / 2].halftone : all[i / 2].film;
    };
    const auto model = [is_halftone](std::size_t i) {
        return is_halftone(i) ? "halftone" : "film";
    };
    const auto response_of = [status](const DensityReading &reading) {
        return reading.response ? response_name(status, *reading.response) : "";
    };
    const auto measured = [&all](std::size_t i) -> const std::optional<Measured> & {
        return all[i / 2].measured;
    };
    Flat flat;
    flat.description = fmt::format("Predictions from {}: {}, on {}", predictions.file,
                                   name_of(predictions.illuminant), said(predictions.paper));
    flat.rows = 2 * all.size();
    flat.text("file", "", [&predictions](std::size_t) { return predictions.file; });
    flat.text("name", "SAMPLE_NAME", [&all, model](std::size_t i) {
        return fmt::format("{} {}", inks_of(all[i / 2], kLongestInkInName), model(i));
    });
    flat.text("model", "MODEL", model);
    for (std::size_t ink = 0; ink < kMostInks; ++ink) {
        const auto tint = [&all, ink](std::size_t i) {
            return ink < all[i / 2].inks.size() ? &all[i / 2].inks[ink] : nullptr;
        };
        flat.text(fmt::format("ink{}", ink + 1), fmt::format("INK_{}", ink + 1),
                  [tint](std::size_t i) { return tint(i) ? tint(i)->name : ""; });
        flat.exact(fmt::format("percent{}", ink + 1), fmt::format("PERCENT_{}", ink + 1),
                   [tint](std::size_t i) {
                       return tint(i) ? std::optional<double>(tint(i)->percent) : std::nullopt;
                   });
    }
    flat.colour("", [estimate](std::size_t i) { return &estimate(i).colour; });
    flat.number("dE00_measured", "DE00_MEASURED",
                [estimate](std::size_t i) { return estimate(i).to_measured; });
    flat.text("response", "RESPONSE",
              [=](std::size_t i) { return response_of(estimate(i).reading); });
    flat.number("density", "DENSITY",
                [estimate](std::size_t i) { return estimate(i).reading.density; });
    flat.text("measured", "MEASURED",
              [measured](std::size_t i) { return measured(i) ? measured(i)->patch : ""; });
    flat.colour("measured_",
                [measured](std::size_t i) { return measured(i) ? &measured(i)->colour : nullptr; });
    flat.text("measured_response", "MEASURED_RESPONSE",
              [=](std::size_t i) { return measured(i) ? response_of(measured(i)->reading) : ""; });
    flat.number("measured_density", "MEASURED_DENSITY", [measured](std::size_t i) {
        return measured(i) ? measured(i)->reading.density : std::nullopt;
    });
    flat.text("paper", "PAPER", [&predictions](std::size_t) { return said(predictions.paper); });
    flat.spectrum([estimate](std::size_t i) -> const Spectrum & { return estimate(i).refl; });
    return {flat};
}

} // namespace vantrel::sheets
