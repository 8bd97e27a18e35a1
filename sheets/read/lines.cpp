#include "read/lines.h"

namespace vantrel::sheets {

std::string_view next_line(std::string_view &text)
{
    const std::string_view line = before(text, [](char c) { return c == '\n' || c == '\r'; });
    text.remove_prefix(line.size());
    text.remove_prefix(text.starts_with("\r\n") ? 2 : std::min<std::size_t>(text.size(), 1));
    return line;
}

void Row::clear()
{
    values.clear();
    made.clear();
}

void Row::add(std::string_view quoted, std::string_view rest)
{
    if (quoted.empty())
        values.push_back(rest);
    else if (rest.empty())
        values.push_back(quoted);
    else
        values.push_back(made.emplace_back(std::string(quoted).append(rest)));
}

std::optional<std::string_view> next_string(std::string_view &text, Row &row)
{
    std::string *out = nullptr; // once there is a doubled quote
    std::size_t begin = 1;
    for (;;) {
        const auto quote = text.find('"', begin);
        if (quote == std::string_view::npos)
            return std::nullopt;
        std::string_view part = text.substr(begin, quote - begin);
        if (text.substr(quote, 2) != "\"\"") {
            text.remove_prefix(quote + 1);
            return out ? out->append(part) : part;
        }
        if (!out)
            out = &row.made.emplace_back();
        out->append(part) += '"';
        begin = quote + 2;
    }
}

} // namespace vantrel::sheets
