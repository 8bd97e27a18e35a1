#pragma once

#include "base/lanes.h"
#include "base/spectrum.h"
#include "colorimetry/tristimulus_weights.h"

#include <array>

namespace vantrel {

/// CIE XYZ by weighted summation (ASTM E308): X = Σ R Wx / 100 000 in order of the bands.
Xyz xyz_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs);

/// The summands of xyz_from_spectrum: R Wx / 100 000 of each band.
std::array<Xyz, kBands> xyz_by_band(Spectrum refl, ILLUM_OBS illum_obs);

/// The same from several spectra side by side.
inline constexpr double kWeightScale = 100000.0;
template <class V> XyzOf<V> xyz_from_bands(const BandsOf<V> &refl, TristimulusWeights &weights)
{
    XyzOf<V> sum = {0, 0, 0};
    for (int i = 0; i < kBands; ++i) {
        sum.x += refl[i] * weights[i].xy[0];
        sum.y += refl[i] * weights[i].xy[1];
        sum.z += refl[i] * weights[i].z[0];
    }
    return {sum.x / kWeightScale, sum.y / kWeightScale, sum.z / kWeightScale};
}

// GCC for Windows does not align the stack for such vectors.
#if VANTREL_LANES >= 4 && defined(__x86_64__) && !defined(_WIN32)
#define VANTREL_AVX2
#endif

/// The two ways to sum, in the same order and to the same bits: for any processor, and for one with
/// AVX2.
Xyz integrate(Spectrum refl, TristimulusWeights &weights);
Xyz integrate_avx2(Spectrum refl, TristimulusWeights &weights);

} // namespace vantrel
