#pragma once

#include "base/numeric.h"
#include "base/spectrum.h"

namespace vantrel {

/// CIE 1976 ΔE*ab (CIE 15).
template <class Lab> auto delta_e76(const Lab &first, const Lab &second)
{
    return sqrt(square(first.L - second.L) + square(first.a - second.a) +
                square(first.b - second.b));
}

/// Signed CIE 1976 ΔH*ab (CIE 15): positive when the second hue lies counter-clockwise of the
/// first. Chroma and hue are those of rounded a* and b*, or of a* and b* as they are.
double delta_h(const Lab &first, const Lab &second, bool round = true);

} // namespace vantrel
