// A patch's study as table, JSON and columns.

#include "judge/names.h"
#include "read/text.h"
#include "write/json_text.h"
#include "write/result.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>

namespace vantrel::sheets {
namespace {

std::string device_values(const PatchReport &patch)
{
    std::string out;
    for (const auto &[ink, percent] : patch.patch->device)
        out += fmt::format(", {} {:g}", ink, percent);
    return out;
}

void add_summary(Lines &lines, const PatchStudy &study, bool colour)
{
    const PatchReport &patch = study.patch;
    lines.add(fmt::format("{} ({}) of {}{}", cut(patch.patch->name, kWidestName), patch.patch->id,
                          study.sheet->file, device_values(patch)));
    lines.add(fmt::format("{}, {} {}", said(study.illuminant), status_name(study.status),
                          over(study.paper)));
    lines.add(fmt::format("\n{}L*a*b* {}, C* {}, h {}{}",
                          colour ? swatch(patch.colour.rgb) + ' ' : "", fixed(patch.colour.lab),
                          fixed(patch.lch.C), fixed(patch.lch.h),
                          patch.to_paper ? ", ΔE00 to the paper " + fixed(patch.to_paper) : ""));
    std::string print =
        patch.response ? fmt::format("Density {} {}", response_name(study.status, *patch.response),
                                     fixed(patch.density, 3))
                       : "No density";
    for (const auto &[title, value] : {std::pair{"dot area", patch.dot_area},
                                       {"gain", patch.dot_gain},
                                       {"print contrast", patch.print_contrast},
                                       {"hue error", patch.hue_error},
                                       {"grayness", patch.grayness},
                                       {"trap", patch.trap}})
        if (value)
            print += fmt::format(", {} {}", title, fixed(value));
    lines.add(print);
    const PaperReport &paper = study.as_paper;
    lines.add(fmt::format("As a paper: brightness {}, whiteness {}", fixed(paper.brightness),
                          paper.whiteness ? fixed(paper.whiteness)
                                          : "none (" + paper.no_whiteness + ")"));
    if (study.against)
        lines.add(fmt::format("Against {}: ΔE00 {}",
                              cut(study.against->patch.patch->name, kWidestName),
                              fixed(study.against->de00)));
}

void add_densities(Lines &lines, const PatchStudy &study)
{
    std::string head = fmt::format("\n{:<18}{:>5}{:>7} ", "Status", "", "D");
    for (int response = 0; response < NUM_RESPONSES; ++response)
        head += fmt::format("{:>8}", response_code(E_STATUS, response));
    lines.add(head);
    for (int status = 0; status < NUM_STATUSES; ++status) {
        const StatusReading &row = study.statuses[status];
        std::string line =
            fmt::format("{:<18}{:>5}{:>7} ", status_name(status),
                        row.reading.response ? response_code(status, *row.reading.response) : "",
                        fixed(row.reading.density, 3));
        for (const auto &density : row.densities)
            line += fmt::format("{:>8}", fixed(density, 3));
        lines.add(line);
    }
}

void add_illuminants(Lines &lines, const PatchStudy &study, bool colour)
{
    const std::string gap = colour ? "     " : "";
    lines.add(fmt::format(
        "\n{:<10}{}{:>8}{:>8}{:>8}{:>8}{:>8}{}", "Illuminant", gap, "L*", "a*", "b*", "C*", "h",
        study.against ? fmt::format("  {}{:>8}{:>8}{:>8}{:>8}{:>8}{:>10}", gap, "L*", "a*", "b*",
                                    "ΔE00", "Metam.", "DIN 6172")
                      : ""));
    const auto columns = [&](const Colour &shown) {
        return fmt::format("{}{:>8}{:>8}{:>8}", colour ? ' ' + swatch(shown.rgb) : "",
                           fixed(shown.lab.L), fixed(shown.lab.a), fixed(shown.lab.b));
    };
    for (int i = 0; i < NUM_ILLUM_OBS; ++i) {
        const IlluminantReading &row = study.illuminants[i];
        std::string line = fmt::format("{:<10}{}{:>8}{:>8}", name_of(static_cast<ILLUM_OBS>(i)),
                                       columns(row.colour), fixed(row.lch.C), fixed(row.lch.h));
        if (row.other)
            line += fmt::format("  {}{:>8}{:>8}{:>10}", columns(*row.other), fixed(row.de00),
                                fixed(row.metamerism), fixed(row.din6172));
        lines.add(line);
    }
}

void add_bands(Lines &lines, const PatchStudy &study)
{
    lines.add(fmt::format(
        "\n{:<10}{:>10}{}", "nm", "percent",
        study.against ? fmt::format("{:>10}{:>12}{:>12}", "against", "a* weight", "b* weight")
                      : ""));
    for (int band = 0; band < VANTREL_BANDS; ++band) {
        std::string line =
            fmt::format("{:<10}{:>10}", 400 + 10 * band, fixed((*study.patch.refl)[band], 3));
        if (const auto &against = study.against)
            line += fmt::format("{:>10}{:>12}{:>12}", fixed((*against->patch.refl)[band], 3),
                                fixed(against->a[band]), fixed(against->b[band]));
        lines.add(line);
    }
}

Json illuminant_json(ILLUM_OBS illuminant, const IlluminantReading &row)
{
    Json out = {{"illuminant", name_of(illuminant)},
                {"rgb", hex(row.colour.rgb)},
                {"lab", lab_json(row.colour.lab)},
                {"lch", {row.lch.L, row.lch.C, row.lch.h}}};
    if (row.other) {
        out["against_rgb"] = hex(row.other->rgb);
        out["against_lab"] = lab_json(row.other->lab);
        out["de00"] = *row.de00;
        out["metamerism"] = *row.metamerism;
        out["din6172"] = *row.din6172;
    }
    return out;
}

Json status_json(int status, const StatusReading &row)
{
    Json densities = Json::object();
    for (int response = 0; response < NUM_RESPONSES; ++response)
        if (row.densities[response])
            densities[response_name(status, response)] = *row.densities[response];
    Json out = {{"status", status_name(status)}};
    add_reading(out, row.reading, status);
    out["densities"] = densities;
    return out;
}

// The names of the device values of one patch or the other.
std::vector<std::string> device_names(const PatchStudy &study)
{
    std::vector<std::string> names;
    const PatchReport &other = study.against ? study.against->patch : study.patch;
    for (const PatchReport *patch : {&study.patch, &other})
        for (const auto &[name, value] : patch->patch->device)
            if (std::find(names.begin(), names.end(), name) == names.end())
                names.push_back(name);
    return names;
}

Flat spectra(const PatchStudy &study)
{
    const auto patch = [&study](std::size_t i) -> const PatchReport & {
        return i == 0 ? study.patch : study.against->patch;
    };
    const auto of_first = [](std::optional<double> value) {
        return [value](std::size_t i) { return i == 0 ? value : std::nullopt; };
    };
    Flat flat;
    flat.description = fmt::format("{} of {}: {}", study.patch.patch->name, study.sheet->file,
                                   name_of(study.illuminant));
    flat.rows = study.against ? 2 : 1;
    flat.text("table", "", [](std::size_t) { return "spectra"; });
    flat.text("id", "SAMPLE_ID", [patch](std::size_t i) { return patch(i).patch->id; });
    flat.text("name", "SAMPLE_NAME", [patch](std::size_t i) { return patch(i).patch->name; });
    flat.device(device_names(study),
                [patch](std::size_t i) -> const Flat::Device & { return patch(i).patch->device; });
    flat.colour("", [patch](std::size_t i) { return &patch(i).colour; });
    flat.number("brightness", "BRIGHTNESS", of_first(study.as_paper.brightness));
    flat.number("whiteness", "WHITENESS", of_first(study.as_paper.whiteness));
    flat.spectrum([patch](std::size_t i) -> const Spectrum & { return *patch(i).refl; });
    flat.warnings(study.warnings);
    return flat;
}

Flat bands(const PatchStudy &study)
{
    Flat flat;
    flat.description = fmt::format("Error weights of {} against {}", study.patch.patch->name,
                                   study.against->patch.patch->name);
    flat.rows = VANTREL_BANDS;
    flat.text("table", "", [](std::size_t) { return "bands"; });
    flat.exact("nm", "WAVELENGTH", [](std::size_t i) { return static_cast<double>(400 + 10 * i); });
    flat.number("a_weight", "A_WEIGHT", [&study](std::size_t i) { return study.against->a[i]; });
    flat.number("b_weight", "B_WEIGHT", [&study](std::size_t i) { return study.against->b[i]; });
    return flat;
}

Flat densities(const PatchStudy &study)
{
    Flat flat;
    flat.description =
        fmt::format("Densities of {} {}", study.patch.patch->name, over(study.paper));
    flat.rows = NUM_STATUSES;
    flat.text("table", "", [](std::size_t) { return "densities"; });
    flat.text("status", "STATUS",
              [](std::size_t i) { return std::string(status_name(static_cast<int>(i))); });
    flat.text("response", "RESPONSE", [&study](std::size_t i) {
        const auto &response = study.statuses[i].reading.response;
        return response ? response_name(static_cast<int>(i), *response) : "";
    });
    flat.number("density", "DENSITY",
                [&study](std::size_t i) { return study.statuses[i].reading.density; });
    flat.text("paper", "PAPER", [&study](std::size_t) { return said(study.paper); });
    for (int response = 0; response < NUM_RESPONSES; ++response) {
        const std::string name = "D_" + response_code(E_STATUS, response);
        flat.number(name, name, [&study, response](std::size_t i) {
            return study.statuses[i].densities[response];
        });
    }
    return flat;
}

Flat colours(const PatchStudy &study)
{
    const std::array<IlluminantReading, NUM_ILLUM_OBS> &rows = study.illuminants;
    Flat flat;
    flat.description = fmt::format("Colours of {}", study.patch.patch->name);
    flat.rows = rows.size();
    flat.text("table", "", [](std::size_t) { return "colours"; });
    flat.text("illuminant", "ILLUMINANT",
              [](std::size_t i) { return std::string(name_of(static_cast<ILLUM_OBS>(i))); });
    flat.colour("", [&rows](std::size_t i) { return &rows[i].colour; });
    flat.number("C", "LAB_C", [&rows](std::size_t i) { return rows[i].lch.C; });
    flat.number("h", "LAB_H", [&rows](std::size_t i) { return rows[i].lch.h; });
    if (study.against) {
        const FormulaNames &de00 = names_of(Formula::de2000);
        flat.colour("against_", [&rows](std::size_t i) { return &*rows[i].other; });
        flat.number(std::string(de00.key), std::string(de00.cgats),
                    [&rows](std::size_t i) { return rows[i].de00; });
        flat.number("metamerism", "METAMERISM",
                    [&rows](std::size_t i) { return rows[i].metamerism; });
        flat.number("din6172", "DIN6172", [&rows](std::size_t i) { return rows[i].din6172; });
    }
    return flat;
}

} // namespace

void write_table(const PatchStudy &study, const Sink &sink, const TableStyle &style)
{
    Lines lines(sink);
    add_summary(lines, study, style.colour);
    add_densities(lines, study);
    add_illuminants(lines, study, style.colour);
    add_bands(lines, study);
}

void write_json(const PatchStudy &study, const Sink &sink)
{
    Json illuminants = Json::array(), statuses = Json::array(), against;
    for (int i = 0; i < NUM_ILLUM_OBS; ++i)
        illuminants.push_back(illuminant_json(static_cast<ILLUM_OBS>(i), study.illuminants[i]));
    for (int status = 0; status < NUM_STATUSES; ++status)
        statuses.push_back(status_json(status, study.statuses[status]));
    if (study.against) {
        against = Json::parse(patch_text(study.against->patch, study.status).whole());
        against["de00"] = study.against->de00;
        against["a_weights"] = study.against->a;
        against["b_weights"] = study.against->b;
    }
    Json out = {{"command", "ink"},
                {"file", study.sheet->file},
                {"illuminant", name_of(study.illuminant)},
                {"illuminant_by", study.illuminant.by},
                {"status", status_name(study.status)},
                {"warnings", study.warnings},
                {"paper", name_json(study.paper)},
                {"paper_chosen", study.paper.reason},
                {"patch", Json::parse(patch_text(study.patch, study.status).whole())},
                {"brightness", or_null(study.as_paper.brightness)},
                {"whiteness", or_null(study.as_paper.whiteness)}};
    if (!study.as_paper.whiteness)
        out["no_whiteness"] = study.as_paper.no_whiteness;
    out["statuses"] = statuses;
    out["illuminants"] = illuminants;
    out["against"] = against;
    sink.write(out.dump(2) + '\n');
}

std::vector<Flat> flat_of(const PatchStudy &study)
{
    std::vector<Flat> out = {spectra(study)};
    if (study.against)
        out.push_back(bands(study));
    out.push_back(densities(study));
    out.push_back(colours(study));
    return out;
}

} // namespace vantrel::sheets
