#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// DIN 6172: how far the difference of a pair moves between two combinations.
double metamerism_index(Spectrum first, Spectrum second, ILLUM_OBS illum_obs1,
                        ILLUM_OBS illum_obs2);

} // namespace vantrel
