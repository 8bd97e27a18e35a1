// What differs between systems beside files: system_posix.cpp and system_windows.cpp have it, each.
#pragma once

#include <string>
#include <vector>

namespace vantrel::program {

// Before anything else. Turns what a lost reader or a limit would end the program with into errors
// of writing, and makes text UTF-8: the words of the command line, to which `words` is set, and on
// Windows what goes to a console.
void prepare(char **&words);

enum class Stream { output, error };
bool is_terminal(Stream stream);

bool is_regular_file(const std::string &path);

// The files that words of the command line stand for. The shells of Windows leave * and ? to the
// program; a word that no file fits stays.
std::vector<std::string> files_of(const std::vector<std::string> &words);

} // namespace vantrel::program
