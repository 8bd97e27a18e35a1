#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// The reflectance of a density integrated under the response curve with a peak of 1. Infinite for
/// a response without weights.
double integrated_refl(double density, int status, int response);

} // namespace vantrel
