// CxF3 (ISO 17972), with the tint steps of CxF/X-4.
#pragma once

#include "read/sheet.h"

#include <string_view>

namespace vantrel::sheets {

// The reflectance spectra of all objects. UTF-8, or Latin-1; throws InputError.
void read_cxf(std::string_view text, Sheet &sheet);

} // namespace vantrel::sheets
