#pragma once

#include "base/spectrum.h"

namespace vantrel {

// CIE 1976 (L*a*b*), CIE 15, with the constants as decimals.
inline constexpr double kLinearLimit = 0.008856; ///< up to this ratio the cube root is a line
inline constexpr double kRootSlope = 7.787;
inline constexpr double kLightnessSlope = 903.292; ///< 116 · 7.787

/// exp(0.3333333333 ln t) for t > 0.
double cube_root(double t);

/// L* of Y/Yn.
double lightness(double y_ratio);

Lab lab_from_xyz(const Xyz &xyz, const Xyz &white);

/// a* and b* rounded to two decimals, halves away from zero.
Lab rounded(const Lab &lab);

/// L*C*h of a colour as it is; an a* of 0 counts as 0.000001.
Lch lch_from_lab(const Lab &lab);

/// Its chroma alone.
double chroma(const Lab &lab);

Lab lab_from_lch(const Lch &lch);

/// The chains from a spectrum.
Lab lab_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs);
Lch lch_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs);

} // namespace vantrel
