// A report as table, JSON and columns.

#include "judge/names.h"
#include "read/text.h"
#include "write/json_text.h"
#include "write/result.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>
#include <set>
#include <string_view>
#include <utility>

namespace vantrel::sheets {
namespace {

// Where the 31 bands in percent come from.
std::string spectra_of(const Source &source)
{
    std::string out = fmt::format("Spectra: {} values from {:g} to {:g} nm", source.bands,
                                  source.first_nm, source.last_nm);
    if (source.averaged)
        out += fmt::format(
            " in steps of {:.3g}, averaged to 10 nm by a triangle and corrected for its "
            "width (Stearns and Stearns 1988)",
            source.step_nm);
    else if (source.interpolated)
        out += " in steps of 20, interpolated to 10 nm (Lagrange, ASTM E2022)";
    else if (source.first_nm != 400 || source.last_nm != 700)
        out += ", those from 400 to 700 nm used";
    if (source.held)
        out += ", the last value held to 400 or 700 nm";
    if (!source.condition.empty())
        out += ", " + source.condition;
    return out + fmt::format("; {} (by {})", source.scaled ? "brought to percent" : "in percent",
                             source.scale_by);
}

void add_head(Lines &lines, const Report &report)
{
    lines.add(fmt::format("{}: {} {}", report.sheet->file, report.patches.size(),
                          report.patches.size() == 1 ? "patch" : "patches"));
    const PaperChoice &paper = report.paper.choice;
    lines.add(
        paper.exists()
            ? fmt::format("{}, {}, ΔE00 and density over {}, dot area with n = {:g}",
                          said(report.illuminant), status_name(report.status), said(paper),
                          report.n_factor)
            : fmt::format("{}, {}, densities {}: ΔE00 to it, dot area and gain, contrast,\nhue "
                          "error, grayness and trap are left out",
                          said(report.illuminant), status_name(report.status), over(paper)));
    lines.add(report.sheet->source.bands ? spectra_of(report.sheet->source)
                                         : "Colours alone, no spectra");
}

void add_patches(Lines &lines, const Report &report, std::size_t width, bool colour)
{
    lines.add("");
    lines.add(fmt::format("{:<{}} {}{:>8}{:>8}{:>8}{:>8}{:>8}{:>8}{:>4}{:>7}{:>7}{:>7}", "Patch",
                          width, colour ? "    " : "", "L*", "a*", "b*", "C*", "h", "ΔE00", "", "D",
                          "Area", "Gain"));
    for (const PatchReport &patch : report.patches) {
        const CIELABCOORD &lab = patch.colour.lab;
        std::string line = fmt::format("{:<{}} {}", cut(patch.patch->name, kWidestName), width,
                                       colour ? swatch(patch.colour.rgb) : "");
        for (const double value : {lab.L, lab.a, lab.b, patch.lch.C, patch.lch.h})
            line += fmt::format("{:>8}", fixed(value));
        line += fmt::format("{:>8}", fixed(patch.to_paper));
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
    if (!paper.lab)
        return;
    lines.add("");
    lines.add(
        fmt::format("Paper: brightness {}, whiteness {}, L*a*b* {}",
                    paper.brightness ? fixed(paper.brightness) : "none",
                    paper.whiteness ? fixed(paper.whiteness) : "none (" + paper.no_whiteness + ")",
                    fixed(*paper.lab)));
    if (const auto &metamerism = report.metamerism)
        lines.add(fmt::format(
            "Against {}{}: ΔE00 {}{}", metamerism->file.empty() ? "" : metamerism->file + ": ",
            said(metamerism->paper), fixed(metamerism->de00),
            metamerism->sum
                ? fmt::format(", metamerism {} (ΔE*ab under {} plus {}), DIN 6172 {}",
                              fixed(metamerism->sum), name_of(report.illuminant),
                              name_of(metamerism->illuminant), fixed(metamerism->din6172))
                : ""));
}

struct BlockColumn {
    const char *title;
    std::optional<double> PatchReport::*value;
    int decimals = 2;
};

// A short table of the patches that have a value in the first column.
void add_block(Lines &lines, const Report &report, const char *title, std::size_t width,
               const std::vector<BlockColumn> &columns)
{
    bool any = false;
    for (const PatchReport &patch : report.patches) {
        if (!(patch.*columns[0].value))
            continue;
        if (!std::exchange(any, true)) {
            std::string head = fmt::format("\n{:<{}}", title, width);
            for (const BlockColumn &column : columns)
                head += fmt::format("{:>12}", column.title);
            lines.add(head);
        }
        std::string line = fmt::format("{:<{}}", cut(patch.patch->name, kWidestName), width);
        for (const BlockColumn &column : columns)
            line += fmt::format("{:>12}", fixed(patch.*column.value, column.decimals));
        lines.add(line);
    }
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
            head += fmt::format("{:>9}{:>7}", curves[ink].spot ? "SCTV" : "area",
                                curves[ink].spot ? "area" : "gain");
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
            for (std::size_t i = 0; i < values.size(); ++i) {
                const ToneValue *value = values[i];
                const bool spot = curves[first + i].spot;
                line += value
                            ? fmt::format("{:>9}{:>7}", fixed(spot ? value->sctv : value->dot_area),
                                          fixed(spot ? value->dot_area : value->dot_gain))
                            : fmt::format("{:>16}", "");
            }
            lines.add(line);
        }
    }
}

void add_greys(Lines &lines, const Report &report)
{
    if (!report.greys.empty())
        lines.add(fmt::format("\n{:<11}{:>11}{:>16}  {}", "Grey scales", "nominal",
                              "visual density", "patch"));
    for (const NeutralStep &step : report.greys)
        lines.add(fmt::format("{:<11}{:>11g}{:>16}  {}", step.scale, step.nominal,
                              fixed(step.density, 3), cut(step.name, kWidestInText)));
}

void write_table(const Report &report, Lines &lines, bool colour)
{
    std::size_t width = 10;
    for (const PatchReport &patch : report.patches)
        width = std::max(width, characters(cut(patch.patch->name, kWidestName)));
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
    add_greys(lines, report);
    add_advice(lines, "Advice for the solids", report.advice);
    if (report.inks.size() > 1)
        lines.add(fmt::format("\nInks print in the order {}", fmt::join(report.inks, ", ")));
}

Json paper_json(const Report &report)
{
    const PaperReport &paper = report.paper;
    Json out = {
        {"name", name_json(paper.choice)},
        {"chosen", paper.choice.reason},
        {"lab", paper.lab ? lab_json(*paper.lab) : Json()},
        {"brightness", or_null(paper.brightness)},
        {"whiteness", or_null(paper.whiteness)},
    };
    if (!paper.whiteness)
        out["no_whiteness"] = paper.no_whiteness;
    if (const auto &metamerism = report.metamerism)
        out["metamerism"] = {
            {"file", metamerism->file.empty() ? report.sheet->file : metamerism->file},
            {"paper", metamerism->paper.name},
            {"chosen", metamerism->paper.reason},
            {"de00", metamerism->de00},
            {"illuminant", name_of(metamerism->illuminant)},
            {"sum", or_null(metamerism->sum)},
            {"din6172", or_null(metamerism->din6172)}};
    return out;
}

Json tone_values_json(const Report &report)
{
    Json out = Json::array();
    for (const ToneCurve &curve : report.tone_curves) {
        Json values = Json::array();
        for (const ToneValue &value : curve.values)
            values.push_back({{"nominal", value.nominal},
                              {"dot_area", value.dot_area},
                              {"dot_gain", value.dot_gain},
                              {"sctv", value.sctv},
                              {"patches", value.patches}});
        out.push_back({{"ink", curve.ink},
                       {"solid", curve.solid},
                       {"tone_value", curve.spot ? "sctv" : "dot_area"},
                       {"values", values}});
    }
    return out;
}

Json greys_json(const Report &report)
{
    Json out = Json::array();
    for (const NeutralStep &step : report.greys)
        out.push_back({{"scale", step.scale},
                       {"nominal", step.nominal},
                       {"name", step.name},
                       {"density", step.density}});
    return out;
}

void write_sheet(const Report &report, const Sink &sink)
{
    Json head = {
        {"file", report.sheet->file},
        {"warnings", report.warnings},
        {"illuminant", name_of(report.illuminant)},
        {"illuminant_by", report.illuminant.by},
        {"status", status_name(report.status)},
        {"n_factor", report.n_factor},
        {"inks", report.inks},
        {"source",
         {{"first_nm", report.sheet->source.first_nm},
          {"last_nm", report.sheet->source.last_nm},
          {"step_nm", report.sheet->source.step_nm},
          {"bands", report.sheet->source.bands},
          {"averaged", report.sheet->source.averaged},
          {"interpolated", report.sheet->source.interpolated},
          {"held", report.sheet->source.held},
          {"scaled_to_percent", report.sheet->source.scaled},
          {"scale_by", report.sheet->source.scale_by},
          {"condition", report.sheet->source.condition.empty()
                            ? Json()
                            : Json(report.sheet->source.condition)}}},
        {"paper", paper_json(report)},
        {"tone_values", tone_values_json(report)},
        {"greys", greys_json(report)},
    };
    if (!report.advice.empty())
        add_advice(head, report.advice);
    add_left_out(head, report.left_out);
    write_with_array(
        head, "patches", report.patches.size(),
        [&](std::size_t i) { return patch_text(report.patches[i], report.status).whole(); }, sink);
}

constexpr std::size_t kMostCells = 50'000'000; // of device values: bounds what empty ones take

// The names of the device values of all patches.
std::vector<std::string> device_names(const Report &report)
{
    std::set<std::string_view> seen;
    std::vector<std::string> names;
    for (const PatchReport &patch : report.patches)
        for (const auto &[name, value] : patch.patch->device)
            if (seen.insert(name).second)
                names.push_back(name);
    if (names.size() * report.patches.size() > kMostCells)
        throw RequestError{fmt::format("{}: {} inks are too many for a column each; --format json "
                                       "has them",
                                       report.sheet->file, names.size())};
    return names;
}

Flat flat_of(const Report &report)
{
    const std::vector<PatchReport> &patches = report.patches;
    Flat flat;
    flat.description = fmt::format("Report of {}: {}, {} {}, n = {:g}", report.sheet->file,
                                   name_of(report.illuminant), status_name(report.status),
                                   over(report.paper.choice), report.n_factor);
    flat.rows = patches.size();
    flat.same("file", "", report.sheet->file);
    flat.text("id", "SAMPLE_ID", [&patches](std::size_t i) { return patches[i].patch->id; });
    flat.text("name", "SAMPLE_NAME", [&patches](std::size_t i) { return patches[i].patch->name; });
    flat.device(device_names(report), [&patches](std::size_t i) -> const Flat::Device & {
        return patches[i].patch->device;
    });
    flat.colour("", [&patches](std::size_t i) { return &patches[i].colour; });
    flat.number("C", "LAB_C", [&patches](std::size_t i) { return patches[i].lch.C; });
    flat.number("h", "LAB_H", [&patches](std::size_t i) { return patches[i].lch.h; });
    flat.number("dE00_paper", "DE00_PAPER",
                [&patches](std::size_t i) { return patches[i].to_paper; });
    flat.text("response", "RESPONSE", [&report](std::size_t i) {
        const auto &response = report.patches[i].response;
        return response ? response_name(report.status, *response) : "";
    });
    flat.number("density", "DENSITY", [&patches](std::size_t i) { return patches[i].density; });
    flat.number("dot_area", "DOT_AREA", [&patches](std::size_t i) { return patches[i].dot_area; });
    flat.number("dot_gain", "DOT_GAIN", [&patches](std::size_t i) { return patches[i].dot_gain; });
    flat.number("sctv", "SCTV", [&patches](std::size_t i) { return patches[i].sctv; });
    flat.number("print_contrast", "PRINT_CONTRAST",
                [&patches](std::size_t i) { return patches[i].print_contrast; });
    flat.number("hue_error", "HUE_ERROR",
                [&patches](std::size_t i) { return patches[i].hue_error; });
    flat.number("grayness", "GRAYNESS", [&patches](std::size_t i) { return patches[i].grayness; });
    flat.number("trap", "TRAP", [&patches](std::size_t i) { return patches[i].trap; });
    std::map<std::size_t, double> greys; // by patch
    for (const NeutralStep &step : report.greys)
        greys[step.place] = step.density;
    if (!greys.empty())
        flat.number("neutral_density", "NEUTRAL_DENSITY",
                    [greys = std::move(greys)](std::size_t i) -> std::optional<double> {
                        const auto found = greys.find(i);
                        return found == greys.end() ? std::nullopt : std::optional(found->second);
                    });
    flat.same("paper", "PAPER", said(report.paper.choice));
    if (patches.front().refl)
        flat.spectrum([&patches](std::size_t i) -> const Spectrum & { return *patches[i].refl; });
    if (report.advice.empty()) {
        flat.warnings(report.warnings);
        return flat;
    }
    std::map<std::size_t, const SolidAdvice *> advice; // by patch, the first of its name
    for (const SolidAdvice &solid : report.advice)
        for (std::size_t i = 0; i < patches.size(); ++i)
            if (patches[i].patch->name == solid.patch && advice.try_emplace(i, &solid).second)
                break;
    flat.advice("advice", [advice = std::move(advice)](std::size_t i) {
        const auto found = advice.find(i);
        return found == advice.end() ? nullptr : found->second;
    });
    std::vector<std::string> warnings = report.warnings;
    warnings.push_back(advice_from());
    flat.warnings(std::move(warnings));
    return flat;
}

} // namespace

void write_table(const std::vector<Report> &sheets, const Sink &sink, const TableStyle &style)
{
    Lines lines(sink);
    for (const Report &report : sheets) {
        if (&report != sheets.data())
            lines.add("\n");
        write_table(report, lines, style.colour);
    }
}

void write_json(const std::vector<Report> &sheets, const Sink &sink)
{
    sink.write("{\n\"command\": \"report\",\n\"sheets\": [\n");
    for (const Report &report : sheets) {
        sink.write(&report == sheets.data() ? "" : ",\n");
        write_sheet(report, sink);
    }
    sink.write("\n]\n}\n");
}

std::vector<Flat> flat_of(const std::vector<Report> &sheets)
{
    std::vector<Flat> out;
    for (const Report &report : sheets)
        out.push_back(flat_of(report));
    return out;
}

} // namespace vantrel::sheets
