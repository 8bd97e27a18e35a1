// Comma-separated values (RFC 4180), and those that semicolons or tabs separate.
#pragma once

#include "read/sheet.h"

#include <string_view>

namespace vantrel::sheets {

// The rows after the first one that names wavelengths, or else L*a*b* or XYZ, or the columns beside
// wavelengths down the rows. Throws InputError.
void read_csv(std::string_view text, Sheet &sheet);

} // namespace vantrel::sheets
