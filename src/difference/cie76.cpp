#include "difference/cie76.h"

#include "colorimetry/lab.h"

#include <cmath>

namespace vantrel {

double delta_h(const Lab &first, const Lab &second, bool round)
{
    const Lch lch1 = lch_from_lab(round ? rounded(first) : first);
    const Lch lch2 = lch_from_lab(round ? rounded(second) : second);
    const double dH = sqrt(std::fabs(square(second.a - first.a) + square(second.b - first.b) -
                                     square(lch2.C - lch1.C)));
    double dh = lch2.h - lch1.h;
    if (dh > 180)
        dh -= 360;
    if (dh < -180)
        dh += 360;
    return dh < 0 ? -dH : dH;
}

} // namespace vantrel
