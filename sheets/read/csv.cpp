#include "read/csv.h"

#include "read/ink_columns.h"
#include "read/lines.h"
#include "read/table.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <set>
#include <string>
#include <utility>

namespace vantrel::sheets {
namespace {

// Takes a record off the text, with the end of its last line; counts the lines that it ends. A
// quoted value may go over several. False where a quoted value is not closed.
bool next_record(std::string_view &text, char separator, std::size_t &line, Row &row)
{
    const auto ends = [&](char c) { return c == separator || c == '\n' || c == '\r'; };
    const auto is_blank = [&](char c) { return c == ' ' || (c == '\t' && separator != '\t'); };
    row.clear();
    for (;;) {
        std::string_view quoted;
        std::size_t begin = 0;
        while (begin < text.size() && is_blank(text[begin]))
            ++begin;
        if (begin < text.size() && text[begin] == '"') {
            text.remove_prefix(begin);
            const auto string = next_string(text, row);
            if (!string)
                return false;
            line += static_cast<std::size_t>(std::count(string->begin(), string->end(), '\n'));
            quoted = *string;
        }
        const std::string_view rest = before(text, ends);
        text.remove_prefix(rest.size());
        row.add(quoted, trimmed(rest));
        if (text.empty() || text[0] != separator)
            break;
        text.remove_prefix(1);
    }
    next_line(text);
    ++line;
    return true;
}

std::size_t wavelengths_in(const Row &row)
{
    // a row of percentages holds none
    return static_cast<std::size_t>(
        std::count_if(row.values.begin(), row.values.end(),
                      [](auto field) { return wavelength_of(field).value_or(0) >= 200; }));
}

constexpr char separators[] = {',', ';', '\t'};

struct Heading {
    std::vector<std::string> fields;
    char separator;
};

// The line as a heading under the separator that shows the most wavelengths, three at least, or
// else under one that shows colours.
std::optional<Heading> heading_in(std::string_view line, bool spectra)
{
    std::optional<Heading> best;
    std::size_t most = 2;
    Row row;
    for (const char separator : separators) {
        std::string_view text = line;
        std::size_t lines = 0;
        if (!next_record(text, separator, lines, row))
            continue;
        std::vector<std::string> fields(row.values.begin(), row.values.end());
        const std::size_t wavelengths = spectra ? wavelengths_in(row) : has_colours(fields) * 3u;
        if (wavelengths > most) {
            most = wavelengths;
            best = Heading{std::move(fields), separator};
        }
    }
    return best;
}

bool is_blank(const Row &row)
{
    return std::all_of(row.values.begin(), row.values.end(),
                       [](auto value) { return value.empty(); });
}

// "Measurement Condition=M0", "Created: 2026-03-02", "Instrument;\"a reader\""
void take_keyword(std::string_view line, Header &header)
{
    const std::string_view keyword = before(
        line, [](char c) { return std::string_view("=:,;\t").find(c) != std::string_view::npos; });
    if (keyword.size() == line.size())
        return;
    std::string_view value = trimmed(line.substr(keyword.size() + 1));
    if (value.starts_with('"'))
        value = before(value.substr(1), [](char c) { return c == '"'; });
    header.take(keyword, value);
}

// Whether a value holds as many separators as half a row has.
bool holds_rows(const Row &row, char separator, std::size_t fields)
{
    return std::any_of(row.values.begin(), row.values.end(), [&](std::string_view value) {
        return 2 * static_cast<std::size_t>(std::count(value.begin(), value.end(), separator)) >=
               fields;
    });
}

// The rows below the first line that is a heading; false where none is.
bool read_rows(std::string_view text, Sheet &sheet, bool spectra)
{
    std::size_t line = 0;
    std::optional<Heading> heading;
    const Work work{sheet.tell(), "Reading", text.size()};
    sheet.header = {};
    while (!heading && !text.empty()) {
        ++line;
        const std::string_view before_heading = next_line(text);
        heading = heading_in(before_heading, spectra);
        if (!heading)
            take_keyword(before_heading, sheet.header);
    }
    if (!heading)
        return false;

    Table table(sheet, std::move(heading->fields), line);
    sheet.patches.reserve(static_cast<std::size_t>(std::count(text.begin(), text.end(), '\n')) + 1);
    Row row;
    while (!text.empty()) {
        const std::size_t at = line + 1;
        if (!next_record(text, heading->separator, line, row))
            throw InputError{at, "a quoted text is not closed"};
        if (is_blank(row))
            continue;
        if (line > at && holds_rows(row, heading->separator, table.fields.size()))
            throw InputError{at, "a quoted text holds whole rows: is a quotation mark missing?"};
        while (row.values.size() > table.fields.size() && row.values.back().empty())
            row.values.pop_back();
        const std::string_view statistic = Table::statistic_in(row);
        if (row.values.size() < table.fields.size() && !statistic.empty()) {
            sheet.leave_out(statistic, at);
            continue;
        }
        if (row.values.size() != table.fields.size())
            throw InputError{at, fmt::format("{} values in a row of {} fields", row.values.size(),
                                             table.fields.size())};
        table.add(row, sheet.header.condition, at);
        work.left(text.size());
    }
    work.left(0);
    table.finish();
    return true;
}

// Where a line begins with a wavelength in nm under this separator.
std::optional<double> wavelength_at(std::string_view line, char separator)
{
    const auto begin = before(line, [&](char c) { return c == separator; });
    const auto nm = begin.size() < line.size() ? wavelength_of(trimmed(begin)) : std::nullopt;
    return nm && *nm >= 200 && *nm <= 1100 ? nm : std::nullopt;
}

// A table whose rows are wavelengths, and whose columns are patches with their names above.
class Columns {
public:
    // Whether the text holds such a table: one row of a wavelength after the other, enough for a
    // spectrum; two may be exchanged.
    bool find(std::string_view text);
    void read(Sheet &sheet);

private:
    static constexpr std::size_t kFewest = 14; // 410 to 680 nm in steps of 20 nm
    static constexpr std::size_t kMostDescents = 2;
    void take_inks(const Row &row, std::size_t line);

    std::string_view above, rows; // the lines before the first wavelength, and from there
    char separator = ',';
    std::vector<Patch> patches;
    std::set<std::string> inks;
    bool free_names = true; // of all inks
};

bool Columns::find(std::string_view text)
{
    for (const char candidate : {';', '\t', ','}) {
        separator = candidate;
        std::string_view rest = text;
        std::size_t count = 0;
        double last = 0;
        std::size_t descents = 0;
        while (!rest.empty() && count < kFewest) {
            const std::string_view begin = rest, now = next_line(rest);
            const auto nm = wavelength_at(now, separator);
            descents += nm && *nm <= last;
            if (!nm || descents > kMostDescents) {
                count = descents = 0;
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

// Behind the first value.
bool holds_numbers(const Row &row)
{
    return row.values.size() > 1 &&
           std::all_of(row.values.begin() + 1, row.values.end(),
                       [](auto value) { return value.empty() || number_in(value); });
}

// The name of the ink whose percentages a row holds; empty where it holds none.
std::string ink_in(const Row &row)
{
    const std::string head(row.values[0]);
    if (!holds_numbers(row) || head.empty())
        return "";
    return is_standard_device_field(head) ? upper(head) : inks_of({letters(head)})[0];
}

void Columns::take_inks(const Row &row, std::size_t line)
{
    const std::string ink = ink_name(ink_in(row));
    free_names = free_names && !is_standard_device_field(row.values[0]);
    if (!inks.insert(ink).second)
        throw InputError{line, fmt::format("{} occurs twice", in_quotes(row.values[0]))};
    for (std::size_t i = 0; i < patches.size() && i + 1 < row.values.size(); ++i)
        if (const auto value = number_in(row.values[i + 1]))
            patches[i].device.emplace_back(ink, *value);
}

// The last row above the wavelengths that tells no ink has the names.
void Columns::read(Sheet &sheet)
{
    Row row;
    std::size_t at = 0, line = 0;
    std::string_view rest = above, names, below;
    std::size_t named = 0; // values in the row of names
    while (!rest.empty()) {
        std::string_view now = next_line(rest);
        const std::string_view begin = now;
        std::size_t lines = 0;
        ++at;
        if (next_record(now, separator, lines, row) && (is_blank(row) || !ink_in(row).empty()))
            continue;
        if (named == row.values.size() && holds_numbers(row)) {
            sheet.warn(at, fmt::format("the row of numbers {} above the wavelengths is left out",
                                       in_quotes(row.values[0])));
            continue;
        }
        names = begin;
        named = row.values.size();
        below = rest;
        line = at;
    }
    if (names.empty())
        throw InputError{1, "no names of patches above the wavelengths"};
    const std::size_t first = at;
    if (!next_record(names, separator, at, row))
        throw InputError{line, "a quoted text is not closed"};
    patches.resize(row.values.size() - 1);
    for (std::size_t i = 0; i < patches.size(); ++i)
        patches[i].name = printable(row.values[i + 1]);
    at = line;
    while (!below.empty() && next_record(below, separator, at, row))
        if (!is_blank(row) && !ink_in(row).empty())
            take_inks(row, at);
    at = first;
    std::vector<double> wavelengths;
    std::vector<std::vector<double>> values(patches.size());
    rest = rows;
    while (!rest.empty()) {
        const std::size_t begin = at + 1;
        if (!next_record(rest, separator, at, row))
            throw InputError{begin, "a quoted text is not closed"};
        const auto nm = wavelength_of(row.values[0]);
        if (!nm) {
            if (is_blank(row))
                continue;
            sheet.warn(begin, "what stands below the wavelengths is left out");
            break;
        }
        wavelengths.push_back(*nm);
        for (std::size_t i = patches.size() + 1; i < row.values.size(); ++i)
            if (!trimmed(row.values[i]).empty())
                throw InputError{begin, fmt::format("{} values under the names of {} patches",
                                                    row.values.size() - 1, patches.size())};
        row.values.resize(std::max(row.values.size(), patches.size() + 1));
        for (std::size_t i = 0; i < patches.size(); ++i) {
            const auto value = number_in(row.values[i + 1]);
            if (!value)
                throw InputError{begin,
                                 fmt::format("{} is {}, not a number", in_quotes(patches[i].name),
                                             in_quotes(row.values[i + 1]))};
            values[i].push_back(*value);
        }
    }
    const Bands &bands = sheet.bands_at(wavelengths, line);
    for (std::size_t i = 0; i < patches.size(); ++i) {
        patches[i].refl = bands.of(values[i]);
        sheet.add(std::move(patches[i]), sheet.header.condition, line);
    }
    if (free_names)
        sheet.bring_inks_to_percent();
}

} // namespace

void read_csv(std::string_view text, Sheet &sheet)
{
    Columns columns;
    if (read_rows(text, sheet, true) || read_rows(text, sheet, false))
        return;
    if (!columns.find(text)) {
        const std::string_view start = trimmed(text);
        throw InputError{0,
                         fmt::format("no measurement file: it names no fields of CGATS text "
                                     "(BEGIN_DATA_FORMAT), is no XML, and has no CSV header with "
                                     "wavelengths, L*a*b* or XYZ; it begins with {}",
                                     in_quotes(start.substr(0, start.find_first_of("\r\n"))))};
    }
    columns.read(sheet);
}

} // namespace vantrel::sheets
