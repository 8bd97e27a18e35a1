#include "read/table.h"

#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <initializer_list>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kNone = static_cast<std::size_t>(-1);
constexpr std::size_t kLongestInkName = 80;

// SAMPLE_ID, SampleID and Sample Id are the same field.
std::string letters(std::string_view field)
{
    std::string out = upper(field);
    std::erase_if(out, [](char c) { return c == '_' || c == ' ' || c == '-'; });
    return out;
}

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

// CMYK_M, CMYKOG_O, CMY_C, RGB_R, 6CLR_1: what the printer was asked for, by the standard's names.
bool is_standard_device_field(std::string_view field)
{
    const std::string name = upper(field);
    const auto end = std::min(name.find('_'), name.size());
    const std::string_view space = std::string_view(name).substr(0, end);
    return end + 1 < name.size() &&
           (space == "RGB" || space == "CMY" ||
            (space.starts_with("CMYK") &&
             space.find_first_not_of("ABCDEFGHIJKLMNOPQRSTUVWXYZ") == std::string_view::npos) ||
            (space.size() > 3 && space.ends_with("CLR") &&
             space.find_first_not_of("0123456789") == space.size() - 3));
}

// The ink of a column such as cyan, magenta_pct, Yellow %, Orange (percent); empty where it is
// kNone.
// A lone C, Y or K may be chroma or a tristimulus value; initials say whether all four are there.
std::string ink_of(std::string key, bool initials)
{
    std::erase_if(key, [](char c) { return c == '(' || c == ')' || c == '[' || c == ']'; });
    bool percent = false;
    for (const std::string_view unit : {"PERCENT", "PCT", "%"})
        if (key.ends_with(unit)) {
            key.erase(key.size() - unit.size());
            percent = true;
            break;
        }
    constexpr std::array process = {"CYAN", "MAGENTA", "YELLOW", "BLACK"};
    constexpr std::string_view letters = "CMYK";
    for (std::size_t i = 0; i < process.size(); ++i)
        if (key == process[i] || (key.size() == 1 && key[0] == letters[i] && (percent || initials)))
            return fmt::format("CMYK_{}", letters[i]);
    if (percent)
        for (const std::string_view other : {"ORANGE", "GREEN", "VIOLET", "RED", "BLUE", "WHITE"})
            if (key == other)
                return key;
    return percent && (key.starts_with("SPOT") || key.starts_with("INK")) ? key : "";
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

Table::Table(Sheet &sheet, std::vector<std::string> names, std::size_t line)
    : fields(std::move(names)), sheet(sheet)
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

    std::vector<std::string> keys;
    for (std::size_t i = 0; i < fields.size(); ++i) {
        keys.push_back(letters(fields[i]));
        if (const auto wavelength = pairs ? std::nullopt : wavelength_of(fields[i])) {
            wavelengths.push_back(*wavelength);
            values.push_back(i);
        }
    }
    refl.resize(values.size());
    if (!pairs)
        sheet.bands_at(wavelengths, line);

    id = column_of(keys, {"SAMPLEID", "ID", "PATCHID", "SAMPLENO", "PATCHNO", "NUMBER", "NO"});
    name = column_of(keys, {"SAMPLENAME", "NAME", "PATCHNAME", "PATCH", "SAMPLE", "LABEL"});
    condition = column_of(keys, {"MEASUREMENTCONDITION", "CONDITION", "MEASUREMENTMODE", "MODE"});
    ink = column_of(keys, {"INK", "INKNAME", "COLORANT", "COLOURANT"});
    tint = column_of(keys, {"TINT", "TINTPCT", "TINT%", "TINTVALUE", "TONEVALUE", "NOMINAL"});
    bool initials = true;
    for (const char *initial : {"C", "M", "Y", "K"})
        initials = initials && column_of(keys, {initial}) != kNone;
    for (std::size_t i = 0; i < fields.size(); ++i) {
        const bool standard = is_standard_device_field(fields[i]);
        std::string device = standard ? upper(fields[i]) : ink_of(keys[i], initials);
        if (device.empty())
            continue;
        free_names = free_names || !standard;
        devices.push_back({i, cut(printable(device), kLongestInkName)});
    }
    free_names = free_names || tint != kNone;
    if (tint == kNone) {
        name = name == kNone ? ink : name;
        ink = kNone;
    }
}

double Table::value_at(const Row &row, std::size_t column, std::size_t line) const
{
    const auto value = number_in(row[column]);
    if (!value)
        throw InputError{line, fmt::format("{} is {}, not a number", printable(fields[column]),
                                           in_quotes(trimmed(row[column])))};
    return *value;
}

std::string Table::text_at(const Row &row, std::size_t column) const
{
    return column == kNone ? "" : printable(trimmed(row[column]));
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

// None where all of these columns are blank; among others a blank is 0.
std::vector<std::pair<std::string, double>> Table::device_values(const Row &row, std::size_t line)
{
    std::vector<std::pair<std::string, double>> out;
    const auto blank = [&](std::size_t column) { return trimmed(row[column]).empty(); };
    if (tint != kNone && !blank(tint)) {
        std::string of = cut(text_at(row, ink), kLongestInkName);
        out.emplace_back(of.empty() ? "TINT" : std::move(of), value_at(row, tint, line));
    } else if (std::any_of(devices.begin(), devices.end(),
                           [&](const Device &device) { return !blank(device.column); })) {
        for (const Device &device : devices)
            out.emplace_back(device.name,
                             blank(device.column) ? 0 : value_at(row, device.column, line));
    }
    return out;
}

void Table::add(const Row &row, Condition given, std::size_t line)
{
    const Bands &at = bands(row, line);
    for (const std::size_t value : at.used())
        refl[value] = value_at(row, values[value], line);

    if (sheet.patches.empty() && id == kNone && name == kNone && ink == kNone)
        for (std::size_t i = 0; i < fields.size() && name == kNone; ++i)
            if (!trimmed(row[i]).empty() && !number_in(row[i])) // the first column of words
                name = i;
    Patch patch;
    patch.id = text_at(row, id);
    patch.name = text_at(row, name);
    patch.refl = at.of(refl);
    sheet.named = sheet.named || ink != kNone || !patch.id.empty() || !patch.name.empty();
    if (patch.id.empty())
        patch.id = std::to_string(sheet.patches.size() + 1);
    if (patch.name.empty() && ink == kNone)
        patch.name = patch.id;
    patch.device = device_values(row, line);
    const Condition own = condition == kNone ? std::nullopt : condition_in(row[condition]);
    sheet.add(std::move(patch), own ? own : given, line);
}

void Table::finish()
{
    std::vector<Patch> &patches = sheet.patches;
    double largest = 0;
    for (const Patch &patch : patches)
        for (const auto &[field, value] : patch.device)
            largest = std::max(largest, value);
    if (free_names && largest <= 1)
        for (Patch &patch : patches)
            for (auto &[field, value] : patch.device)
                value = std::round(value * 1e8) / 1e6; // 0.07 is 7 %
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
        if (patch.name.empty())
            patch.name = patch.id;
    }
}

} // namespace vantrel::sheets
