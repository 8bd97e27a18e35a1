// Files in.
#ifndef VANTREL_TOOL_FILE_H
#define VANTREL_TOOL_FILE_H

#include <string>

// The whole file, or standard input for -; throws InputError.
std::string read_file(const std::string &path);

#endif
