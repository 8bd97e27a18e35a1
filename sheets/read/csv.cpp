#include "read/csv.h"

#include "read/lines.h"
#include "read/table.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>

namespace vantrel::sheets {
namespace {

// Takes a record off the text, with the end of its last line; counts the lines that it ends. A
// quoted value may go over several. Nothing where a quoted value is not closed.
std::optional<Row> next_record(std::string_view &text, char separator, std::size_t &line)
{
    const auto ends = [&](char c) { return c == separator || c == '\n' || c == '\r'; };
    const std::string_view blanks = separator == '\t' ? " " : " \t";
    Row values;
    for (;;) {
        std::string value;
        const auto begin = text.find_first_not_of(blanks);
        if (begin != std::string_view::npos && text[begin] == '"') {
            text.remove_prefix(begin);
            auto quoted = next_string(text);
            if (!quoted)
                return std::nullopt;
            line += static_cast<std::size_t>(std::count(quoted->begin(), quoted->end(), '\n'));
            value = std::move(*quoted);
        }
        const std::string_view rest = before(text, ends);
        text.remove_prefix(rest.size());
        value += trimmed(rest);
        values.push_back(std::move(value));
        if (text.empty() || text[0] != separator)
            break;
        text.remove_prefix(1);
    }
    next_line(text);
    ++line;
    return values;
}

std::size_t wavelengths_in(const Row &fields)
{
    return static_cast<std::size_t>(
        std::count_if(fields.begin(), fields.end(), [](auto &f) { return wavelength_of(f); }));
}

struct Header {
    Row fields;
    char separator;
};

// The line as a header under the separator that shows the most wavelengths; one names three at
// least.
std::optional<Header> header_in(std::string_view line)
{
    std::optional<Header> best;
    std::size_t most = 2;
    for (const char separator : {',', ';', '\t'}) {
        std::string_view text = line;
        std::size_t lines = 0;
        auto fields = next_record(text, separator, lines);
        const std::size_t wavelengths = fields ? wavelengths_in(*fields) : 0;
        if (wavelengths > most) {
            most = wavelengths;
            best = Header{std::move(*fields), separator};
        }
    }
    return best;
}

bool is_blank(const Row &row)
{
    return std::all_of(row.begin(), row.end(), [](auto &value) { return value.empty(); });
}

} // namespace

void read_csv(std::string_view text, Sheet &sheet)
{
    std::size_t line = 0;
    std::optional<Header> header;
    const Work work{sheet.tell(), "Reading", text.size()};
    while (!header && !text.empty()) {
        ++line;
        header = header_in(next_line(text));
    }
    if (!header)
        throw InputError{0,
                         "no measurement file: it names no fields of CGATS text "
                         "(BEGIN_DATA_FORMAT), is no XML, and has no CSV header with wavelengths"};

    Table table(sheet, std::move(header->fields), line);
    while (!text.empty()) {
        const std::size_t at = line + 1;
        auto row = next_record(text, header->separator, line);
        if (!row)
            throw InputError{at, "a quoted text is not closed"};
        if (is_blank(*row))
            continue;
        while (row->size() > table.fields.size() && row->back().empty())
            row->pop_back();
        if (row->size() != table.fields.size())
            throw InputError{at, fmt::format("{} values in a row of {} fields", row->size(),
                                             table.fields.size())};
        table.add(*row, std::nullopt, at);
        work.left(text.size());
    }
    work.left(0);
    table.finish();
}

} // namespace vantrel::sheets
