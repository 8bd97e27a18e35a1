// Text taken apart from its beginning: lines, quoted strings.
#ifndef VANTREL_TOOL_LINES_H
#define VANTREL_TOOL_LINES_H

#include <optional>
#include <string>
#include <string_view>

// Takes the next line off the text; a line ends with LF, CRLF or CR.
std::string_view next_line(std::string_view &text);

// Takes the quoted string that the text begins with off it; within it a doubled quote stands for
// one. Nothing where the string is not closed.
std::optional<std::string> next_string(std::string_view &text);

#endif
