#include "read/csv_record.h"

#include "read/text.h"

#include <algorithm>

namespace vantrel::sheets {

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

bool is_blank(const Row &row)
{
    return std::all_of(row.values.begin(), row.values.end(),
                       [](auto value) { return value.empty(); });
}

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

} // namespace vantrel::sheets
