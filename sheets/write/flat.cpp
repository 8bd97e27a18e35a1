#include "write/flat.h"

#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <iterator>
#include <map>

namespace vantrel::sheets {
namespace {

// What spreadsheets compute: =1+1, +A1, @SUM(A1), -A1. Numbers stay as they are.
bool is_formula(const std::string &text)
{
    return !text.empty() && std::string_view("=+-@").find(text[0]) != std::string_view::npos &&
           !number_in(text);
}

std::string csv_text(const std::string &text)
{
    std::string safe = is_formula(text) ? '\'' + text : text;
    if (safe.find_first_of(",\"\r\n") == std::string::npos)
        return safe;
    std::string out = "\"";
    for (const char c : safe)
        out += c == '"' ? "\"\"" : std::string(1, c);
    return out + '"';
}

// Quoted, with doubled quotes within.
std::string cgats_text(const std::string &text)
{
    std::string out = "\"";
    for (const char c : text)
        out += c == '"' ? "\"\"" : std::string(1, c);
    return out + '"';
}

// A column's name as one word.
std::string identifier(std::string name)
{
    std::replace_if(
        name.begin(), name.end(), [](char c) { return c == ' ' || c == '"' || c == '#'; }, '_');
    return name;
}

// The columns that ISO 28178 knows; others are declared.
bool is_standard(const std::string &field)
{
    constexpr std::string_view names[] = {"SAMPLE_ID",   "SAMPLE_NAME", "LAB_L",    "LAB_A",
                                          "LAB_B",       "LAB_C",       "LAB_H",    "LAB_DE",
                                          "LAB_DE_2000", "LAB_DE_CMC",  "LAB_DE_94"};
    return std::find(std::begin(names), std::end(names), field) != std::end(names) ||
           field.starts_with("SPECTRAL_NM") || field.starts_with("CMYK_") ||
           field.starts_with("RGB_") || (field.size() > 4 && field.substr(1, 4) == "CLR_");
}

// The fields of all tables, a new one behind the one that it follows in its own table.
std::vector<Field> all_fields(const std::vector<Flat> &tables)
{
    std::vector<Field> all;
    for (const Flat &table : tables) {
        std::size_t next = 0;
        for (const Field &field : table.fields) {
            auto place = std::find_if(all.begin(), all.end(),
                                      [&](const Field &other) { return other.name == field.name; });
            if (place == all.end())
                place = all.insert(all.begin() + static_cast<std::ptrdiff_t>(next), field);
            next = static_cast<std::size_t>(place - all.begin()) + 1;
        }
    }
    return all;
}

void write_rows(const Flat &table, const std::vector<Field> &fields, const Sink &sink)
{
    std::map<std::string_view, std::size_t> own;
    for (std::size_t i = 0; i < table.fields.size(); ++i)
        own.emplace(table.fields[i].name, i);
    const Work work{sink.tell, "Writing", table.rows};
    for (std::size_t i = 0; i < table.rows; ++i) {
        const Row row = table.row(i);
        std::string out;
        for (const Field &field : fields) {
            if (const auto found = own.find(field.name); found != own.end())
                out += field.text ? csv_text(row[found->second]) : row[found->second];
            out += ',';
        }
        out.back() = '\n';
        sink.write(out);
        work.done(i + 1);
    }
}

void write_table(const Flat &table, const Sink &sink)
{
    std::vector<std::size_t> columns;
    for (std::size_t i = 0; i < table.fields.size(); ++i)
        if (!table.fields[i].cgats.empty())
            columns.push_back(i);

    std::string out = fmt::format("DESCRIPTOR\t{}\n", cgats_text(table.description));
    if (table.spectra)
        out += "SPECTRAL_NORM\t\"100\"\n";
    for (const std::size_t column : columns)
        if (const std::string name = identifier(table.fields[column].cgats); !is_standard(name))
            out += fmt::format("KEYWORD\t\"{}\"\n", name);
    out += fmt::format("NUMBER_OF_FIELDS\t{}\nBEGIN_DATA_FORMAT\n", columns.size());
    for (const std::size_t column : columns)
        out += identifier(table.fields[column].cgats) + '\t';
    out.back() = '\n';
    out += fmt::format("END_DATA_FORMAT\nNUMBER_OF_SETS\t{}\nBEGIN_DATA\n", table.rows);
    sink.write(out);
    const Work work{sink.tell, "Writing", table.rows};
    for (std::size_t i = 0; i < table.rows; ++i) {
        out.clear();
        const Row row = table.row(i);
        for (const std::size_t column : columns) {
            const bool quoted = table.fields[column].text || row[column].empty();
            out += quoted ? cgats_text(row[column]) : row[column];
            out += '\t';
        }
        out.back() = '\n';
        sink.write(out);
        work.done(i + 1);
    }
    sink.write("END_DATA\n");
}

} // namespace

void write_csv(const std::vector<Flat> &tables, const Sink &sink)
{
    const std::vector<Field> fields = all_fields(tables);
    std::string out;
    for (const Field &field : fields)
        out += csv_text(field.name) + ',';
    out.back() = '\n';
    sink.write(out);
    for (const Flat &table : tables)
        write_rows(table, fields, sink);
}

void write_cgats(const std::vector<Flat> &tables, const Sink &sink)
{
    sink.write("CGATS.17\nORIGINATOR\t\"vantrel " VANTREL_VERSION "\"\n");
    for (const Flat &table : tables)
        write_table(table, sink);
}

std::string cell(const std::optional<double> &value)
{
    if (!value)
        return "";
    const std::string out = fmt::format("{:.4f}", *value);
    return out == "-0.0000" ? "0.0000" : out;
}

std::string exact_cell(double value) { return fmt::format("{}", value); }

void add_device_fields(std::vector<Field> &fields, const std::vector<std::string> &names)
{
    for (const std::string &name : names)
        fields.push_back({name, name});
}

void add_device_cells(Row &row, const std::vector<std::string> &names, const Device &device)
{
    for (const std::string &name : names) {
        const auto value = std::find_if(device.begin(), device.end(),
                                        [&](const auto &own) { return own.first == name; });
        row.push_back(value == device.end() ? "" : exact_cell(value->second));
    }
}

void add_colour_fields(std::vector<Field> &fields, const std::string &prefix)
{
    std::string upper_prefix = upper(prefix);
    fields.push_back({prefix + "rgb", "", true});
    for (const char *axis : {"L", "a", "b"})
        fields.push_back({prefix + axis, upper_prefix + "LAB_" + upper(axis)});
}

void add_colour_cells(Row &row, const Colour &colour)
{
    row.push_back(hex(colour.rgb));
    for (const double value : {colour.lab.L, colour.lab.a, colour.lab.b})
        row.push_back(cell(value));
}

void add_spectrum_fields(std::vector<Field> &fields)
{
    for (int band = 0; band < VANTREL_BANDS; ++band)
        fields.push_back(
            {fmt::format("nm{}", 400 + 10 * band), fmt::format("SPECTRAL_NM{}", 400 + 10 * band)});
}

void add_spectrum_cells(Row &row, const Spectrum &refl)
{
    for (const double value : refl)
        row.push_back(exact_cell(value));
}

} // namespace vantrel::sheets
