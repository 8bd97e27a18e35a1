#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Two points of the line over L* up to which a chroma counts as neutral.
struct AchromaticPoints {
    double L1, L2, C1, C2;
};

const AchromaticPoints &achromatic_points();

/// The two L* must differ.
void set_achromatic_points(const AchromaticPoints &points);

/// Whether C* lies above the line.
bool is_chromatic(double L, double C);

} // namespace vantrel
