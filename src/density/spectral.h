#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// -log10 of a reflectance in percent, at most 7.
double spectral_density(double refl);

/// Of every second band from 420 nm the wavelength of the one that is densest, the spectrum
/// adjusted for the paper where there is one.
int darkest_wavelength(Spectrum refl, Paper paper);

} // namespace vantrel
