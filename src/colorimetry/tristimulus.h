#pragma once

#include "base/spectrum.h"
#include "colorimetry/tristimulus_weights.h"

#include <array>

namespace vantrel {

/// CIE XYZ by weighted summation (ASTM E308): X = Σ R Wx / 100 000 in order of the bands.
Xyz xyz_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs);

/// The summands of xyz_from_spectrum: R Wx / 100 000 of each band.
std::array<Xyz, kBands> xyz_by_band(Spectrum refl, ILLUM_OBS illum_obs);

// GCC for Windows does not align the stack for such vectors.
#if defined(__x86_64__) && defined(__GNUC__) && !defined(_WIN32)
#define VANTREL_AVX2
#endif

/// The two ways to sum, in the same order and to the same bits: for any processor, and for one with
/// AVX2.
Xyz integrate(Spectrum refl, TristimulusWeights &weights);
Xyz integrate_avx2(Spectrum refl, TristimulusWeights &weights);

} // namespace vantrel
