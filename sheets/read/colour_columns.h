// Which columns of a table hold colours.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

inline constexpr std::size_t kNone = static_cast<std::size_t>(-1); // no column

// L*, a* and b*, or X, Y and Z.
struct ColourColumns {
    std::array<std::size_t, 3> columns = {kNone, kNone, kNone};
    bool xyz = false;
    std::string illuminant; // behind the name of the first column: Lab_L_D50_2

    bool found() const { return std::count(columns.begin(), columns.end(), kNone) == 0; }
};

// By the keys (letters()) of all fields.
ColourColumns colours_in(const std::vector<std::string> &keys);

// One of them by its key, whatever the others are.
bool is_colour_part(std::string_view key);

} // namespace vantrel::sheets
