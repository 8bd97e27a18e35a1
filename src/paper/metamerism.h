#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// The ΔE*ab of a sample from its standard under two combinations, added up.
double metamerism(Spectrum standard, Spectrum sample, ILLUM_OBS illum_obs1, ILLUM_OBS illum_obs2);

} // namespace vantrel
