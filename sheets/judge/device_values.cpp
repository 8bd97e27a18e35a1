#include "judge/device_values.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <set>

namespace vantrel::sheets {
namespace {

constexpr double kRounded = 0.5; // by which a file of whole percents is off

using Fields = std::set<std::string>;

Fields fields_of(const Measurement &sheet, bool inks)
{
    Fields out;
    for (const Patch &patch : sheet.patches)
        for (const auto &[field, value] : patch.device)
            if (is_ink(field) == inks)
                out.insert(field);
    return out;
}

Fields common_of(const Fields &first, const Fields &second)
{
    Fields out;
    std::set_intersection(first.begin(), first.end(), second.begin(), second.end(),
                          std::inserter(out, out.end()));
    return out;
}

} // namespace

DeviceValues::DeviceValues(const Measurement &first, const Measurement &second)
{
    const Fields inks = fields_of(first, true), other = fields_of(second, true);
    if (!common_of(inks, other).empty())
        std::set_union(inks.begin(), inks.end(), other.begin(), other.end(),
                       std::back_inserter(fields));
    for (const std::string &field : common_of(fields_of(first, false), fields_of(second, false)))
        fields.push_back(field);
}

double DeviceValues::value_of(const Patch &patch, const std::string &field) const
{
    const auto found = std::find_if(patch.device.begin(), patch.device.end(),
                                    [&](const auto &value) { return value.first == field; });
    return found == patch.device.end() ? 0 : found->second;
}

std::string DeviceValues::key_of(const Patch &patch) const
{
    std::string out;
    if (!patch.device.empty())
        for (const std::string &field : fields)
            out += fmt::format("{} ", std::round(100 * value_of(patch, field)) + 0.0);
    return out;
}

bool DeviceValues::agree(const Patch &first, const Patch &second) const
{
    return first.device.empty() || second.device.empty() ||
           std::all_of(fields.begin(), fields.end(), [&](const std::string &field) {
               return std::abs(value_of(first, field) - value_of(second, field)) <= kRounded;
           });
}

std::string told(const Patch &patch)
{
    if (patch.device.empty())
        return "no device values";
    std::string out;
    for (const auto &[field, value] : patch.device)
        if (value != 0)
            out += fmt::format("{}{} {:g}", out.empty() ? "" : ", ", field, value);
    return out.empty() ? "no ink" : out;
}

} // namespace vantrel::sheets
