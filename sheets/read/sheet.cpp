#include "read/sheet.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <set>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kMostWarnings = 20;
constexpr double kLargestPercent = 1e6; // beyond it colours overflow, and no instrument measures it

bool is_word(char c)
{
    return (c >= '0' && c <= '9') || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

std::string name_of(const Condition &condition)
{
    return condition ? fmt::format("M{}", *condition) : "no named condition";
}

std::string names_of(const std::set<Condition> &conditions)
{
    std::string out;
    for (const Condition &condition : conditions)
        out += fmt::format("{}{}", out.empty() ? "" : ", ", name_of(condition));
    return out;
}

double largest_in(const std::vector<Patch> &patches)
{
    double largest = 0;
    for (const Patch &patch : patches)
        largest = std::max(largest, *std::max_element(patch.refl.begin(), patch.refl.end()));
    return largest;
}

} // namespace

Condition condition_in(std::string_view text)
{
    for (std::size_t i = 0; i + 1 < text.size(); ++i)
        if ((text[i] == 'M' || text[i] == 'm') && text[i + 1] >= '0' && text[i + 1] <= '3' &&
            (i == 0 || !is_word(text[i - 1])) && (i + 2 == text.size() || !is_word(text[i + 2])))
            return text[i + 1] - '0';
    return std::nullopt;
}

const Bands &Sheet::bands_at(const std::vector<double> &wavelengths, std::size_t line)
{
    if (!bands || bands->wavelengths() != wavelengths)
        bands.emplace(wavelengths, line);
    return *bands;
}

void Sheet::add(Patch patch, Condition condition, std::size_t line)
{
    if (patches.empty())
        origin = bands->source();
    patch.line = line;
    patches.push_back(std::move(patch));
    conditions.push_back(condition);
}

void Sheet::set_full_scale(double value, std::string_view keyword, std::size_t line)
{
    if (full_scale && *full_scale != value && reading.scale == Scale::automatic)
        throw InputError{line, fmt::format("{} says that white is {:g}, {} said {:g}", keyword,
                                           value, scale_by, *full_scale)};
    full_scale = value;
    scale_by = keyword;
}

void Sheet::warn(std::size_t line, const std::string &text)
{
    if (warnings.size() < kMostWarnings)
        warnings.push_back(fmt::format("{} {}", line ? fmt::format("{}:", line) : "", text));
    else if (warnings.size() == kMostWarnings)
        warnings.emplace_back(" more warnings are left out");
}

// Of several conditions one is kept: the one asked for, or else M1, which the standards of printing
// ask for, or else that of the first patch.
void Sheet::choose_condition()
{
    const std::set<Condition> present(conditions.begin(), conditions.end());
    Condition chosen = condition_in(reading.condition);
    if (chosen && !present.contains(chosen))
        throw InputError{0, fmt::format("no spectra under {}; the file has {}", name_of(chosen),
                                        names_of(present))};
    if (!chosen) {
        chosen = present.contains(1) ? 1 : conditions.front();
        if (present.size() > 1)
            warn(0, fmt::format("spectra under {}: those under {} are read, --condition chooses",
                                names_of(present), name_of(chosen)));
    }
    std::size_t kept = 0;
    for (std::size_t i = 0; i < patches.size(); ++i)
        if (conditions[i] == chosen) {
            if (kept != i)
                patches[kept] = std::move(patches[i]);
            ++kept;
        }
    patches.resize(kept);
    if (chosen)
        origin.condition = name_of(chosen);
}

void Sheet::bring_to_percent()
{
    const double largest = largest_in(patches);
    if (reading.scale != Scale::automatic) {
        full_scale = reading.scale == Scale::fraction ? 1 : 100;
        scale_by = "--scale";
    } else if (full_scale) {
        const double percent = largest / *full_scale * 100;
        if (percent > 300 || percent <= 2)
            warn(0, fmt::format("by {} the largest reflectance is {:.3g} %; --scale sets the scale",
                                scale_by, percent));
    } else {
        full_scale = largest <= largest_fraction ? 1 : 100;
        scale_by = "values";
    }
    origin.scale_by = scale_by;
    origin.scaled = *full_scale != 100;
    const double factor = 100 / *full_scale;
    for (Patch &patch : patches)
        for (double &value : patch.refl) {
            if (origin.scaled)
                value *= factor;
            if (!(std::abs(value) <= kLargestPercent))
                throw InputError{patch.line, "a value is too large in percent"};
        }
}

// On another scale the device values are no tints: nothing is printed at 100 %.
void Sheet::check_inks()
{
    double largest = 0;
    for (const Patch &patch : patches)
        for (const auto &[field, percent] : patch.device)
            if (is_ink(field))
                largest = std::max(largest, percent);
    if (largest > 100 || (largest > 0 && largest <= 1))
        warn(0,
             fmt::format("the largest ink value is {:g}; they are taken for percentages", largest));
}

Measurement Sheet::measurement()
{
    if (patches.empty())
        throw InputError{0, "no spectra in this file"};
    choose_condition();
    bring_to_percent();
    check_inks();
    return {.file = {},
            .patches = std::move(patches),
            .named = named,
            .kind = Kind::reflectance,
            .collection = false,
            .source = std::move(origin),
            .colours = {},
            .origin = {},
            .warnings = std::move(warnings)};
}

} // namespace vantrel::sheets
