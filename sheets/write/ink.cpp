// A patch's study as table, JSON and rows.

#include "judge/ink.h"
#include "judge/names.h"
#include "read/text.h"
#include "write/json_text.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>

namespace vantrel::sheets {
namespace {

std::string device_values(const PatchReport &patch)
{
    std::string out;
    for (const auto &[ink, percent] : patch.device)
        out += fmt::format(", {} {:g}", ink, percent);
    return out;
}

void add_summary(Lines &lines, const PatchStudy &study, bool colour)
{
    const PatchReport &patch = study.patch;
    lines.add(fmt::format("{} ({}) of {}{}", cut(patch.name, kWidestName), patch.id, study.file,
                          device_values(patch)));
    lines.add(fmt::format("{}, {} over {}", name_of(study.illuminant), status_name(study.status),
                          cut(study.paper, kWidestInText)));
    lines.add(fmt::format("\n{}L*a*b* {}, C* {}, h {}, ΔE00 to the paper {}",
                          colour ? swatch(patch.colour.rgb) + ' ' : "", fixed(patch.colour.lab),
                          fixed(patch.lch.C), fixed(patch.lch.h), fixed(patch.to_paper)));
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
        lines.add(fmt::format("Against {}: ΔE00 {}", cut(study.against->patch.name, kWidestName),
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
            fmt::format("{:<10}{:>10}", 400 + 10 * band, fixed(study.patch.refl[band], 3));
        if (const auto &against = study.against)
            line += fmt::format("{:>10}{:>12}{:>12}", fixed(against->patch.refl[band], 3),
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
        for (const auto &[name, value] : patch->device)
            if (std::find(names.begin(), names.end(), name) == names.end())
                names.push_back(name);
    return names;
}

Flat spectra(const PatchStudy &study)
{
    Flat flat;
    flat.description =
        fmt::format("{} of {}: {}", study.patch.name, study.file, name_of(study.illuminant));
    flat.fields = {{"table", "", true}, {"id", "SAMPLE_ID", true}, {"name", "SAMPLE_NAME", true}};
    const std::vector<std::string> inks = device_names(study);
    add_device_fields(flat.fields, inks);
    add_colour_fields(flat.fields, "");
    flat.fields.push_back({"brightness", "BRIGHTNESS"});
    flat.fields.push_back({"whiteness", "WHITENESS"});
    add_spectrum_fields(flat.fields);
    flat.spectra = true;
    flat.rows = study.against ? 2 : 1;
    flat.row = [&study, inks](std::size_t i) {
        const PatchReport &patch = i == 0 ? study.patch : study.against->patch;
        Row row = {"spectra", patch.id, patch.name};
        add_device_cells(row, inks, patch.device);
        add_colour_cells(row, patch.colour);
        row.push_back(i == 0 ? cell(study.as_paper.brightness) : "");
        row.push_back(i == 0 ? cell(study.as_paper.whiteness) : "");
        add_spectrum_cells(row, patch.refl);
        return row;
    };
    return flat;
}

Flat bands(const PatchStudy &study)
{
    Flat flat;
    flat.description =
        fmt::format("Error weights of {} against {}", study.patch.name, study.against->patch.name);
    flat.fields = {{"table", "", true},
                   {"nm", "WAVELENGTH"},
                   {"a_weight", "A_WEIGHT"},
                   {"b_weight", "B_WEIGHT"}};
    flat.rows = VANTREL_BANDS;
    flat.row = [&study](std::size_t i) {
        return Row{"bands", fmt::to_string(400 + 10 * i), cell(study.against->a[i]),
                   cell(study.against->b[i])};
    };
    return flat;
}

Flat densities(const PatchStudy &study)
{
    Flat flat;
    flat.description = fmt::format("Densities of {} over {}", study.patch.name, study.paper);
    flat.fields = {{"table", "", true},
                   {"status", "STATUS", true},
                   {"response", "RESPONSE", true},
                   {"density", "DENSITY"}};
    for (int response = 0; response < NUM_RESPONSES; ++response) {
        const std::string code = response_code(E_STATUS, response);
        flat.fields.push_back({"D_" + code, "D_" + code});
    }
    flat.rows = NUM_STATUSES;
    flat.row = [&study](std::size_t i) {
        const StatusReading &reading = study.statuses[i];
        const int status = static_cast<int>(i);
        Row row = {"densities", std::string(status_name(status)),
                   reading.reading.response ? response_name(status, *reading.reading.response) : "",
                   cell(reading.reading.density)};
        for (const auto &density : reading.densities)
            row.push_back(cell(density));
        return row;
    };
    return flat;
}

Flat colours(const PatchStudy &study)
{
    Flat flat;
    flat.description = fmt::format("Colours of {}", study.patch.name);
    flat.fields = {{"table", "", true}, {"illuminant", "ILLUMINANT", true}};
    add_colour_fields(flat.fields, "");
    flat.fields.push_back({"C", "LAB_C"});
    flat.fields.push_back({"h", "LAB_H"});
    if (study.against) {
        add_colour_fields(flat.fields, "against_");
        flat.fields.push_back({"de2000", "LAB_DE_2000"});
        flat.fields.push_back({"metamerism", "METAMERISM"});
        flat.fields.push_back({"din6172", "DIN6172"});
    }
    flat.rows = NUM_ILLUM_OBS;
    flat.row = [&study](std::size_t i) {
        const IlluminantReading &reading = study.illuminants[i];
        Row row = {"colours", std::string(name_of(static_cast<ILLUM_OBS>(i)))};
        add_colour_cells(row, reading.colour);
        row.push_back(cell(reading.lch.C));
        row.push_back(cell(reading.lch.h));
        if (reading.other) {
            add_colour_cells(row, *reading.other);
            for (const auto &value : {reading.de00, reading.metamerism, reading.din6172})
                row.push_back(cell(value));
        }
        return row;
    };
    return flat;
}

} // namespace

void write_table(const PatchStudy &study, const Sink &sink, bool colour)
{
    Lines lines(sink);
    add_summary(lines, study, colour);
    add_densities(lines, study);
    add_illuminants(lines, study, colour);
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
        against = patch_json(study.against->patch, study.status);
        against["de00"] = study.against->de00;
        against["a_weights"] = study.against->a;
        against["b_weights"] = study.against->b;
    }
    Json out = {{"command", "ink"},
                {"file", study.file},
                {"illuminant", name_of(study.illuminant)},
                {"status", status_name(study.status)},
                {"paper", study.paper},
                {"patch", patch_json(study.patch, study.status)},
                {"brightness", study.as_paper.brightness},
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
