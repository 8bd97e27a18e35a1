#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Saunderson's correction (J. Opt. Soc. Am. 32, 1942, 727): from a measured to the internal
/// reflectance of a layer, in percent; k1 is reflected at the surface and k2 inside at the surface.
double saunderson(double refl, double k1, double k2);

/// Its inverse; a reflectance below 0.0001 % is returned as it is.
double unsaunderson(double refl, double k1, double k2);

/// The spectrum of an ink at a relative film thickness (1 is the film as measured): Beer-Lambert
/// between the surface corrections, nowhere lighter than the paper.
Bands film(Spectrum ink, double thickness, Spectrum paper);

} // namespace vantrel
