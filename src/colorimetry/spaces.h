#pragma once

#include "colorimetry/illuminants.h"

#include <optional>

namespace vantrel {

struct Luv {
    double L, u, v;
};
struct Yxy {
    double Y, x, y;
};
struct HunterLab {
    double L, a, b;
};

/// CIE 1976 (L*u*v*), CIE 15; u* = v* = 0 for a colour without u', v'.
Luv luv_from_xyz(const Xyz &xyz, const Xyz &white);

/// x, y, z of CIE 15; nothing where X + Y + Z is 0.
std::optional<Xyz> chromaticity(const Xyz &xyz);

/// Y, x, y; nothing where X + Y + Z is 0.
std::optional<Yxy> yxy_from_xyz(const Xyz &xyz);

/// Hunter Lab; nothing where X + Y + Z is 0.
std::optional<HunterLab> hunter_from_xyz(const Xyz &xyz, const Illuminant &illuminant);

/// The inverse of lab_from_xyz with the ratios to the white rounded to six decimals.
Xyz xyz_from_lab(const Lab &lab, const Xyz &white);

} // namespace vantrel
