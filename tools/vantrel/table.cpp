#include "table.h"

#include <algorithm>
#include <cmath>
#include <map>

#include <fmt/format.h>

#include "text.h"

namespace {

constexpr std::size_t none = static_cast<std::size_t>(-1);

// SAMPLE_ID, SampleID and Sample Id are the same field.
std::string letters(std::string_view field)
{
    std::string out = upper(field);
    std::erase_if(out, [](char c) { return c == '_' || c == ' '; });
    return out;
}

std::size_t column_of(const Table &table, std::string_view field)
{
    for (std::size_t i = 0; i < table.fields.size(); ++i)
        if (letters(table.fields[i]) == field)
            return i;
    return none;
}

// CMYK_M, CMY_C, RGB_R, 6CLR_1: what the printer was asked for.
bool is_device_value(std::string_view field)
{
    const std::string name = upper(field);
    return name.starts_with("CMYK_") || name.starts_with("CMY_") || name.starts_with("RGB_") ||
           (name.size() > 5 && name[0] >= '0' && name[0] <= '9' && name.substr(1, 4) == "CLR_");
}

bool is_pair_value(std::string_view field)
{
    return equal_ignoring_case(field, "SPECTRAL_DEC") || equal_ignoring_case(field, "SPECTRAL_PCT");
}

// The columns of a wavelength/value pair.
struct Pair {
    std::size_t wavelength;
    std::size_t value;
};

std::vector<Pair> pairs_in(const std::vector<std::string> &fields)
{
    std::vector<Pair> pairs;
    for (std::size_t i = 0; i + 1 < fields.size(); ++i)
        if (equal_ignoring_case(fields[i], "SPECTRAL_NM") && is_pair_value(fields[i + 1]))
            pairs.push_back({i, i + 1});
    return pairs;
}

double value_at(const Table &table, std::size_t row, std::size_t column)
{
    const std::string_view text = trimmed(table.cell(row, column));
    const auto value = number_in(text);
    if (!value)
        throw InputError{table.row_lines[row],
                         fmt::format("{} is {}, not a number", printable(table.fields[column]),
                                     in_quotes(text))};
    return *value;
}

// Which column holds each wavelength, in thousandths of a nanometre.
using Columns = std::map<long, std::size_t>;

void add(Columns &columns, double wavelength, std::size_t column, std::size_t line)
{
    if (!columns.emplace(std::lround(wavelength * 1000), column).second)
        throw InputError{line, fmt::format("{:g} nm occurs twice in a spectrum", wavelength)};
}

Source source_of(const Columns &columns)
{
    return {.first_nm = static_cast<double>(columns.begin()->first) / 1000,
            .last_nm = static_cast<double>(columns.rbegin()->first) / 1000,
            .bands = columns.size(),
            .scaled = false};
}

// The columns of the 31 bands: wider ranges are cut, of finer steps every tenth nanometre is taken.
std::array<std::size_t, VANTREL_BANDS> bands_in(const Columns &columns, std::size_t line)
{
    std::array<std::size_t, VANTREL_BANDS> bands{};
    for (std::size_t i = 0; i < bands.size(); ++i) {
        const auto found = columns.find(static_cast<long>(400 + 10 * i) * 1000);
        if (found == columns.end()) {
            const Source source = source_of(columns);
            throw InputError{
                line, fmt::format("no value at {} nm in spectra of {} values from {:g} "
                                  "to {:g} nm; every 10 nm from 400 to 700 is needed",
                                  400 + 10 * i, source.bands, source.first_nm, source.last_nm)};
        }
        bands[i] = found->second;
    }
    return bands;
}

Columns pair_columns(const Table &table, const std::vector<Pair> &pairs, std::size_t row)
{
    Columns columns;
    for (const Pair &pair : pairs) {
        const double wavelength = value_at(table, row, pair.wavelength);
        if (wavelength < 100 || wavelength > 5000)
            throw InputError{table.row_lines[row],
                             fmt::format("{:g} nm is no wavelength of light", wavelength)};
        add(columns, wavelength, pair.value, table.row_lines[row]);
    }
    return columns;
}

// What a value of the table is multiplied by to give percent.
double percent_factor(const Table &table, const std::vector<Pair> &pairs,
                      const std::vector<Patch> &patches)
{
    if (!pairs.empty())
        return equal_ignoring_case(table.fields[pairs[0].value], "SPECTRAL_DEC") ? 100 : 1;
    if (table.full_scale)
        return 100 / *table.full_scale;
    double largest = 0;
    for (const Patch &patch : patches)
        largest = std::max(largest, *std::max_element(patch.refl.begin(), patch.refl.end()));
    return largest <= 2 ? 100 : 1; // paper with optical brightener reads up to 1.4 on a scale 0..1
}

void read_names(const Table &table, std::vector<Patch> &patches)
{
    const std::size_t id = column_of(table, "SAMPLEID");
    const std::size_t name = column_of(table, "SAMPLENAME");
    for (std::size_t row = 0; row < patches.size(); ++row) {
        Patch &patch = patches[row];
        if (id != none)
            patch.id = printable(trimmed(table.cell(row, id)));
        if (patch.id.empty())
            patch.id = std::to_string(row + 1);
        if (name != none)
            patch.name = printable(trimmed(table.cell(row, name)));
        if (patch.name.empty())
            patch.name = patch.id;
    }
}

void read_device_values(const Table &table, std::vector<Patch> &patches)
{
    for (std::size_t column = 0; column < table.fields.size(); ++column)
        if (is_device_value(table.fields[column]))
            for (std::size_t row = 0; row < patches.size(); ++row)
                patches[row].device.emplace_back(upper(table.fields[column]),
                                                 value_at(table, row, column));
}

} // namespace

std::optional<double> wavelength_of(std::string_view field)
{
    std::string name = upper(field);
    for (const std::string_view prefix : {"SPECTRAL_NM", "SPECTRAL", "SPECTRUM", "SPEC", "NM", "R"})
        if (name.starts_with(prefix)) {
            name.erase(0, prefix.size());
            break;
        }
    if (name.starts_with('_') || name.starts_with(' '))
        name.erase(0, 1);
    if (name.ends_with("NM"))
        name.resize(name.size() - 2);
    if (name.find_first_not_of("0123456789.") != std::string::npos)
        return std::nullopt;
    const auto wavelength = number_in(name);
    return wavelength && *wavelength >= 100 && *wavelength <= 5000 ? wavelength : std::nullopt;
}

bool has_spectra(const std::vector<std::string> &fields)
{
    return !pairs_in(fields).empty() || std::any_of(fields.begin(), fields.end(), wavelength_of);
}

Measurement measurement_of(const Table &table)
{
    const std::vector<Pair> pairs = pairs_in(table.fields);
    Columns columns;
    std::array<std::size_t, VANTREL_BANDS> bands{};
    if (pairs.empty()) {
        for (std::size_t i = 0; i < table.fields.size(); ++i)
            if (const auto wavelength = wavelength_of(table.fields[i]))
                add(columns, *wavelength, i, table.fields_line);
        bands = bands_in(columns, table.fields_line);
    }

    Measurement sheet;
    sheet.patches.resize(table.row_lines.size());
    for (std::size_t row = 0; row < sheet.patches.size(); ++row) {
        if (!pairs.empty()) {
            columns = pair_columns(table, pairs, row);
            bands = bands_in(columns, table.row_lines[row]);
        }
        if (row == 0)
            sheet.source = source_of(columns);
        for (std::size_t i = 0; i < bands.size(); ++i)
            sheet.patches[row].refl[i] = value_at(table, row, bands[i]);
    }
    read_names(table, sheet.patches);
    read_device_values(table, sheet.patches);

    const double factor = percent_factor(table, pairs, sheet.patches);
    sheet.source.scaled = factor != 1;
    if (sheet.source.scaled)
        for (std::size_t row = 0; row < sheet.patches.size(); ++row)
            for (double &value : sheet.patches[row].refl) {
                value *= factor;
                if (!std::isfinite(value))
                    throw InputError{table.row_lines[row], "a value is too large in percent"};
            }
    return sheet;
}
