#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// A pair of doubles that one instruction of any processor multiplies.
#ifdef __GNUC__
using Pair = double __attribute__((vector_size(16)));
#else
struct Pair {
    double first, second;

    constexpr double operator[](int i) const { return i == 0 ? first : second; }
    constexpr Pair &operator+=(const Pair &p)
    {
        return *this = {first + p.first, second + p.second};
    }
};
constexpr Pair operator*(double v, const Pair &p) { return {v * p.first, v * p.second}; }
constexpr Pair operator/(const Pair &p, double v) { return {p.first / v, p.second / v}; }
#endif

/// The weights of a band side by side: X and Y, Z and an idle lane.
struct alignas(32) BandWeights {
    Pair xy, z;
};
using TristimulusWeights = const BandWeights[kBands];

/// The weights of a combination, in 1/100 000.
TristimulusWeights &tristimulus_weights(ILLUM_OBS illum_obs);

} // namespace vantrel
