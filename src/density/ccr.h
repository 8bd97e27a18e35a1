#pragma once

#include "density/density_set.h"

namespace vantrel {

/// The corrected densities of CCR1_STATUS or CCR2_STATUS, less those of the paper.
Densities ccr_densities(Spectrum refl, Paper paper, int status);

} // namespace vantrel
