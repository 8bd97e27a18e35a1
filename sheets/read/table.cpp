#include "read/table.h"

#include "read/colour_columns.h"
#include "read/statistics.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <initializer_list>
#include <map>

namespace vantrel::sheets {
namespace {

// The column of the first of these fields that there is.
std::size_t column_of(const std::vector<std::string> &keys,
                      std::initializer_list<std::string_view> fields)
{
    for (const std::string_view field : fields) {
        const auto found = std::find(keys.begin(), keys.end(), field);
        if (found != keys.end())
            return static_cast<std::size_t>(found - keys.begin());
    }
    return kNone;
}

std::vector<std::string> keys_of(const std::vector<std::string> &fields)
{
    std::vector<std::string> keys;
    for (const std::string &field : fields)
        keys.push_back(letters(field));
    return keys;
}

// The columns of a report as this program writes it to CSV; device values stand between the name
// and the swatch.
bool is_own_report(const std::vector<std::string> &fields)
{
    return fields.size() > 4 && fields[0] == "file" && fields[1] == "id" && fields[2] == "name" &&
           std::find(fields.begin(), fields.end(), "dE00_paper") != fields.end();
}

// "ink:Reflex Blue" holds percentages of an ink of any name; empty for other fields.
std::string_view named_ink(std::string_view field)
{
    constexpr std::string_view mark = "ink:";
    const bool marked = equal_ignoring_case(field.substr(0, mark.size()), mark);
    return marked ? trimmed(field.substr(mark.size())) : std::string_view();
}

[[noreturn]] void throw_twice(std::string_view field, std::size_t first, std::size_t second,
                              std::size_t line)
{
    throw InputError{line, fmt::format("{} occurs twice, in columns {} and {}", in_quotes(field),
                                       first + 1, second + 1)};
}

bool is_pair_value(std::string_view field)
{
    return equal_ignoring_case(field, "SPECTRAL_DEC") || equal_ignoring_case(field, "SPECTRAL_PCT");
}

bool begins_pair(const std::vector<std::string> &fields, std::size_t column)
{
    return column + 1 < fields.size() && equal_ignoring_case(fields[column], "SPECTRAL_NM") &&
           is_pair_value(fields[column + 1]);
}

} // namespace

std::optional<double> wavelength_of(std::string_view field)
{
    if (field.find_first_of("0123456789") == std::string_view::npos || field.size() > 32)
        return std::nullopt;
    std::string name = upper(field);
    for (const std::string_view unit : {"%", "[%]", "(%)"})
        if (name.ends_with(unit)) {
            name.resize(name.find_last_not_of(' ', name.size() - unit.size() - 1) + 1);
            break;
        }
    for (const std::string_view prefix :
         {"SPECTRAL_NM", "SPECTRAL", "SPECTRUM", "SPEC", "NM", "REFLECTANCE", "REFL", "R"})
        if (name.starts_with(prefix)) {
            name.erase(0, prefix.size());
            break;
        }
    if (name.starts_with('_') || name.starts_with(' '))
        name.erase(0, 1);
    if (name.ends_with("NM"))
        name.resize(name.size() - 2);
    while (name.ends_with(' ') || name.ends_with('_'))
        name.pop_back();
    if (name.find_first_not_of("0123456789.,") != std::string::npos)
        return std::nullopt;
    const auto wavelength = number_in(name);
    return wavelength && *wavelength >= 100 && *wavelength <= 5000 ? wavelength : std::nullopt;
}

bool has_spectra(const std::vector<std::string> &fields)
{
    for (std::size_t i = 0; i < fields.size(); ++i)
        if (begins_pair(fields, i) || wavelength_of(fields[i]))
            return true;
    return false;
}

bool has_colours(const std::vector<std::string> &fields)
{
    return colours_in(keys_of(fields)).found();
}

Table::Table(Sheet &sheet, std::vector<std::string> names, std::size_t line)
    : fields(std::move(names)), sheet(sheet), method(keys_of(fields))
{
    const std::vector<std::string> keys = keys_of(fields);
    find_colours(keys);
    if (has_spectra(fields))
        find_spectra(line);
    else
        sheet.kind = Kind::colours;

    id = column_of(keys, {"SAMPLEID", "ID", "PATCHID", "SAMPLENO", "PATCHNO", "NUMBER", "NO"});
    name = column_of(keys, {"SAMPLENAME", "NAME", "PATCHNAME", "PATCH", "SAMPLE", "LABEL",
                            "SAMPLELOC", "SAMPLELOCATION", "LOCATION"});
    ink = column_of(keys, {"INK", "INKNAME", "COLORANT", "COLOURANT"});
    tint = column_of(keys, {"TINT", "TINTPCT", "TINT%", "TINTVALUE", "TONEVALUE", "NOMINAL"});
    find_devices(keys, line);
    heading = line;
    find_ends();
    free_names = free_names || tint != kNone;
    if (tint == kNone) {
        name = name == kNone ? ink : name;
        ink = kNone;
    }
    words = kNone;
    find_unread(keys);
    std::vector<std::size_t> single = method.all();
    single.insert(single.end(), {id, name, tint, lab[0], lab[1], lab[2]});
    for (const std::size_t column : single)
        if (column != kNone)
            if (const auto again = std::find(keys.begin() + static_cast<std::ptrdiff_t>(column) + 1,
                                             keys.end(), keys[column]);
                again != keys.end())
                throw_twice(fields[column], column, static_cast<std::size_t>(again - keys.begin()),
                            line);
}

void Table::find_colours(const std::vector<std::string> &keys)
{
    const ColourColumns colour = colours_in(keys);
    lab = colour.columns;
    sheet.xyz = colour.found() && colour.xyz;
    if (sheet.xyz)
        sheet.colour_space = "XYZ";
    if (!colour.illuminant.empty()) {
        const std::size_t degrees = colour.illuminant.ends_with('2') ? 1 : 2;
        const auto end = colour.illuminant.size() - degrees;
        sheet.header.take("ILLUMINANT", colour.illuminant.substr(0, end));
        sheet.header.take("OBSERVER", colour.illuminant.substr(end));
    }
}

void Table::find_spectra(std::size_t line)
{
    std::string_view unit;
    for (std::size_t i = 0; i < fields.size(); ++i)
        if (begins_pair(fields, i) && (unit.empty() || equal_ignoring_case(unit, fields[i + 1]))) {
            unit = fields[i + 1];
            at_nm.push_back(i);
            values.push_back(i + 1);
        }
    pairs = !values.empty();
    if (pairs)
        sheet.set_full_scale(equal_ignoring_case(unit, "SPECTRAL_DEC") ? 1 : 100, upper(unit),
                             line);

    bool percent = false;
    for (std::size_t i = 0; i < fields.size() && !pairs; ++i)
        if (const auto wavelength = wavelength_of(fields[i])) {
            wavelengths.push_back(*wavelength);
            values.push_back(i);
            percent = percent || fields[i].find('%') != std::string::npos;
        }
    if (percent)
        sheet.set_usual_scale(100, "%");
    refl.resize(values.size());
    if (!pairs)
        sheet.bands_at(wavelengths, line);
}

void Table::find_devices(const std::vector<std::string> &keys, std::size_t line)
{
    const std::vector<std::string> inks = inks_of(keys);
    const bool own = is_own_report(fields);
    const std::size_t swatch = column_of(keys, {"RGB"});
    std::map<std::string, std::size_t> seen;
    for (std::size_t i = 0; i < fields.size(); ++i) {
        const std::string_view ink_of_field = named_ink(fields[i]);
        // a name of any kind, in percent
        const bool free = !ink_of_field.empty() || (own && i > 2 && i < swatch);
        const bool standard = is_standard_device_field(fields[i]);
        std::string device = !ink_of_field.empty() ? std::string(ink_of_field)
                             : standard            ? upper(fields[i])
                             : free                ? fields[i]
                                                   : inks[i];
        if (device.empty())
            continue;
        free_names = free_names || !(standard || free);
        device = ink_name(device);
        if (const auto [before, added] = seen.try_emplace(device, i); !added)
            throw_twice(fields[i], before->second, i, line);
        devices.push_back({i, std::move(device)});
    }
}

// This program's own reports hold what it computes itself.
void Table::find_unread(const std::vector<std::string> &keys)
{
    const bool own_cgats = column_of(keys, {"DE00PAPER"}) != kNone;
    const auto known = [&](const std::string &key) {
        return own_cgats && (key == "PAPER" || key == "WARNINGS");
    };
    std::vector<std::size_t> columns;
    for (std::size_t i = 0; i < fields.size() && !is_own_report(fields); ++i)
        if ((!reads(i) && !known(keys[i])) || contains(keys[i], "ILLUMINATION"))
            columns.push_back(i);
    unread.find(fields, keys, columns, {.spectra = !values.empty(), .colours = lab[0] != kNone});
}

bool Table::reads(std::size_t column) const
{
    const std::array<std::size_t, 7> single = {id, name, ink, tint, lab[0], lab[1], lab[2]};
    const auto is_it = [column](std::size_t known) { return known == column; };
    return method.has(column) || std::any_of(single.begin(), single.end(), is_it) ||
           std::any_of(values.begin(), values.end(), is_it) ||
           std::any_of(at_nm.begin(), at_nm.end(), is_it) ||
           std::any_of(devices.begin(), devices.end(),
                       [&](const Device &device) { return is_it(device.column); });
}

// At the ends of the spectra.
void Table::find_ends()
{
    if (pairs || values.empty())
        return;
    const std::size_t first = values.front(), last = values.back();
    if (first > 0 && !reads(first - 1))
        neighbours.emplace_back(first - 1, first);
    if (last + 1 < fields.size() && !reads(last + 1))
        neighbours.emplace_back(last + 1, last);
    const std::vector<std::size_t> &used = sheet.bands_at(wavelengths, heading).used();
    for (std::size_t i = 0; i < values.size(); ++i)
        if (std::find(used.begin(), used.end(), i) == used.end())
            spare_bands.emplace_back(values[i]);
}

void Table::warn_of_shifts()
{
    for (const Neighbour &it : neighbours)
        if (it.continues_spectrum()) {
            unread.leave(it.column);
            sheet.warn(
                heading,
                fmt::format("the values under {} are near those under {}: is a name missing in the "
                            "heading, so that each value stands under another wavelength?",
                            in_quotes(fields[it.column]), in_quotes(fields[it.end])));
        }
    for (const SpareBand &it : spare_bands)
        if (it.few_empty())
            sheet.warn(it.first_line,
                       fmt::format("the row is empty under {}{}: are its cells shifted?",
                                   in_quotes(fields[it.column]), and_more(it.empty)));
    // A device that measures less than the heading has leaves more than the last column of an end.
    for (std::size_t i = 0; values.size() > 1 && i < 2; ++i) {
        const auto at = [&](std::size_t place) {
            return std::find_if(spare_bands.begin(), spare_bands.end(), [&](const SpareBand &it) {
                return it.column == values[i ? values.size() - 1 - place : place];
            });
        };
        const auto last = at(0), inner = at(1);
        if (last != spare_bands.end() && last->all_empty() &&
            !(inner != spare_bands.end() && inner->all_empty()))
            sheet.warn(last->first_line, fmt::format("{} is empty in every row: are all values a "
                                                     "wavelength off?",
                                                     in_quotes(fields[last->column])));
    }
}

double Table::value_at(const Row &row, std::size_t column, std::size_t line)
{
    std::string_view text = row.values[column];
    if (text.ends_with('%')) {
        text.remove_suffix(1);
        percent_signs = true;
    }
    const auto value = number_in(text);
    if (!value)
        throw InputError{line, fmt::format("{} is {}, not a number", printable(fields[column]),
                                           in_quotes(trimmed(text)))};
    return *value;
}

// A dash stands for nothing; the apostrophe before what a spreadsheet would compute is none of the
// text.
std::string Table::text_at(const Row &row, std::size_t column) const
{
    if (column == kNone)
        return "";
    std::string_view text = trimmed(row.values[column]);
    if (text.size() > 1 && text[0] == '\'' &&
        std::string_view("=+-@").find(text[1]) != std::string_view::npos)
        text.remove_prefix(1);
    return text == "-" ? "" : printable(text);
}

const Bands &Table::bands(const Row &row, std::size_t line)
{
    if (pairs) {
        wavelengths.clear();
        for (const std::size_t column : at_nm) {
            const double wavelength = value_at(row, column, line);
            if (wavelength < 100 || wavelength > 5000)
                throw InputError{line,
                                 fmt::format("{:g} nm is no wavelength of light", wavelength)};
            wavelengths.push_back(wavelength);
        }
    }
    return sheet.bands_at(wavelengths, line);
}

// A blank tells nothing, as a column that is missing.
std::vector<std::pair<std::string, double>> Table::device_values(const Row &row, std::size_t line)
{
    std::vector<std::pair<std::string, double>> out;
    const auto blank = [&](std::size_t column) { return trimmed(row.values[column]).empty(); };
    if (tint != kNone && !blank(tint)) {
        std::string of = ink_name(text_at(row, ink));
        out.emplace_back(of.empty() ? "TINT" : std::move(of), value_at(row, tint, line));
        return out;
    }
    out.reserve(devices.size());
    for (const Device &device : devices)
        if (!blank(device.column))
            out.emplace_back(device.name, value_at(row, device.column, line));
    return out;
}

// Beside a spectrum, what is no number is no colour.
std::optional<CIELABCOORD> Table::colour(const Row &row, std::size_t line) const
{
    std::array<double, 3> out{};
    for (std::size_t i = 0; i < 3; ++i) {
        const auto value = lab[i] == kNone ? std::nullopt : number_in(row.values[lab[i]]);
        if (!value && values.empty())
            throw InputError{line, fmt::format("{} is {}, not a number", printable(fields[lab[i]]),
                                               in_quotes(trimmed(row.values[lab[i]])))};
        if (!value || std::abs(*value) > kLargest)
            return std::nullopt;
        out[i] = *value;
    }
    return CIELABCOORD{out[0], out[1], out[2]};
}

std::string_view Table::statistic_in(const Row &row)
{
    const std::size_t most = std::min<std::size_t>(row.values.size(), 3);
    const auto end = row.values.begin() + static_cast<std::ptrdiff_t>(most);
    const auto cell = std::find_if(row.values.begin(), end, [](std::string_view it) {
        return statistic_named(it).has_value();
    });
    return cell == end ? std::string_view() : *cell;
}

// In each column that makes a patch.
bool Table::has_numbers(const Row &row) const
{
    const auto is_number = [&](std::size_t column) {
        std::string_view cell = row.values[column];
        cell.remove_suffix(cell.ends_with('%'));
        return number_in(cell).has_value();
    };
    return values.empty() ? std::all_of(lab.begin(), lab.end(), is_number)
                          : std::all_of(values.begin(), values.end(), is_number);
}

void Table::add(const Row &row, Condition given, std::size_t line)
{
    if (const auto statistic = statistic_in(row); !statistic.empty() && !has_numbers(row)) {
        sheet.leave_out(statistic, line);
        return;
    }
    Patch patch;
    if (!values.empty()) {
        const Bands &at = bands(row, line);
        percent_signs = false;
        for (const std::size_t value : at.used())
            refl[value] = value_at(row, values[value], line);
        if (percent_signs)
            sheet.set_usual_scale(100, "%");
        patch.refl = at.of(refl);
    }
    patch.lab = colour(row, line);

    if (sheet.patches.empty() && id == kNone && name == kNone && ink == kNone)
        for (std::size_t i = 0; i < fields.size() && name == kNone; ++i)
            if (!method.has(i) && !trimmed(row.values[i]).empty() && !number_in(row.values[i]))
                name = words = i; // the first column of words
    patch.id = text_at(row, id);
    patch.name = text_at(row, name);
    percent_signs = false;
    patch.device = device_values(row, line);
    free_names = free_names && !percent_signs;
    unread.take(row);
    for (Neighbour &it : neighbours)
        it.take(row);
    for (SpareBand &it : spare_bands)
        it.take(row, line);
    const Condition own = method.condition(row, sheet.header);
    sheet.header.keep_of_row(given, own, true);
    if (method.tell_setup() || setups_told != sheet.header.setups_told) {
        setup = sheet.setup_number(method.setup(row, sheet.header));
        setups_told = sheet.header.setups_told;
    }
    sheet.add(std::move(patch), own ? own : given, line, setup);
}

void Table::finish()
{
    warn_of_shifts();
    if (words != kNone && unread.repeats_conditions(words))
        for (Patch &patch : sheet.patches)
            patch.name.clear();
    else
        unread.leave(words);
    unread.finish(sheet, heading);
    if (free_names)
        sheet.bring_inks_to_percent();
    std::vector<Patch> &patches = sheet.patches;
    if (ink == kNone)
        return;
    // where it has no name, a tint is named by its ink and percentage; the bare paper is a tint of
    // any ink
    const auto printed = std::find_if(patches.begin(), patches.end(), [](const Patch &patch) {
        return !patch.device.empty() && patch.device[0].second > 0;
    });
    for (Patch &patch : patches) {
        if (!patch.device.empty()) {
            auto &[of, percent] = patch.device[0];
            if (patch.name.empty())
                patch.name = percent > 0 ? fmt::format("{} {:g}", of, percent) : of;
            if (percent == 0 && printed != patches.end())
                of = printed->device[0].first;
        }
    }
}

} // namespace vantrel::sheets
