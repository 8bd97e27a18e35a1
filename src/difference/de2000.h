#pragma once

#include "base/spectrum.h"

#include <cmath>

namespace vantrel {

inline constexpr double kPow25To7 = 6103515625;

/// The parametric factors of CIEDE2000.
struct Factors {
    double kL, kC, kH;
};

/// True for a not-a-number as well.
inline bool is_zero(double value, double tolerance) { return !(std::fabs(value) > tolerance); }

inline double degrees(double radians)
{
    return (radians < 0 ? radians + 6.283185307179586 : radians) * 57.29577951308232;
}

inline double radians(double degrees) { return degrees * 0.017453292519943295; }

/// CIEDE2000 (CIE 142, ISO/CIE 11664-6); pow25_7 is 25^7.
double delta_e2000(const Lab &first, const Lab &second, const Factors &k, double pow25_7);

} // namespace vantrel
