#include "read/colour_columns.h"

#include "read/text.h"

#include <string_view>

namespace vantrel::sheets {
namespace {

constexpr std::array<std::array<std::string_view, 3>, 7> names = {{
    {"LABL", "LABA", "LABB"},
    {"CIELABL", "CIELABA", "CIELABB"},
    {"L*", "A*", "B*"},
    {"CIEL*", "CIEA*", "CIEB*"},
    {"L", "A", "B"},
    {"XYZX", "XYZY", "XYZZ"},
    {"X", "Y", "Z"},
}};

// "D50_2" behind the name of a column.
bool is_light(std::string_view text)
{
    return !text.empty() && std::string_view("ACDF").find(text[0]) != std::string_view::npos &&
           (text.ends_with('2') || text.ends_with("10"));
}

} // namespace

// The first lightness, or X, whose two others are there for the same light, or for none that is
// named.
ColourColumns colours_in(const std::vector<std::string> &keys)
{
    const auto column_of = [&](const std::string &key) {
        const auto found = std::find(keys.begin(), keys.end(), key);
        return found == keys.end() ? kNone : static_cast<std::size_t>(found - keys.begin());
    };
    for (const auto &family : names)
        for (const bool same : {true, false})
            for (std::size_t i = 0; i < keys.size(); ++i) {
                if (!keys[i].starts_with(family[0]))
                    continue;
                const std::string light = keys[i].substr(family[0].size());
                if (!light.empty() && (family[0].size() == 1 || !is_light(light)))
                    continue;
                const std::string other = same ? light : "";
                ColourColumns out{.columns = {i, column_of(std::string(family[1]) + other),
                                              column_of(std::string(family[2]) + other)},
                                  .xyz = contains(family[0], "X"),
                                  .illuminant = light};
                if (out.found())
                    return out;
            }
    return {};
}

bool is_colour_part(std::string_view key)
{
    return std::any_of(names.begin(), names.end(), [&](const auto &family) {
        return std::find(family.begin(), family.end(), key) != family.end();
    });
}

} // namespace vantrel::sheets
