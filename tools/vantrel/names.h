// The names under which a user picks what the library knows by number.
#ifndef VANTREL_TOOL_NAMES_H
#define VANTREL_TOOL_NAMES_H

#include <optional>
#include <string>
#include <string_view>

#include <vantrel.h>

std::optional<ILLUM_OBS> illuminant_named(std::string_view name); // in any case
std::string_view name_of(ILLUM_OBS illuminant);
std::string illuminant_names(); // all of them, separated by ", "

#endif
