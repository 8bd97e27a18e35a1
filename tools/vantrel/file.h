// Files in.
#pragma once

#include <string>
#include <sys/stat.h>

namespace vantrel::program {

// The whole file, or standard input for -; throws InputError, also where the file changes
// meanwhile.
std::string read_file(const std::string &path);

// Whether it is a file that read_file has read, or tried to, by this name or another.
bool was_read(const struct stat &file);

} // namespace vantrel::program
