#include "read/wavelengths_down.h"

#include "read/colour_columns.h"
#include "read/column_names.h"
#include "read/table.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <initializer_list>
#include <string>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kFewest = 14; // 410 to 680 nm in steps of 20 nm
constexpr std::size_t kMostExchanged = 2;

// Where a line begins with a wavelength in nm under this separator.
std::optional<double> wavelength_at(std::string_view line, char separator)
{
    const auto begin = before(line, [&](char c) { return c == separator; });
    const auto nm = begin.size() < line.size() ? wavelength_of(trimmed(begin)) : std::nullopt;
    return nm && *nm >= 200 && *nm <= 1100 ? nm : std::nullopt;
}

std::string_view cell(const Row &row, std::size_t column)
{
    return column < row.values.size() ? row.values[column] : std::string_view();
}

// Beside the head of a row stands more than the value of a keyword.
bool is_of_table(const Row &row, std::size_t width)
{
    const bool keyword = row.values[0].find_first_of("=:") != std::string_view::npos;
    const std::size_t first = width > 2 ? 2 : 1;
    return !keyword && row.values.size() > first &&
           std::any_of(row.values.begin() + static_cast<std::ptrdiff_t>(first), row.values.end(),
                       [](auto it) { return !it.empty(); });
}

// Behind the head.
bool all_are_alike(const Row &row)
{
    return row.values.size() > 2 &&
           std::all_of(row.values.begin() + 2, row.values.end(),
                       [&](auto it) { return it.empty() || it == row.values[1]; });
}

// "nm", "Wavelength [nm]", or nothing.
bool tells_wavelengths(std::string_view key)
{
    constexpr std::array words = {"NM", "WAVELENGTH", "LAMBDA", "WL", "WELLENL", "\xCE\xBB"};
    return key.empty() || std::any_of(words.begin(), words.end(),
                                      [&](std::string_view word) { return key.starts_with(word); });
}

bool is_id(std::string_view key)
{
    constexpr std::array ids = {"ID", "SAMPLEID", "PATCHID", "NO", "SAMPLENO", "PATCHNO", "NUMBER"};
    return std::find(ids.begin(), ids.end(), key) != ids.end();
}

} // namespace

bool WavelengthsDown::find(std::string_view text)
{
    for (const char candidate : {';', '\t', ','}) {
        separator = candidate;
        std::string_view rest = text;
        std::size_t count = 0;
        double last = 0;
        std::size_t rises = 0, falls = 0;
        while (!rest.empty() && count < kFewest) {
            const std::string_view begin = rest, now = next_line(rest);
            const auto nm = wavelength_at(now, separator);
            if (nm)
                ++(*nm > last ? rises : falls);
            if (!nm || std::min(rises, falls) > kMostExchanged) {
                count = rises = falls = 0;
            } else if (count++ == 0) {
                rows = begin;
                above = text.substr(0, text.size() - begin.size());
            }
            last = nm.value_or(0);
        }
        if (count == kFewest && !above.empty())
            return true;
    }
    return false;
}

void WavelengthsDown::read_above(Sheet &sheet)
{
    std::string_view rest = rows;
    Row row;
    std::size_t at = 0;
    if (next_record(rest, separator, at, row))
        width = row.values.size();
    at = 0;
    rest = above;
    while (!rest.empty()) {
        const std::string_view begin = rest;
        const std::size_t line = at + 1;
        if (!next_record(rest, separator, at, row))
            throw InputError{line, "a quoted text is not closed"};
        if (is_blank(row))
            continue;
        if (!is_of_table(row, width))
            take_keyword(before(begin, [](char c) { return c == '\n' || c == '\r'; }),
                         sheet.header);
        else
            lines.push_back({std::exchange(row, {}), line});
    }
    lines_above = at;
    for (std::size_t i = 0; i < lines.size(); ++i)
        for (std::size_t j = 0; j < i; ++j) {
            const std::string key = letters(lines[i].row.values[0]);
            if (!tells_wavelengths(key) && key == letters(lines[j].row.values[0]))
                throw InputError{lines[i].at,
                                 fmt::format("{} occurs twice", in_quotes(lines[i].row.values[0]))};
        }
    if (lines.empty())
        throw InputError{1, "no names of patches above the wavelengths"};
}

// The line of the patches' names: by its head, or else the first of words that tell nothing else.
std::size_t WavelengthsDown::names() const
{
    const auto first = [&](auto is_it) {
        const auto found = std::find_if(lines.begin(), lines.end(), [&](const Line &line) {
            return is_it(letters(line.row.values[0]), line.row);
        });
        return found == lines.end() ? kNone : static_cast<std::size_t>(found - lines.begin());
    };
    const auto is_named = [](const std::string &key, const Row &) {
        return !is_id(key) && (key.starts_with("SAMPLE") || key.starts_with("PATCH") ||
                               key == "NAME" || key == "LABEL" || key == "LOCATION");
    };
    const auto tells_them = [](const std::string &key, const Row &row) {
        return tells_wavelengths(key) && !all_are_alike(row);
    };
    const auto holds_words = [](const std::string &key, const Row &row) {
        return !is_beside_readings(key) && MethodColumns({key}).all().empty() &&
               !all_are_alike(row) &&
               std::any_of(row.values.begin() + 1, row.values.end(),
                           [](auto it) { return !it.empty() && !number_in(it); });
    };
    std::size_t line = first(is_named);
    if (line == kNone)
        line = first(tells_them);
    return line == kNone ? first(holds_words) : line;
}

void WavelengthsDown::read_wavelengths(Sheet &sheet, const Row &named)
{
    std::size_t at = lines_above;
    std::string_view rest = rows;
    Row row;
    while (!rest.empty()) {
        const std::size_t line = at + 1;
        if (!next_record(rest, separator, at, row))
            throw InputError{line, "a quoted text is not closed"};
        if (is_blank(row))
            continue;
        if (!wavelength_of(row.values[0])) {
            sheet.warn(line, "what stands below the wavelengths is left out");
            return;
        }
        for (std::size_t i = named.values.size(); i < row.values.size(); ++i)
            if (!row.values[i].empty())
                throw InputError{line, fmt::format("{} values under the names of {} patches",
                                                   row.values.size() - 1, named.values.size() - 1)};
        for (std::size_t i = 1; i < named.values.size(); ++i) {
            std::string_view value = cell(row, i);
            value.remove_suffix(value.ends_with('%'));
            if (!number_in(value) && !(value.empty() && named.values[i].empty()))
                throw InputError{line, fmt::format("{} is {}, not a number",
                                                   in_quotes(named.values[i]), in_quotes(value))};
        }
        spectrum.push_back({std::exchange(row, {}), line});
    }
}

// Without a name and values, or with the wavelengths once more.
bool WavelengthsDown::is_empty(std::size_t column) const
{
    const auto all = [&](const std::vector<Line> &of, auto is_it) {
        return std::all_of(of.begin(), of.end(), [&](const Line &line) { return is_it(line.row); });
    };
    return all(spectrum, [&](const Row &row) { return cell(row, column) == row.values[0]; }) ||
           (all(lines, [&](const Row &row) { return cell(row, column).empty(); }) &&
            all(spectrum, [&](const Row &row) { return cell(row, column).empty(); }));
}

void WavelengthsDown::read(Sheet &sheet)
{
    sheet.header = {};
    read_above(sheet);
    const std::size_t named = names();
    const Line &first = named != kNone
                            ? lines[named]
                            : *std::max_element(lines.begin(), lines.end(), [](auto &a, auto &b) {
                                  return a.row.values.size() < b.row.values.size();
                              });
    read_wavelengths(sheet, first.row);
    std::vector<std::string> fields;
    for (std::size_t i = 0; i < lines.size(); ++i) {
        const std::string head(lines[i].row.values[0]);
        const std::string key = letters(head);
        fields.push_back(i == named    ? "SAMPLE_NAME"
                         : key.empty() ? fmt::format("without a name in line {}", lines[i].at)
                         : tells_wavelengths(key) ? "Unit"
                                                  : head);
    }
    for (const Line &line : spectrum)
        fields.emplace_back(line.row.values[0]);
    Table table(sheet, std::move(fields), first.at);
    Row patch;
    for (std::size_t column = 1; column < first.row.values.size(); ++column) {
        if (is_empty(column))
            continue;
        patch.clear();
        for (const std::vector<Line> *part : {&lines, &spectrum})
            for (const Line &line : *part)
                patch.values.push_back(cell(line.row, column));
        table.add(patch, sheet.header.condition, first.at);
    }
    table.finish();
}

} // namespace vantrel::sheets
