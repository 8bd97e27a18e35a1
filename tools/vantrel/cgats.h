// Measurement files in CGATS text (ISO 28178).
#ifndef VANTREL_TOOL_CGATS_H
#define VANTREL_TOOL_CGATS_H

#include <string_view>

#include "measurement.h"

// The patches of the first table that holds spectra; throws InputError.
Measurement read_cgats(std::string_view file);

#endif
