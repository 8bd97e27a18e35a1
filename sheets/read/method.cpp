#include "read/method.h"

#include "read/text.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace vantrel::sheets {
namespace {

bool tells_condition(const std::string &key)
{
    constexpr std::array words = {
        "MODE",      "MMODE",    "MEASMODE",      "MEASUREMENTMODE", "TESTMODE",
        "MESSMODUS", "ISO13655", "MESSBEDINGUNG", "MESSBEDINGUNGEN", "COND",
        "MCOND",     "MEASCOND", "BEDINGUNG"};
    return std::find(words.begin(), words.end(), key) != words.end() || key.starts_with("POL") ||
           contains(key, "CONDITION") || contains(key, "FILTER") || contains(key, "FILTRE") ||
           contains(key, "ILLUMINATION");
}

} // namespace

MethodColumns::MethodColumns(const std::vector<std::string> &keys)
{
    for (std::size_t i = 0; i < keys.size(); ++i)
        if (contains(keys[i], "BACKING"))
            backings.push_back({i, keys[i]});
        else if (contains(keys[i], "GEOMETR"))
            geometries.push_back({i, keys[i]});
        else if (tells_condition(keys[i]))
            conditions.push_back({i, keys[i]});
}

std::vector<std::size_t> MethodColumns::all() const
{
    std::vector<std::size_t> out;
    for (const auto *columns : {&conditions, &backings, &geometries})
        for (const Column &column : *columns)
            out.push_back(column.place);
    return out;
}

bool MethodColumns::has(std::size_t column) const
{
    const std::vector<std::size_t> columns = all();
    return std::find(columns.begin(), columns.end(), column) != columns.end();
}

Condition MethodColumns::condition(const Row &row, Header &header) const
{
    Condition out;
    for (const Column &column : conditions) {
        const Condition told = header.condition_told(trimmed(row.values[column.place]), column.key);
        header.keep_of_row(std::min(out, told), std::max(out, told), false);
        out = std::max(out, told);
    }
    return out;
}

std::string MethodColumns::setup(const Row &row, const Header &header) const
{
    Header own;
    own.backing = header.backing;
    own.geometry = header.geometry;
    for (const Column &column : backings)
        own.take(column.key, row.values[column.place]);
    for (const Column &column : geometries)
        own.take(column.key, row.values[column.place]);
    return own.setup();
}

} // namespace vantrel::sheets
