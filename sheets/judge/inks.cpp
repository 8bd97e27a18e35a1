#include "judge/inks.h"

#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <numeric>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::array<std::pair<std::string_view, std::string_view>, 4> kProcessInks = {{
    {"CMYK_C", "Cyan"},
    {"CMYK_M", "Magenta"},
    {"CMYK_Y", "Yellow"},
    {"CMYK_K", "Black"},
}};

// "40", "40 %"
std::optional<double> percent_in(std::string_view name)
{
    if (name.ends_with('%'))
        name.remove_suffix(1);
    while (name.ends_with(' '))
        name.remove_suffix(1);
    const auto percent = number_in(name);
    return percent && *percent >= 0 && *percent <= 100 ? percent : std::nullopt;
}

} // namespace

std::string ink_title(const std::string &field)
{
    for (const auto &[name, title] : kProcessInks)
        if (name == field)
            return std::string(title);
    return field;
}

bool is_process_ink(const std::string &title)
{
    return std::any_of(kProcessInks.begin(), kProcessInks.end(),
                       [&](const auto &ink) { return ink.second == title; });
}

Inks::Inks(const Measurement &sheet, const std::vector<std::string> &order) : sheet(sheet)
{
    for (const Patch &patch : sheet.patches)
        for (const auto &[field, percent] : patch.device)
            if (is_ink(field) && !numbers.contains(field)) {
                numbers.emplace(field, fields.size());
                fields.push_back(field);
            }
    if (fields.empty() && names_are_tints()) {
        ramp = true;
        numbers.emplace("ink", 0);
        fields.emplace_back("ink");
    }

    std::vector<std::size_t> sequence;
    for (const std::string &name : order) {
        const auto ink = named(name);
        if (!ink)
            throw RequestError{fmt::format(
                "{} holds no ink {}; its inks are {}", sheet.file, in_quotes(name),
                fields.empty() ? "unknown" : fmt::format("{}", fmt::join(fields, ", ")))};
        if (std::find(sequence.begin(), sequence.end(), *ink) != sequence.end())
            throw RequestError{fmt::format("the ink {} is named twice", in_quotes(name))};
        sequence.push_back(*ink);
    }
    for (std::size_t ink = 0; ink < fields.size(); ++ink)
        if (std::find(sequence.begin(), sequence.end(), ink) == sequence.end())
            sequence.push_back(ink);
    const std::vector<std::string> in_file = fields;
    for (std::size_t i = 0; i < sequence.size(); ++i) {
        fields[i] = in_file[sequence[i]];
        numbers[fields[i]] = i;
    }
    std::vector<std::vector<std::size_t>> places(fields.size()); // of the solids of each ink
    for (std::size_t i = 0; i < sheet.patches.size(); ++i)
        if (const auto ink = ink_of_solid(sheet.patches[i]))
            places[*ink].push_back(i);
    const std::vector<int> zones = zones_of(sheet);
    for (const std::vector<std::size_t> &some : places)
        solids.push_back(some.empty() ? std::nullopt
                                      : std::optional(by_zone(sheet, some, zones, D50_2DEG)));
}

bool Inks::names_are_tints() const
{
    if (sheet.kind != Kind::reflectance || !sheet.named || sheet.patches.size() < 3)
        return false;
    std::map<double, double> light; // mean reflectance by percentage
    for (const Patch &patch : sheet.patches) {
        const auto percent = percent_in(patch.name);
        if (!percent)
            return false;
        light[*percent] = std::accumulate(patch.refl.begin(), patch.refl.end(), 0.0) /
                          static_cast<double>(patch.refl.size());
    }
    if (light.begin()->first != 0 || light.rbegin()->first != 100)
        return false;
    const double noise = 0.03 * (light.begin()->second - light.rbegin()->second);
    double before = light.begin()->second;
    for (const auto &[percent, mean] : light) {
        if (mean > before + noise)
            return false;
        before = mean;
    }
    return noise > 0;
}

std::optional<Tints> Inks::tints_of(const Patch &patch) const
{
    if (ramp) {
        const double percent = percent_in(patch.name).value_or(0);
        return percent > 0 ? Tints{{0, percent}} : Tints{};
    }
    if (fields.empty() || patch.device.empty())
        return std::nullopt;
    Tints tints;
    for (const auto &[field, percent] : patch.device) {
        const auto number = numbers.find(field);
        if (number == numbers.end()) // no ink
            continue;
        if (percent < 0 || percent > 100)
            return std::nullopt;
        if (percent > 0)
            tints.push_back({number->second, percent});
    }
    std::sort(tints.begin(), tints.end());
    const bool twice = std::adjacent_find(tints.begin(), tints.end(), [](auto &a, auto &b) {
                           return a.ink == b.ink;
                       }) != tints.end();
    return twice ? std::nullopt : std::optional(tints);
}

const Patch *Inks::measured(const Tints &tints) const
{
    const auto found = std::find_if(sheet.patches.begin(), sheet.patches.end(),
                                    [&](const Patch &patch) { return tints_of(patch) == tints; });
    return found == sheet.patches.end() ? nullptr : &*found;
}

std::optional<std::size_t> Inks::ink_of_solid(const Patch &patch) const
{
    const auto tints = tints_of(patch);
    return tints ? ink_of_solid(*tints) : std::nullopt;
}

std::optional<std::size_t> Inks::ink_of_solid(const Tints &tints)
{
    if (tints.size() == 1 && tints.front().percent == 100)
        return tints.front().ink;
    return std::nullopt;
}

std::optional<std::size_t> Inks::named(std::string_view name) const
{
    for (std::size_t ink = 0; ink < fields.size(); ++ink)
        if (equal_ignoring_case(fields[ink], name))
            return ink;
    const Patch *patch = find_patch(sheet, name);
    return patch ? ink_of_solid(*patch) : std::nullopt;
}

} // namespace vantrel::sheets
