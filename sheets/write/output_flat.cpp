// Reports and predictions as rows.

#include "judge/names.h"
#include "judge/predict.h"
#include "judge/report.h"
#include "read/measurement.h"
#include "write/flat.h"

#include <fmt/format.h>

#include <set>
#include <string_view>

namespace vantrel::sheets {
namespace {

struct Column {
    Field field;
    std::optional<double> PatchReport::*value;
};
const Column print_columns[] = {
    {{"density", "DENSITY"}, &PatchReport::density},
    {{"dot_area", "DOT_AREA"}, &PatchReport::dot_area},
    {{"dot_gain", "DOT_GAIN"}, &PatchReport::dot_gain},
    {{"print_contrast", "PRINT_CONTRAST"}, &PatchReport::print_contrast},
    {{"hue_error", "HUE_ERROR"}, &PatchReport::hue_error},
    {{"grayness", "GRAYNESS"}, &PatchReport::grayness},
    {{"trap", "TRAP"}, &PatchReport::trap},
};

void add_reading_cells(Row &row, const DensityReading &reading, int status)
{
    row.push_back(reading.response ? response_name(status, *reading.response) : "");
    row.push_back(cell(reading.density));
}

constexpr std::size_t kMostCells = 50'000'000; // of device values: bounds what empty ones take

// The names of the device values of all patches.
std::vector<std::string> device_names(const Report &report)
{
    std::set<std::string_view> seen;
    std::vector<std::string> names;
    for (const PatchReport &patch : report.patches)
        for (const auto &[name, value] : patch.device)
            if (seen.insert(name).second)
                names.push_back(name);
    if (names.size() * report.patches.size() > kMostCells)
        throw RequestError{fmt::format("{}: {} inks are too many for a column each; --format json "
                                       "has them",
                                       report.file, names.size())};
    return names;
}

Row row_of(const Report &report, const std::vector<std::string> &inks, const PatchReport &patch)
{
    Row row = {report.file, patch.id, patch.name};
    add_device_cells(row, inks, patch.device);
    add_colour_cells(row, patch.colour);
    for (const double value : {patch.lch.C, patch.lch.h, patch.to_paper})
        row.push_back(cell(value));
    row.push_back(patch.response ? response_name(report.status, *patch.response) : "");
    for (const Column &column : print_columns)
        row.push_back(cell(patch.*column.value));
    add_spectrum_cells(row, patch.refl);
    return row;
}

Flat flat_of(const Report &report)
{
    Flat flat;
    flat.description = fmt::format("Report of {}: {}, {} over {}, n = {:g}", report.file,
                                   name_of(report.illuminant), status_name(report.status),
                                   report.paper.name, report.n_factor);
    flat.fields = {{"file", "", true}, {"id", "SAMPLE_ID", true}, {"name", "SAMPLE_NAME", true}};
    const std::vector<std::string> inks = device_names(report);
    add_device_fields(flat.fields, inks);
    add_colour_fields(flat.fields, "");
    flat.fields.push_back({"C", "LAB_C"});
    flat.fields.push_back({"h", "LAB_H"});
    flat.fields.push_back({"dE00_paper", "DE00_PAPER"});
    flat.fields.push_back({"response", "RESPONSE", true});
    for (const Column &column : print_columns)
        flat.fields.push_back(column.field);
    add_spectrum_fields(flat.fields);
    flat.spectra = true;
    flat.rows = report.patches.size();
    flat.row = [&report, inks](std::size_t i) { return row_of(report, inks, report.patches[i]); };
    return flat;
}

} // namespace

std::vector<Flat> flat_of(const std::vector<Report> &sheets)
{
    std::vector<Flat> out;
    for (const Report &report : sheets)
        out.push_back(flat_of(report));
    return out;
}

std::vector<Flat> flat_of(const Predictions &predictions)
{
    Flat flat;
    flat.description = fmt::format("Predictions from {}: {}, on {}", predictions.file,
                                   name_of(predictions.illuminant), predictions.paper);
    flat.fields = {{"file", "", true}, {"name", "SAMPLE_NAME", true}, {"model", "MODEL", true}};
    for (int i = 1; i <= 3; ++i) {
        flat.fields.push_back({fmt::format("ink{}", i), fmt::format("INK_{}", i), true});
        flat.fields.push_back({fmt::format("percent{}", i), fmt::format("PERCENT_{}", i)});
    }
    add_colour_fields(flat.fields, "");
    flat.fields.push_back({"dE00_measured", "DE00_MEASURED"});
    flat.fields.push_back({"response", "RESPONSE", true});
    flat.fields.push_back({"density", "DENSITY"});
    flat.fields.push_back({"measured", "MEASURED", true});
    add_colour_fields(flat.fields, "measured_");
    flat.fields.push_back({"measured_response", "MEASURED_RESPONSE", true});
    flat.fields.push_back({"measured_density", "MEASURED_DENSITY"});
    add_spectrum_fields(flat.fields);
    flat.spectra = true;
    flat.rows = 2 * predictions.all.size();
    flat.row = [&predictions](std::size_t i) {
        const Prediction &prediction = predictions.all[i / 2];
        const Estimate &estimate = i % 2 == 0 ? prediction.halftone : prediction.film;
        const char *model = i % 2 == 0 ? "halftone" : "film";
        Row row = {predictions.file, fmt::format("{} {}", inks_of(prediction, 200), model), model};
        for (std::size_t ink = 0; ink < 3; ++ink) {
            const bool printed = ink < prediction.inks.size();
            row.push_back(printed ? prediction.inks[ink].name : "");
            row.push_back(printed ? fmt::to_string(prediction.inks[ink].percent) : "");
        }
        add_colour_cells(row, estimate.colour);
        row.push_back(cell(estimate.to_measured));
        add_reading_cells(row, estimate.reading, predictions.status);
        row.push_back(prediction.measured ? prediction.measured->patch : "");
        if (prediction.measured) {
            add_colour_cells(row, prediction.measured->colour);
            add_reading_cells(row, prediction.measured->reading, predictions.status);
        } else {
            row.resize(row.size() + 6);
        }
        add_spectrum_cells(row, estimate.refl);
        return row;
    };
    return {flat};
}

} // namespace vantrel::sheets
