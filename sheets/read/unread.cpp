#include "read/unread.h"

#include "read/colour_columns.h"
#include "read/column_names.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <map>
#include <string_view>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kFewestOfSet = 8; // wavelengths
constexpr std::size_t kMostWords = 3;   // that are told of a column
constexpr std::size_t kMostColumns = 6; // that are named

template <typename Words> bool is_one_of(std::string_view text, const Words &words)
{
    return std::find(words.begin(), words.end(), text) != words.end();
}

// "M2_NM" and "" around the wavelength in "M2_NM380"; nothing where there is none.
std::optional<std::pair<std::string, std::string>> around_wavelength(std::string_view field)
{
    constexpr std::string_view digits = "0123456789";
    for (std::size_t begin = field.find_first_of(digits); begin != std::string_view::npos;
         begin = field.find_first_of(digits, begin)) {
        const std::size_t end =
            std::min(field.find_first_not_of("0123456789.,", begin), field.size());
        const auto nm = number_in(field.substr(begin, end - begin));
        if (end - begin >= 3 && nm && *nm >= 200 && *nm <= 1100)
            return std::pair{upper(field.substr(0, begin)), upper(field.substr(end))};
        begin = end;
    }
    return std::nullopt;
}

// "LAB_L_D65_10" beside colours under another light.
bool is_of_further_light(std::string_view key)
{
    constexpr std::array colours = {"LAB", "CIELAB", "L*", "A*", "B*"};
    constexpr std::array lights = {"D50", "D55", "D65", "D75", "F2", "F7",
                                   "F11", "F12", "A2",  "A10", "C2", "C10"};
    return std::any_of(colours.begin(), colours.end(),
                       [&](std::string_view colour) { return key.starts_with(colour); }) &&
           std::any_of(lights.begin(), lights.end(),
                       [&](std::string_view light) { return contains(key, light); });
}

} // namespace

UnreadColumns::Column::Column(std::size_t place, const std::string &field, const std::string &key,
                              bool aside)
    : place(place), ink(key),
      head(field.empty() ? fmt::format("column {} (without a name)", place + 1) : in_quotes(field)),
      key(key), aside(aside)
{
}

void UnreadColumns::find(const std::vector<std::string> &fields,
                         const std::vector<std::string> &keys,
                         const std::vector<std::size_t> &unread, Read read)
{
    std::map<std::pair<std::string, std::string>, std::vector<std::size_t>> found;
    for (const std::size_t column : unread)
        if (const auto around = around_wavelength(fields[column]))
            found[*around].push_back(column);
    std::vector<bool> of_set(fields.size());
    for (const auto &[around, set] : found)
        if (set.size() >= kFewestOfSet) {
            for (const std::size_t column : set)
                of_set[column] = true;
            if (!is_beside_readings(letters(around.first)))
                sets.push_back(fmt::format("{} columns from {} to {}", set.size(),
                                           in_quotes(fields[set.front()]),
                                           in_quotes(fields[set.back()])));
        }
    for (const std::size_t column : unread)
        if (!of_set[column])
            columns.emplace_back(column, fields[column], keys[column],
                                 is_beside_readings(keys[column]) ||
                                     (read.spectra && is_of_further_light(keys[column])) ||
                                     (!read.colours && is_colour_part(keys[column])));
}

void UnreadColumns::Column::take(std::string_view cell)
{
    ink.take(cell);
    const Condition told = cell.size() == 2 ? condition_in(cell) : std::nullopt;
    conditional = conditional && (told || cell.empty() || cell == "-");
    ++rows;
    if (told) {
        conditions.resize(rows);
        conditions.back() = told;
    }
    if (cell.empty() || cell == "-")
        return;
    ++filled;
    if (words.size() > kMostWords)
        return;
    const auto word =
        std::find_if(words.begin(), words.end(), [&](const auto &it) { return it.first == cell; });
    if (word == words.end())
        words.emplace_back(cell, 1);
    else
        ++word->second;
}

void UnreadColumns::take(const Row &row)
{
    for (Column &column : columns)
        column.take(trimmed(row.values[column.place]));
}

void UnreadColumns::leave(std::size_t column)
{
    std::erase_if(columns, [&](const Column &it) { return it.place == column; });
}

bool UnreadColumns::repeats_conditions(std::size_t column) const
{
    return std::any_of(columns.begin(), columns.end(), [&](const Column &it) {
        return it.place == column && it.conditional && it.filled > it.words.size();
    });
}

// Where all rows say the same.
bool UnreadColumns::Column::told_by_keyword(Sheet &sheet) const
{
    if (words.size() != 1)
        return false;
    constexpr std::array lights = {"ILLUMINANT", "ILLUM", "LICHTART", "LIGHTSOURCE"};
    constexpr std::array observers = {"OBSERVER", "OBSERVERANGLE", "BEOBACHTER"};
    constexpr std::array units = {"UNIT", "UNITS", "EINHEIT", "SCALE"};
    constexpr std::array percents = {"%", "PERCENT", "PCT"};
    const std::string &word = words[0].first;
    if (is_one_of(key, lights) || contains(key, "ILLUMINATION"))
        sheet.header.take("ILLUMINANT", word);
    else if (is_one_of(key, observers))
        sheet.header.take("OBSERVER", word);
    else if (is_one_of(key, units) && is_one_of(upper(word), percents))
        sheet.set_usual_scale(100, head);
    else
        return false;
    return true;
}

bool UnreadColumns::Column::recurs() const
{
    return words.size() <= kMostWords && filled > words.size();
}

std::string UnreadColumns::Column::described() const
{
    if (!recurs())
        return head;
    std::string told;
    for (const auto &[word, times] : words)
        told += fmt::format("{}{} {}", told.empty() ? "" : ", ", in_quotes(word),
                            times == 1 ? "once" : fmt::format("{} times", times));
    return fmt::format("{} ({})", head, told);
}

void UnreadColumns::finish(Sheet &sheet, std::size_t line) const
{
    std::vector<std::string> inks, described, others;
    for (const Column &column : columns) {
        if (column.told_by_keyword(sheet))
            continue;
        if (column.conditional && column.filled > 0)
            sheet.tell_conditions(column.conditions);
        else if (contains(column.key, "ILLUMINATION") && !column.conditions.empty())
            continue; // conditions beside lights
        else if (column.ink.may_be_ink())
            inks.push_back(column.head);
        else if (column.filled > 0 && !column.aside && !column.ink.counts_rows())
            (column.recurs() ? described : others).push_back(column.described());
    }
    if (!inks.empty())
        sheet.warn(line, fmt::format("{} left out, no name of an ink; \"Spot 1 %\" is one, and "
                                     "columns Ink and Tint take any",
                                     listed(inks)));
    if (!sets.empty())
        sheet.warn(line, fmt::format("further spectra are not read: {}", listed(sets)));
    others.insert(others.begin(), described.begin(), described.end());
    if (!others.empty())
        sheet.warn(line, "not read: " + listed(others, ", ", kMostColumns));
}

} // namespace vantrel::sheets
