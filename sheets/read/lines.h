// Text taken apart from its beginning: lines, quoted strings.
#pragma once

#include <algorithm>
#include <deque>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// The text up to the first character that ends it, or all of it.
template <typename Ends> std::string_view before(std::string_view text, Ends ends)
{
    const auto end = std::find_if(text.begin(), text.end(), ends);
    return text.substr(0, static_cast<std::size_t>(end - text.begin()));
}

// Takes the next line off the text; a line ends with LF, CRLF or CR.
std::string_view next_line(std::string_view &text);

// The values of a row, views of the text or of what had to be made.
struct Row {
    std::vector<std::string_view> values;
    std::deque<std::string> made;

    void clear();
    void add(std::string_view quoted, std::string_view rest); // one behind the other
};

// Takes the quoted string that the text begins with off it; within it a doubled quote stands for
// one, so that it has to be made for the row. Nothing where the string is not closed.
std::optional<std::string_view> next_string(std::string_view &text, Row &row);

} // namespace vantrel::sheets
