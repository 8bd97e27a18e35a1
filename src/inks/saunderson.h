#pragma once

namespace vantrel {

inline constexpr double kBlack = 0.0001; ///< percent; below it a reflectance is not modelled

/// Saunderson's correction (J. Opt. Soc. Am. 32, 1942, 727): from a measured to the internal
/// reflectance of a layer, in percent; k1 is reflected at the surface and k2 inside at the surface.
double saunderson(double refl, double k1, double k2);

/// Its inverse; a reflectance below kBlack is returned as it is.
double unsaunderson(double refl, double k1, double k2);

} // namespace vantrel
