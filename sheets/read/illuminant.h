// The names of illuminants and observers.
#pragma once

#include <vantrel.h>

#include <optional>
#include <string>
#include <string_view>

namespace vantrel::sheets {

std::optional<ILLUM_OBS> illuminant_named(std::string_view name); // D50_2DEG, in any case
std::string_view name_of(ILLUM_OBS illuminant);
std::string illuminant_names(); // separated by ", "

} // namespace vantrel::sheets
