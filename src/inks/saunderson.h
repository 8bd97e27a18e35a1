#pragma once

#include "base/lanes.h"

namespace vantrel {

inline constexpr double kBlack = 0.0001; ///< percent; below it a reflectance is not modelled

/// Saunderson's correction (J. Opt. Soc. Am. 32, 1942, 727): from a measured to the internal
/// reflectance of a layer, in percent; k1 is reflected at the surface and k2 inside at the surface.
template <class V> V saunderson(V refl, double k1, double k2)
{
    const V r = refl / 100;
    return (r - k1) / (1 - k1 - k2 + k2 * r) * 100;
}

/// Its inverse; a reflectance below kBlack is returned as it is.
template <class V> V unsaunderson(V refl, double k1, double k2)
{
    const V r = refl / 100;
    return select(refl < kBlack, refl, ((1 - k1 - k2) + k1 / r) / (1 / r - k2) * 100);
}

} // namespace vantrel
