#pragma once

#include "base/lanes.h"

#include <cmath>

namespace vantrel {

inline constexpr double kPi = 3.141592653589793;

template <class V> V square(V x) { return x * x; }

/// The integer part, toward zero; a zero result is +0. From 2^52 on every double is whole, so that
/// those (and infinities and not-a-numbers) are returned as they are.
inline double whole_part(double x)
{
    return std::fabs(x) < 0x1p52 ? static_cast<double>(static_cast<std::int64_t>(x)) : x;
}
#ifdef __GNUC__
template <int N> Lanes<N> whole_part(Lanes<N> x)
{
    using V = Lanes<N>;
    const V size = abs(x), nearest = (size + 0x1p52) - 0x1p52;
    const V whole = select(nearest > size, nearest - 1, nearest);
    return select(size < 0x1p52, select(x < 0, 0 - whole, whole), x);
}
#endif

} // namespace vantrel
