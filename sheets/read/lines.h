// Text taken apart from its beginning: lines, quoted strings.
#pragma once

#include <algorithm>
#include <optional>
#include <string>
#include <string_view>

namespace vantrel::sheets {

// The text up to the first character that ends it, or all of it.
template <typename Ends> std::string_view before(std::string_view text, Ends ends)
{
    const auto end = std::find_if(text.begin(), text.end(), ends);
    return text.substr(0, static_cast<std::size_t>(end - text.begin()));
}

// Takes the next line off the text; a line ends with LF, CRLF or CR.
std::string_view next_line(std::string_view &text);

// Takes the quoted string that the text begins with off it; within it a doubled quote stands for
// one. Nothing where the string is not closed.
std::optional<std::string> next_string(std::string_view &text);

} // namespace vantrel::sheets
