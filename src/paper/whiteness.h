#pragma once

#include "colorimetry/spaces.h"

#include <optional>

namespace vantrel {

/// ASTM E313-98 whiteness; nothing for an illuminant without one, and nothing outside the limits
/// within which the index means a white.
std::optional<double> whiteness(const Yxy &colour, ILLUM_OBS illum_obs);

} // namespace vantrel
