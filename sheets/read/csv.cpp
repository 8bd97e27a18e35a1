#include "read/csv.h"

#include "read/csv_record.h"
#include "read/table.h"
#include "read/text.h"
#include "read/wavelengths_down.h"

#include <fmt/format.h>

#include <algorithm>
#include <string>
#include <utility>
#include <vector>

namespace vantrel::sheets {
namespace {

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

} // namespace

void read_csv(std::string_view text, Sheet &sheet)
{
    WavelengthsDown down;
    if (read_rows(text, sheet, true) || read_rows(text, sheet, false))
        return;
    if (!down.find(text)) {
        const std::string_view start = trimmed(text);
        throw InputError{0,
                         fmt::format("no measurement file: it names no fields of CGATS text "
                                     "(BEGIN_DATA_FORMAT), is no XML, and has no CSV header with "
                                     "wavelengths, L*a*b* or XYZ; it begins with {}",
                                     in_quotes(start.substr(0, start.find_first_of("\r\n"))))};
    }
    down.read(sheet);
}

} // namespace vantrel::sheets
