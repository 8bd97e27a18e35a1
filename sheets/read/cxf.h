// CxF3 (ISO 17972), with the tint steps of CxF/X-4.
#ifndef VANTREL_TOOL_CXF_H
#define VANTREL_TOOL_CXF_H

#include <string_view>

#include "read/sheet.h"

// The reflectance spectra of all objects. UTF-8, or Latin-1; throws InputError.
void read_cxf(std::string_view text, Sheet &sheet);

#endif
