// Measurement files of every format: CGATS text, CSV and CxF.
#pragma once

#include "read/measurement.h"

#include <string_view>

namespace vantrel::sheets {

// The format is found from the content. Throws InputError.
Measurement read_measurement(std::string_view bytes, const Reading &reading);

} // namespace vantrel::sheets
