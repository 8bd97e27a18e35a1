// Files in.
#pragma once

#include <string>

namespace vantrel::program {

// The whole file, or standard input for -; throws InputError.
std::string read_file(const std::string &path);

} // namespace vantrel::program
