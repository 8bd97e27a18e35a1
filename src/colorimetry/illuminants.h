#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Reference white and Hunter Lab constants of an illuminant/observer combination.
struct Illuminant {
    Xyz white;
    double ka, kb;
};

const Illuminant &illuminant(ILLUM_OBS illum_obs);
inline const Xyz &white_point(ILLUM_OBS illum_obs) { return illuminant(illum_obs).white; }

} // namespace vantrel
