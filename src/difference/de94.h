#pragma once

#include "base/numeric.h"
#include "base/spectrum.h"

namespace vantrel {

/// CIE94 with kH = 1 (CIE 116), weighted by the chroma of the reference.
template <class Lab> auto delta_e94(const Lab &sample, const Lab &reference, double kL, double kC)
{
    using V = decltype(Lab::L);
    const V dL = sample.L - reference.L;
    const V da = sample.a - reference.a;
    const V db = sample.b - reference.b;
    const V Cr = sqrt(square(reference.a) + square(reference.b));
    const V dC = sqrt(square(sample.a) + square(sample.b)) - Cr;
    const V dH = sqrt(abs(square(da) + square(db) - square(dC)));
    const V SC = 1 + 0.045 * Cr;
    const V SH = 1 + 0.015 * Cr;
    return sqrt(square(dL / kL) + square(dC / (kC * SC)) + square(dH / SH));
}

} // namespace vantrel
