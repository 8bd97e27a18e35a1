#include "lines.h"

std::string_view next_line(std::string_view &text)
{
    const auto end = text.find_first_of("\r\n");
    const std::string_view line = text.substr(0, end);
    if (end == std::string_view::npos)
        text = {};
    else
        text.remove_prefix(end + (text.substr(end, 2) == "\r\n" ? 2 : 1));
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
