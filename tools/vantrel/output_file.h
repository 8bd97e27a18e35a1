// Text out.
#pragma once

#include <string>
#include <string_view>

namespace vantrel::program {

// Writes all of the text to the file, or to standard output where the path is empty or "-". A file
// has either its old content or all of the new one: it is written under a temporary name beside its
// own and renamed. What is no regular file (a device, a pipe) is written straight. Gives nothing,
// or the reason why the text could not be written.
std::string write_output(const std::string &path, std::string_view text);

} // namespace vantrel::program
