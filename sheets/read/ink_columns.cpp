#include "read/ink_columns.h"

#include "read/column_names.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <initializer_list>

namespace vantrel::sheets {
namespace {

constexpr std::string_view kInitials = "CMYK";

std::string key_without_brackets(std::string key)
{
    std::erase_if(key, [](char c) { return c == '(' || c == ')' || c == '[' || c == ']'; });
    return key;
}

// Which of the four inks of the process a word names, in English, German or French.
std::size_t process_ink(std::string_view word)
{
    constexpr std::array<std::array<std::string_view, 4>, 4> names = {{
        {"CYAN", "", "", "CMYKC"},
        {"MAGENTA", "", "", "CMYKM"},
        {"YELLOW", "GELB", "JAUNE", "CMYKY"},
        {"BLACK", "SCHWARZ", "NOIR", "CMYKK"},
    }};
    for (std::size_t ink = 0; ink < names.size(); ++ink)
        if (!word.empty() &&
            std::find(names[ink].begin(), names[ink].end(), word) != names[ink].end())
            return ink;
    return names.size();
}

struct InkColumn {
    std::string word; // without its unit
    bool percent = false;
    std::size_t process = kInitials.size(); // C, M, Y or K, where it is one for certain
};

InkColumn ink_column(const std::string &key)
{
    InkColumn out{.word = key_without_brackets(key)};
    for (const std::string_view unit : {"PERCENT", "PCT", "%", "TINT"})
        if (out.word.ends_with(unit)) {
            out.word.erase(out.word.size() - unit.size());
            out.percent = true;
            break;
        }
    out.process = process_ink(out.word);
    if (out.percent && out.word.size() == 1)
        out.process = std::min(kInitials.find(out.word[0]), kInitials.size());
    return out;
}

bool has_all(const std::vector<std::string> &keys, std::initializer_list<std::string_view> names)
{
    return std::all_of(names.begin(), names.end(), [&](std::string_view name) {
        return std::find(keys.begin(), keys.end(), name) != keys.end();
    });
}

} // namespace

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

// A lone C or Y may be chroma or a tristimulus value: initials are inks beside other inks, C not
// beside a hue or lightness, Y not beside X or Z, unless all four are there;
// none where an ink has its standard name, or this one its name in full.
std::vector<std::string> inks_of(const std::vector<std::string> &keys)
{
    std::vector<InkColumn> columns;
    for (const std::string &key : keys)
        columns.push_back(ink_column(key));
    const bool standard = std::any_of(keys.begin(), keys.end(), [](const std::string &key) {
        return key.starts_with("CMYK") && key.size() > 4;
    });
    std::array<bool, 4> certain{}, initial{};
    for (std::size_t ink = 0; ink < kInitials.size(); ++ink) {
        const std::string letter(1, kInitials[ink]);
        certain[ink] = std::any_of(columns.begin(), columns.end(),
                                   [ink](const InkColumn &it) { return it.process == ink; });
        initial[ink] = !standard && !certain[ink] && has_all(keys, {letter});
    }
    const bool all = has_all(keys, {"C", "M", "Y", "K"});
    if (!all && (has_all(keys, {"L"}) || has_all(keys, {"H"})))
        initial[0] = false;
    if (!all && (has_all(keys, {"X"}) || has_all(keys, {"Z"})))
        initial[2] = false;
    std::size_t known = 0;
    for (std::size_t ink = 0; ink < kInitials.size(); ++ink)
        known += initial[ink] || certain[ink];

    std::vector<std::string> out;
    for (std::size_t i = 0; i < keys.size(); ++i) {
        std::size_t ink = columns[i].process;
        if (ink == kInitials.size() && keys[i].size() == 1 && known > 1) {
            ink = std::min(kInitials.find(keys[i][0]), kInitials.size());
            if (ink < kInitials.size() && !initial[ink])
                ink = kInitials.size();
        }
        if (keys[i] == "KEY" && known == 3 && !initial[3] && !certain[3])
            ink = 3;
        constexpr std::array others = {"ORANGE", "GREEN", "VIOLET", "RED", "BLUE", "WHITE"};
        const std::string &word = columns[i].word;
        const bool other =
            columns[i].percent && (std::find(others.begin(), others.end(), word) != others.end() ||
                                   word.starts_with("SPOT") || word.starts_with("INK"));
        out.push_back(ink < kInitials.size() ? fmt::format("CMYK_{}", kInitials[ink])
                      : other                ? word
                                             : "");
    }
    return out;
}

// A percentage, or SPOT_1, PC6_5, HEX_O; or none of what is measured, counted or a place.
DoubtfulColumn::DoubtfulColumn(std::string_view key)
    : named(key.ends_with('%') || key.ends_with("%)") || key.ends_with("%]") ||
            key.ends_with("PCT") || key.find("PERCENT") != std::string_view::npos ||
            key.starts_with("SPOT") || key.starts_with("HEX") ||
            (key.size() > 2 && key.starts_with("PC") && key[2] >= '0' && key[2] <= '9')),
      nameless(key.empty())
{
    constexpr std::array beginnings = {"LAB",  "CIE", "RGB",      "DE",     "GRAY",
                                       "MEAN", "COL", "SPECTRAL", "SAMPLE", "PATCH"};
    constexpr std::array whole = {"L", "L*", "A*", "B*", "A", "R", "G"};
    measured = (is_beside_readings(key) && key != "C" && key != "Y") ||
               std::any_of(beginnings.begin(), beginnings.end(),
                           [&](std::string_view word) { return key.starts_with(word); }) ||
               std::find(whole.begin(), whole.end(), key) != whole.end();
}

void DoubtfulColumn::take(std::string_view cell)
{
    if (named || measured || cell.empty() || cell == "-")
        return;
    if (cell.ends_with('%'))
        cell.remove_suffix(1);
    const auto value = number_in(cell);
    if (!value) {
        ++others;
        return;
    }
    whole = whole && *value == std::floor(*value);
    counts = counts && (numbers == 0 || *value == last + 1 || *value == last);
    steps = steps && (numbers == 0 || *value == last + 1);
    last = *value;
    least = numbers ? std::min(least, *value) : *value;
    most = numbers ? std::max(most, *value) : *value;
    ++numbers;
}

// Bare paper has 0 of an ink, a sheet of tints alone has a wide range of whole percentages. What
// ends between 1 and 4 is a density. Without a name, what counts the rows is no ink.
bool DoubtfulColumn::may_be_ink() const
{
    constexpr double kDensest = 4, kRange = 50;
    if (nameless && steps)
        return false;
    const bool percentages = most > kDensest && most <= 255 && (least == 0 || most == 100);
    const bool tints = !counts && whole && most <= 100 && most - least >= kRange;
    const bool fractions = most > 0 && most <= 1 && least == 0;
    return named || (numbers > 9 * others && least >= 0 && (percentages || tints || fractions));
}

} // namespace vantrel::sheets
