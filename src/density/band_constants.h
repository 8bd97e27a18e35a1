#pragma once

#include "base/spectrum.h"

#include <array>

namespace vantrel {

/// Weights of the seven bands around a centre.
inline constexpr int kShape = 7;
using Shape = std::span<const double, kShape>;

/// Moves a settable band (HIFI1_RESPONSE to HEXACHROME2_RESPONSE) and, given a shape, rebuilds its
/// row of den_weight. A wavelength whose seven bands do not lie in the spectrum changes nothing.
void set_band(int response, double wavelength, const std::optional<Shape> &shape);

/// Where the band stands, in nm.
double band_centre(int response);

/// The row of den_weight around the centre of the band, scaled to 1 there.
std::array<double, kShape> band_shape(int response);

} // namespace vantrel
