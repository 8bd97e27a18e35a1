#include "read/labels.h"

#include "read/first_alike.h"
#include "read/text.h"

#include <fmt/format.h>

#include <cctype>
#include <charconv>
#include <cstddef>
#include <iterator>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>

namespace vantrel::sheets {
namespace {

// A whole id of up to nine digits.
std::optional<long> number_of(const std::string &id)
{
    long out = 0;
    const auto [end, error] = std::from_chars(id.data(), id.data() + id.size(), out);
    const bool whole = error == std::errc() && end == id.data() + id.size() && id.size() <= 9;
    return whole ? std::optional(out) : std::nullopt;
}

// Ids that count the patches, and leave out some of them. A choice of a chart leaves out most.
void doubt_ids(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    const Patch *before = nullptr, *after = nullptr; // at the first gap
    std::optional<long> begin, last;
    for (const Patch &patch : patches) {
        const std::optional<long> id = number_of(patch.id);
        if (!id || (last && *id <= *last))
            return;
        if (last && *id > *last + 1 && !after) {
            before = &patch - 1;
            after = &patch;
        }
        begin = begin ? begin : id;
        last = id;
    }
    if (!after)
        return;
    const std::size_t counted = static_cast<std::size_t>(*last - *begin) + 1;
    if (counted - patches.size() <= patches.size() / 2)
        out.push_back(
            {after->line,
             fmt::format("by their ids there are {} patches, {} are here: after {} "
                         "comes {}",
                         counted, patches.size(), in_quotes(before->id), in_quotes(after->id))});
}

// A place such as B12: its row, and where in it.
std::optional<std::pair<std::string_view, long>> place_of(const std::string &text)
{
    const auto digits = text.find_first_of("0123456789");
    if (digits == 0 || digits == std::string::npos || digits > 2 || text.size() - digits > 3)
        return std::nullopt;
    const auto number = number_of(text.substr(digits));
    return number ? std::optional(std::pair(std::string_view(text).substr(0, digits), *number))
                  : std::nullopt;
}

// Names that are places and leave out some of a row, as ids do.
void doubt_places(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    std::map<std::string_view, std::map<long, const Patch *>> rows;
    for (const Patch &patch : patches) {
        const auto place = place_of(patch.name);
        if (!place || !rows[place->first].emplace(place->second, &patch).second)
            return;
    }
    std::size_t missing = 0;
    const Patch *before = nullptr, *after = nullptr; // at the first gap
    for (const auto &[row, places] : rows) {
        const Patch *last = nullptr;
        long number = places.begin()->first - 1;
        for (const auto &[place, patch] : places) {
            missing += static_cast<std::size_t>(place - number - 1);
            if (place > number + 1 && !after) {
                before = last;
                after = patch;
            }
            number = place;
            last = patch;
        }
    }
    if (after && missing <= patches.size() / 10 + 1)
        out.push_back({after->line, fmt::format("by their places {} of {} patches are missing: "
                                                "after {} comes {}",
                                                missing, patches.size() + missing,
                                                in_quotes(before->name), in_quotes(after->name))});
}

// Zones that a sheet leaves out between others.
void doubt_zones(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    std::map<int, const Patch *> zones;
    for (const Patch &patch : patches)
        if (const int zone = zoned_name(patch.name).zone)
            zones.emplace(zone, &patch);
    for (auto zone = zones.begin(); zone != zones.end(); ++zone)
        if (const auto next = std::next(zone); next != zones.end() && next->first > zone->first + 1)
            out.push_back(
                {next->second->line, fmt::format("by their names zone {} is missing: after {} "
                                                 "comes {}",
                                                 zone->first + 1, in_quotes(zone->second->name),
                                                 in_quotes(next->second->name))});
}

std::vector<std::string_view> texts_of(const std::vector<Patch> &patches, std::string Patch::*text)
{
    std::vector<std::string_view> out;
    out.reserve(patches.size());
    for (const Patch &patch : patches)
        out.emplace_back(patch.*text);
    return out;
}

// An id that stands for several patches of other names, or a name for several device values: a slip
// where they are few, the way of the file where they are many.
void doubt_names(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    const std::vector<std::size_t> ids = first_alike(texts_of(patches, &Patch::id)),
                                   names = first_alike(texts_of(patches, &Patch::name));
    std::vector<Doubt> slips;
    for (std::size_t i = 0; i < patches.size(); ++i) {
        const Patch &patch = patches[i], &same_id = patches[ids[i]], &same_name = patches[names[i]];
        if (same_id.name != patch.name)
            slips.push_back(
                {patch.line, fmt::format("the id {} stands for {} and {}", in_quotes(patch.id),
                                         in_quotes(same_id.name), in_quotes(patch.name))});
        else if (same_name.device != patch.device)
            slips.push_back({patch.line, fmt::format("the name {} stands twice, for other device "
                                                     "values",
                                                     in_quotes(patch.name))});
    }
    if (!slips.empty() && 10 * slips.size() <= patches.size())
        out.push_back({slips[0].line, slips[0].text + and_more(slips.size())});
}

} // namespace

ZonedName zoned_name(std::string_view name)
{
    const auto z = name.find_last_of("Zz");
    if (z == std::string_view::npos || z == 0 ||
        std::isalnum(static_cast<unsigned char>(name[z - 1])))
        return {name};
    int zone = 0;
    const char *last = name.data() + name.size();
    const auto [end, error] = std::from_chars(name.data() + z + 1, last, zone);
    if (error != std::errc() || end != last || zone <= 0)
        return {name};
    return {name.substr(0, name.find_last_not_of(" _-.", z - 1) + 1), zone};
}

void doubt_labels(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    doubt_ids(patches, out);
    doubt_places(patches, out);
    doubt_zones(patches, out);
    doubt_names(patches, out);
}

} // namespace vantrel::sheets
