// CGATS text (ISO 28178) as instruments and programs export it.
#pragma once

#include "read/sheet.h"

#include <string_view>

namespace vantrel::sheets {

// The first table that holds spectra, or else colours, with the rows of later tables of the same
// fields. Throws InputError.
void read_cgats(std::string_view text, Sheet &sheet);

} // namespace vantrel::sheets
