#include "judge/zones.h"

#include "judge/inks.h"
#include "read/labels.h"

#include <fmt/format.h>
#include <fmt/ranges.h>

namespace vantrel::sheets {

std::vector<int> zones_of(const Measurement &sheet)
{
    std::vector<int> out;
    for (const Patch &patch : sheet.patches)
        out.push_back(zoned_name(patch.name).zone);
    return out;
}

const Patch *Zones::in(int zone) const
{
    if (zone == 0 || each.empty())
        return &all.patch;
    const auto own = each.find(zone);
    return own == each.end() ? nullptr : &own->second;
}

Zones by_zone(const Measurement &sheet, const std::vector<std::size_t> &places,
              const std::vector<int> &zones, ILLUM_OBS illuminant)
{
    Zones out{mean_of(sheet, places, illuminant), {}};
    std::map<int, std::vector<std::size_t>> own;
    for (const std::size_t place : places)
        if (zones[place] > 0)
            own[zones[place]].push_back(place);
    for (const auto &[zone, some] : own)
        out.each.emplace(zone, mean_of(sheet, some, illuminant).patch);
    return out;
}

std::string name_of_mean(const std::string &first, std::size_t count)
{
    return count > 1 ? fmt::format("{} (mean of {})", zoned_name(first).name, count) : first;
}

void warn_of_solids(const std::string &file, const LackingSolids &lacking,
                    std::vector<std::string> &warnings)
{
    for (const auto &[ink, zones] : lacking)
        warnings.push_back(fmt::format("{}: no solid of {} in zone{} {}: what is read beside it is "
                                       "left out there",
                                       file, ink_title(ink), zones.size() == 1 ? "" : "s",
                                       fmt::join(zones, ", ")));
}

} // namespace vantrel::sheets
