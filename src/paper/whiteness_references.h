#pragma once

#include "vantrel.h"

namespace vantrel {

/// The chromaticity of the perfect white that whiteness refers to, in single precision.
struct WhitenessReference {
    ILLUM_OBS illum_obs;
    float x, y;
};

// The illuminants for which ASTM E313-98 has a whiteness.
// clang-format off
inline constexpr WhitenessReference kWhitenessReferences[] = {
    {C_2DEG,    0.3101F, 0.3161F},
    {C_10DEG,   0.3104F, 0.3191F},
    {D50_2DEG,  0.3457F, 0.3585F},
    {D50_10DEG, 0.3477F, 0.3595F},
    {D65_2DEG,  0.3127F, 0.3290F},
    {D65_10DEG, 0.3138F, 0.3310F},
};
// clang-format on
static_assert(double{kWhitenessReferences[0].x} == 0.3100999891757965);

} // namespace vantrel
