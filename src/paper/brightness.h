#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Blue-weighted brightness of paper in percent.
double brightness(Spectrum refl);

} // namespace vantrel
