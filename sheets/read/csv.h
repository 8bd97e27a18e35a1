// Comma-separated values (RFC 4180), and those that semicolons or tabs separate.
#ifndef VANTREL_TOOL_CSV_H
#define VANTREL_TOOL_CSV_H

#include <string_view>

#include "read/sheet.h"

// The rows after the first one that names wavelengths. Throws InputError.
void read_csv(std::string_view text, Sheet &sheet);

#endif
