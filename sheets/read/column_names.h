// Names of columns that are not read and need not be.
#pragma once

#include <string_view>

namespace vantrel::sheets {

// Whether a column of this name (letters()) says nothing about what the readings are: what is
// computed from them, its spread, where and when they were taken and by whom.
bool is_beside_readings(std::string_view key);

} // namespace vantrel::sheets
