#include "inks.h"

#include <algorithm>

#include <fmt/format.h>

#include "text.h"

Inks::Inks(const Measurement &sheet, const std::vector<std::string> &order) : sheet(sheet)
{
    const auto &device = sheet.patches.front().device; // every patch has the same fields
    for (std::size_t i = 0; i < device.size(); ++i)
        if (!device[i].first.starts_with("RGB_")) {
            columns.push_back(i);
            fields.push_back(device[i].first);
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
    const auto in_file = std::pair(fields, columns);
    for (std::size_t i = 0; i < sequence.size(); ++i) {
        fields[i] = in_file.first[sequence[i]];
        columns[i] = in_file.second[sequence[i]];
    }
    for (const Patch &patch : sheet.patches)
        if (const auto tints = tints_of(patch))
            patches.emplace(*tints, &patch);
}

std::optional<Tints> Inks::tints_of(const Patch &patch) const
{
    if (columns.empty())
        return std::nullopt;
    Tints tints;
    for (std::size_t ink = 0; ink < columns.size(); ++ink) {
        const double percent = patch.device[columns[ink]].second;
        if (percent < 0 || percent > 100)
            return std::nullopt;
        if (percent > 0)
            tints.push_back({ink, percent});
    }
    return tints;
}

const Patch *Inks::measured(const Tints &tints) const
{
    const auto found = patches.find(tints);
    return found == patches.end() ? nullptr : found->second;
}

std::optional<std::size_t> Inks::ink_of_solid(const Patch &patch) const
{
    const auto tints = tints_of(patch);
    if (tints && tints->size() == 1 && tints->front().percent == 100)
        return tints->front().ink;
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
