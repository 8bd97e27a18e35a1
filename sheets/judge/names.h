// The names under which a user picks what the library knows by number.
#pragma once

#include "read/illuminant.h"

#include <optional>
#include <string>
#include <string_view>

namespace vantrel::sheets {

// All names come separated by ", "; each is looked up in any case.

std::optional<int> status_named(std::string_view name); // E_STATUS, or E for short
std::string_view status_name(int status);
std::string status_names();

// Whether a status has a filter of this response.
bool has_response(int status, int response);
std::optional<int> response_named(std::string_view name); // Green, or G for short
std::string response_names();

// What DetermineDensityResponse() gave under a status: Visual, Red, … HiFi 1, Hexachrome 2, 560 nm,
// band 14; the code is V, R, … H1, X2, 560, b14.
std::string response_name(int status, int response);
std::string response_code(int status, int response);

} // namespace vantrel::sheets
