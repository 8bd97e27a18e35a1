#include "judge/names.h"
#include "judge/predict.h"
#include "judge/report.h"
#include "read/text.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <map>
#include <optional>
#include <utility>

namespace vantrel::sheets {
namespace {

// Where the 31 bands in percent come from.
std::string spectra_of(const Source &source)
{
    std::string out = fmt::format("Spectra: {} values from {:g} to {:g} nm", source.bands,
                                  source.first_nm, source.last_nm);
    if (source.averaged)
        out += fmt::format(" in steps of {:.3g}, averaged to 10 nm by a triangle", source.step_nm);
    else if (source.first_nm != 400 || source.last_nm != 700)
        out += ", those from 400 to 700 nm used";
    if (!source.condition.empty())
        out += ", " + source.condition;
    return out + fmt::format("; {} (by {})", source.scaled ? "brought to percent" : "in percent",
                             source.scale_by);
}

void add_head(Lines &lines, const Report &report)
{
    const std::string paper = cut(report.paper.name, kWidestInText);
    lines.add(fmt::format("{}: {} {}", report.file, report.patches.size(),
                          report.patches.size() == 1 ? "patch" : "patches"));
    lines.add(fmt::format("{}, {}, ΔE00 and density over {}, dot area with n = {:g}",
                          name_of(report.illuminant), status_name(report.status), paper,
                          report.n_factor));
    lines.add(spectra_of(report.source));
}

void add_patches(Lines &lines, const Report &report, std::size_t width, bool colour)
{
    lines.add("");
    lines.add(fmt::format("{:<{}} {}{:>8}{:>8}{:>8}{:>8}{:>8}{:>8}{:>4}{:>7}{:>7}{:>7}", "Patch",
                          width, colour ? "    " : "", "L*", "a*", "b*", "C*", "h", "ΔE00", "", "D",
                          "Area", "Gain"));
    for (const PatchReport &patch : report.patches) {
        const CIELABCOORD &lab = patch.colour.lab;
        std::string line = fmt::format("{:<{}} {}", cut(patch.name, kWidestName), width,
                                       colour ? swatch(patch.colour.rgb) : "");
        for (const double value : {lab.L, lab.a, lab.b, patch.lch.C, patch.lch.h, patch.to_paper})
            line += fmt::format("{:>8}", fixed(value));
        lines.add(line +
                  fmt::format("{:>4}{:>7}{:>7}{:>7}",
                              patch.response ? response_code(report.status, *patch.response) : "",
                              fixed(patch.density, 3), fixed(patch.dot_area),
                              fixed(patch.dot_gain)));
    }
}

void add_paper(Lines &lines, const Report &report)
{
    const PaperReport &paper = report.paper;
    lines.add("");
    lines.add(
        fmt::format("Paper: brightness {}, whiteness {}, L*a*b* {}", fixed(paper.brightness),
                    paper.whiteness ? fixed(paper.whiteness) : "none (" + paper.no_whiteness + ")",
                    fixed(paper.lab)));
    if (const auto &metamerism = report.metamerism)
        lines.add(fmt::format("Metamerism against {}: {} (ΔE*ab under {} plus {}), DIN 6172 {}",
                              cut(metamerism->paper, kWidestInText), fixed(metamerism->sum),
                              name_of(report.illuminant), name_of(metamerism->illuminant),
                              fixed(metamerism->din6172)));
}

struct Column {
    const char *title;
    std::optional<double> PatchReport::*value;
    int decimals = 2;
};

// A short table of the patches that have a value in the first column.
void add_block(Lines &lines, const Report &report, const char *title, std::size_t width,
               const std::vector<Column> &columns)
{
    bool any = false;
    for (const PatchReport &patch : report.patches) {
        if (!(patch.*columns[0].value))
            continue;
        if (!std::exchange(any, true)) {
            std::string head = fmt::format("\n{:<{}}", title, width);
            for (const Column &column : columns)
                head += fmt::format("{:>12}", column.title);
            lines.add(head);
        }
        std::string line = fmt::format("{:<{}}", cut(patch.name, kWidestName), width);
        for (const Column &column : columns)
            line += fmt::format("{:>12}", fixed(patch.*column.value, column.decimals));
        lines.add(line);
    }
}

std::string colour_columns(const Colour &shown, bool colour)
{
    return fmt::format(" {}{:>7}{:>7}{:>7}", colour ? swatch(shown.rgb) : "", fixed(shown.lab.L),
                       fixed(shown.lab.a), fixed(shown.lab.b));
}

// Dot area and gain of every ink by nominal value, six inks side by side.
void add_tone_values(Lines &lines, const Report &report)
{
    constexpr std::size_t side_by_side = 6;
    const std::vector<ToneCurve> &curves = report.tone_curves;
    for (std::size_t first = 0; first < curves.size(); first += side_by_side) {
        const std::size_t end = std::min(curves.size(), first + side_by_side);
        std::string inks = fmt::format("\n{:<11}", "Tone values");
        std::string head = fmt::format("{:>11}", "nominal");
        std::map<double, std::vector<const ToneValue *>> rows;
        for (std::size_t ink = first; ink < end; ++ink) {
            inks += fmt::format("{:>16}", cut(curves[ink].ink, 14));
            head += fmt::format("{:>9}{:>7}", "area", "gain");
            for (const ToneValue &value : curves[ink].values) {
                auto &row = rows[value.nominal];
                row.resize(end - first);
                row[ink - first] = &value;
            }
        }
        lines.add(inks);
        lines.add(head);
        for (const auto &[nominal, values] : rows) {
            std::string line = fmt::format("{:>11g}", nominal);
            for (const ToneValue *value : values)
                line += value ? fmt::format("{:>9}{:>7}", fixed(value->dot_area),
                                            fixed(value->dot_gain))
                              : fmt::format("{:>16}", "");
            lines.add(line);
        }
    }
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

void write_table(const Report &report, Lines &lines, bool colour)
{
    std::size_t width = 10;
    for (const PatchReport &patch : report.patches)
        width = std::max(width, characters(cut(patch.name, kWidestName)));
    add_head(lines, report);
    add_patches(lines, report, width, colour);
    add_paper(lines, report);
    add_block(lines, report, "Solids", width,
              {{"hue error", &PatchReport::hue_error},
               {"grayness", &PatchReport::grayness},
               {"density", &PatchReport::density, 3}});
    add_block(lines, report, "Overprints", width, {{"trap", &PatchReport::trap}});
    add_block(lines, report, "Shadows", width, {{"contrast", &PatchReport::print_contrast}});
    add_tone_values(lines, report);
    if (report.inks.size() > 1)
        lines.add(fmt::format("\nInks print in the order {}", fmt::join(report.inks, ", ")));
}

} // namespace

void write_table(const std::vector<Report> &sheets, const Sink &sink, bool colour)
{
    Lines lines(sink);
    for (const Report &report : sheets) {
        if (&report != sheets.data())
            lines.add("\n");
        write_table(report, lines, colour);
    }
}

void write_table(const Predictions &predictions, const Sink &sink, bool colour)
{
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
    lines.add(fmt::format("{}: {}, on {}", predictions.file, name_of(predictions.illuminant),
                          cut(predictions.paper, kWidestName)));
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

} // namespace vantrel::sheets
