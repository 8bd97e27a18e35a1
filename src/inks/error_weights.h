#pragma once

#include "base/spectrum.h"

#include <array>

namespace vantrel {

/// What each band contributes to the XYZ of a second spectrum beyond its contribution to the first.
using BandDifferences = std::array<Xyz, kBands>;

BandDifferences band_differences(Spectrum first, Spectrum second, ILLUM_OBS illum_obs);

/// Where along the spectrum a difference in a* (in b*) comes from: signed cube roots of the a*-like
/// (b*-like) difference of each band, the largest magnitude 100. All zeros without a difference.
Bands a_error_weights(const BandDifferences &difference, const Xyz &white);
Bands b_error_weights(const BandDifferences &difference, const Xyz &white);

} // namespace vantrel
