#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Two points of the line over L* up to which a chroma counts as neutral.
struct AchromaticPoints {
    double L1, L2, C1, C2;
};

const AchromaticPoints &achromatic_points();

/// False, with the line as it was, for two points that no finite line goes through.
bool set_achromatic_points(const AchromaticPoints &through);

/// Whether C* lies above the line.
bool is_chromatic(double L, double C);

} // namespace vantrel
