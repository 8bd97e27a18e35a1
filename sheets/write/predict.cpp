// Predictions as table, JSON and columns.

#include "judge/names.h"
#include "read/text.h"
#include "write/json_text.h"
#include "write/result.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <memory>

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

// "Halftone"
std::string title_of(std::string_view model)
{
    return upper(model.substr(0, 1)) + std::string(model.substr(1));
}

// The mean and the largest difference of one model; empty where it predicted nothing.
std::string summary(const Predictions &predictions, std::size_t model)
{
    double sum = 0, largest = 0, count = 0;
    for (const Prediction &prediction : predictions.all) {
        if (!prediction.estimates[model])
            continue;
        const double delta_e = prediction.estimates[model]->to_measured.value_or(0);
        sum += delta_e;
        largest = std::max(largest, delta_e);
        ++count;
    }
    return count > 0 ? fmt::format("{}: mean ΔE00 {}, largest {}", title_of(kModels[model]),
                                   fixed(sum / count), fixed(largest))
                     : "";
}

// How the calibrated model was fitted, and how far it can be trusted.
std::string fit_of(const Predictions &predictions)
{
    if (!predictions.n_factor)
        return "Not calibrated: the sheet holds " + predictions.not_calibrated;
    std::string out =
        fmt::format("Calibrated: n = {:g}{}; ", *predictions.n_factor,
                    CalibratedModel::ends_range(*predictions.n_factor)
                        ? ", the end of the range that is tried: another might fit better"
                        : "");
    if (!predictions.error)
        return out + "no overprints of tints tell its error";
    const CalibratedModel::Error &error = *predictions.error;
    out += fmt::format("on {} overprint{} with tints that it was not shown, each in turn, mean "
                       "ΔE00 {}, 95 % {}, largest {}",
                       error.patches, error.patches == 1 ? "" : "s", fixed(error.de00.mean),
                       fixed(error.de00.p95), fixed(error.de00.max));
    if (error.solids)
        out += fmt::format("; not on {} of solids alone", error.solids);
    if (error.passed_over)
        out += fmt::format("{} {} beyond an even choice", error.solids ? ", nor on" : "; not on",
                           error.passed_over);
    return out;
}

// What the sheet lacks, each once.
std::vector<std::string> lacking_in(const Predictions &predictions)
{
    std::vector<std::string> out;
    for (const Prediction &prediction : predictions.all)
        for (const std::string &one : prediction.lacking)
            if (std::find(out.begin(), out.end(), one) == out.end())
                out.push_back(one);
    return out;
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

Json calibration_json(const Predictions &predictions)
{
    Json error;
    if (predictions.error)
        error = {{"patches", predictions.error->patches},
                 {"mean", predictions.error->de00.mean},
                 {"p95", predictions.error->de00.p95},
                 {"max", predictions.error->de00.max},
                 {"solids", predictions.error->solids},
                 {"passed_over", predictions.error->passed_over}};
    return {{"n", or_null(predictions.n_factor)},
            {"left_out_error", error},
            {"missing", predictions.n_factor ? Json() : Json(predictions.not_calibrated)},
            {"words", fit_of(predictions)}};
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
    Json out = {{"inks", inks}};
    for (std::size_t model = 0; model < kModels.size(); ++model)
        out[kModels[model]] = prediction.estimates[model]
                                  ? estimate_json(*prediction.estimates[model], status)
                                  : Json();
    out["lacking"] = prediction.lacking;
    out["measured"] = measured;
    return out;
}

// Of one combination: a line for each model and the measurement.
void add_models(Lines &lines, const Predictions &predictions, bool colour)
{
    const Prediction &only = predictions.all[0];
    lines.add(inks_of(only, kWidestInText));
    lines.add(fmt::format("\n{:<12} {}{:>7}{:>7}{:>7}{:>7}{:>11}", "", colour ? "    " : "", "L*",
                          "a*", "b*", "ΔE00", "Density"));
    const auto add = [&](std::string_view name, const Colour &shown_colour,
                         const std::optional<double> &delta_e, const DensityReading &reading) {
        lines.add(fmt::format("{:<12}{}{:>7}{:>11}", name, colour_columns(shown_colour, colour),
                              fixed(delta_e), shown(reading, predictions.status)));
    };
    for (std::size_t model = 0; model < kModels.size(); ++model)
        if (const auto &estimate = only.estimates[model])
            add(title_of(kModels[model]), estimate->colour, estimate->to_measured,
                estimate->reading);
    if (only.measured)
        add("Measured", only.measured->colour, {}, only.measured->reading);
    lines.add("");
}

// Of many combinations: the measurement, what the best model says, and the difference of each.
void add_combinations(Lines &lines, const Predictions &predictions, bool colour)
{
    std::size_t width = 11;
    for (const Prediction &prediction : predictions.all)
        width = std::max(width, characters(cut(prediction.measured->patch, kWidestName)));
    const std::string gap = colour ? "    " : "";
    const std::string lab = fmt::format(" {}{:>7}{:>7}{:>7}", gap, "L*", "a*", "b*");
    lines.add(fmt::format("\n{:<{}} {}{:>21} {}{:>21}{:>33}", "", width, gap, "Measured", gap,
                          "Calibrated", "ΔE00 to measured"));
    lines.add(fmt::format("{:<{}}{}{}{:>12}{:>10}{:>11}", "Combination", width, lab, lab,
                          "Halftone", "Film", "Calibrated"));
    for (const Prediction &prediction : predictions.all) {
        const auto &calibrated = prediction.estimates[2];
        std::string line = fmt::format("{:<{}}{}", cut(prediction.measured->patch, kWidestName),
                                       width, colour_columns(prediction.measured->colour, colour));
        line += calibrated ? colour_columns(calibrated->colour, colour)
                           : std::string(22 + gap.size(), ' ');
        constexpr std::array widths = {12, 10, 11};
        for (std::size_t model = 0; model < kModels.size(); ++model)
            line += fmt::format(
                "{:>{}}",
                prediction.estimates[model] ? fixed(prediction.estimates[model]->to_measured) : "",
                widths[model]);
        lines.add(line);
    }
    lines.add("");
    for (std::size_t model = 0; model < kModels.size(); ++model)
        if (const std::string line = summary(predictions, model); !line.empty())
            lines.add(line);
}

} // namespace

void write_table(const Predictions &predictions, const Sink &sink, const TableStyle &style)
{
    Lines lines(sink);
    lines.add(fmt::format("{}: {}, on {}", predictions.file, said(predictions.illuminant),
                          said(predictions.paper)));
    if (predictions.all.size() == 1)
        add_models(lines, predictions, style.colour);
    else // every one of them measured
        add_combinations(lines, predictions, style.colour);
    lines.add(fit_of(predictions));
    for (const std::string &one : lacking_in(predictions))
        lines.add("The sheet holds " + one);
    if (predictions.left_out)
        lines.add(fmt::format("Left out: {} overprints of more than four inks, of fractions of a "
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
        {"calibration", calibration_json(predictions)},
    };
    write_with_array(
        head, "predictions", predictions.all.size(),
        [&](std::size_t i) {
            return prediction_json(predictions.all[i], predictions.status).dump();
        },
        sink);
    sink.write("\n");
}

std::vector<Flat> flat_of(const Predictions &predictions)
{
    // Each prediction is a row for each model that has one.
    struct Place {
        std::size_t prediction, model;
    };
    const auto places = std::make_shared<std::vector<Place>>();
    for (std::size_t i = 0; i < predictions.all.size(); ++i)
        for (std::size_t model = 0; model < kModels.size(); ++model)
            if (predictions.all[i].estimates[model])
                places->push_back({i, model});
    const int status = predictions.status;
    const auto prediction = [&all = predictions.all, places](std::size_t i) -> const Prediction & {
        return all[(*places)[i].prediction];
    };
    const auto estimate = [prediction, places](std::size_t i) -> const Estimate & {
        return *prediction(i).estimates[(*places)[i].model];
    };
    const auto model = [places](std::size_t i) { return std::string(kModels[(*places)[i].model]); };
    const auto response_of = [status](const DensityReading &reading) {
        return reading.response ? response_name(status, *reading.response) : "";
    };
    const auto measured = [prediction](std::size_t i) -> const std::optional<Measured> & {
        return prediction(i).measured;
    };
    Flat flat;
    flat.description = fmt::format("Predictions from {}: {}, on {}", predictions.file,
                                   name_of(predictions.illuminant), said(predictions.paper));
    flat.rows = places->size();
    flat.text("file", "", [&predictions](std::size_t) { return predictions.file; });
    flat.text("name", "SAMPLE_NAME", [prediction, model](std::size_t i) {
        return fmt::format("{} {}", inks_of(prediction(i), kLongestInkInName), model(i));
    });
    flat.text("model", "MODEL", model);
    for (std::size_t ink = 0; ink < CalibratedModel::kMostInks; ++ink) {
        const auto tint = [prediction, ink](std::size_t i) {
            return ink < prediction(i).inks.size() ? &prediction(i).inks[ink] : nullptr;
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
    flat.text("calibration", "CALIBRATION", [&predictions, prediction](std::size_t i) {
        std::string out = fit_of(predictions);
        for (const std::string &one : prediction(i).lacking)
            out += "; the sheet holds " + one;
        return out;
    });
    flat.spectrum([estimate](std::size_t i) -> const Spectrum & { return estimate(i).refl; });
    flat.warnings(predictions.warnings);
    return {flat};
}

} // namespace vantrel::sheets
