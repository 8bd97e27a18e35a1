#pragma once

#include <cmath>
#include <cstdint>

namespace vantrel {

inline constexpr double kPi = 3.141592653589793;

inline double square(double x) { return x * x; }

/// The integer part, toward zero; a zero result is +0. From 2^52 on every double is whole, so that
/// those (and infinities and not-a-numbers) are returned as they are.
inline double whole_part(double x)
{
    return std::fabs(x) < 0x1p52 ? static_cast<double>(static_cast<std::int64_t>(x)) : x;
}

} // namespace vantrel
