// Files in, text out.
#ifndef VANTREL_TOOL_FILE_H
#define VANTREL_TOOL_FILE_H

#include <string>
#include <string_view>

// The whole file; throws InputError.
std::string read_file(const std::string &path);

// Nothing when all of the text was written to standard output, otherwise the reason.
std::string write_output(std::string_view text);

#endif
