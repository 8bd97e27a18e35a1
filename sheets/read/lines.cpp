#include "read/lines.h"

namespace vantrel::sheets {

std::string_view next_line(std::string_view &text)
{
    const std::string_view line = before(text, [](char c) { return c == '\n' || c == '\r'; });
    text.remove_prefix(line.size());
    text.remove_prefix(text.starts_with("\r\n") ? 2 : std::min<std::size_t>(text.size(), 1));
    return line;
}

std::optional<std::string> next_string(std::string_view &text)
{
    std::string out;
    for (std::size_t i = 1; i < text.size(); ++i) {
        if (text[i] == '"') {
            if (text.substr(i, 2) != "\"\"") {
                text.remove_prefix(i + 1);
                return out;
            }
            ++i;
        }
        out += text[i];
    }
    return std::nullopt;
}

} // namespace vantrel::sheets
