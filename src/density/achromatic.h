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

/// The line.
struct AchromaticLine {
    double slope, intercept;

    /// Whether C* lies above it.
    template <class V> auto is_chromatic(V L, V C) const { return C > slope * L + intercept; }
};
const AchromaticLine &achromatic_line();
inline bool is_chromatic(double L, double C) { return achromatic_line().is_chromatic(L, C); }

} // namespace vantrel
