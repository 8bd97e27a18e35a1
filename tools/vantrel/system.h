// What differs between systems beside files: system_posix.cpp and system_windows.cpp have it, each.
#pragma once

#include <string>

namespace vantrel::program {

// Before anything else. Turns what a lost reader or a limit would end the program with into errors
// of writing, and makes text UTF-8: the words of the command line, to which `words` is set, and on
// Windows what goes to a console.
void prepare(char **&words);

enum class Stream { output, error };
bool is_terminal(Stream stream);

bool is_regular_file(const std::string &path);

} // namespace vantrel::program
