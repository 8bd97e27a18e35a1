#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// The spectrum of an ink at a relative film thickness (1 is the film as measured): Beer-Lambert
/// between Saunderson corrections, nowhere lighter than the paper.
Bands film(Spectrum ink, double thickness, Spectrum paper);

} // namespace vantrel
