// Measurement files of every format: CGATS text, CSV and CxF.
#ifndef VANTREL_TOOL_READER_H
#define VANTREL_TOOL_READER_H

#include <string_view>

#include "read/measurement.h"

// The format is found from the content. Throws InputError.
Measurement read_measurement(std::string_view bytes, const Reading &reading);

#endif
