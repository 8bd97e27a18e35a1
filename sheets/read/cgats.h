// CGATS text (ISO 28178) as instruments and programs export it.
#ifndef VANTREL_TOOL_CGATS_H
#define VANTREL_TOOL_CGATS_H

#include <string_view>

#include "read/sheet.h"

// The first table that holds spectra, with the rows of later tables of the same fields. Throws
// InputError.
void read_cgats(std::string_view text, Sheet &sheet);

#endif
