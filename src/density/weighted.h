#pragma once

#include "base/elementary.h"
#include "base/spectrum.h"
#include "density/den_weight.h"

#include <type_traits>

namespace vantrel {

/// Σ R w in order of the bands.
template <class Refl, class Weights> auto weighted_sum(const Refl &refl, const Weights &weights)
{
    std::remove_cvref_t<decltype(refl[0])> sum = 0;
    for (int i = 0; i < kBands; ++i)
        sum += refl[i] * static_cast<double>(weights[i]);
    return sum;
}

/// ISO 5-4: -log10 of a filter-weighted reflectance factor, at most 5. A weight row sums to 100 000
/// and a spectrum is in percent. Subtracted from 0 rather than negated, so that a perfect white has
/// 0 and not -0.
template <class V> V density_of_sum(V sum)
{
    constexpr double kToFactor = 1e-7, kLeastFactor = 1e-5;
    return 0 - log10(larger(sum * kToFactor, V(kLeastFactor)));
}

/// Σ R w, w the filter of the status and response.
double weighted_sum(Spectrum refl, int status, int response);

/// Filter-weighted reflectance in percent, at least 0.001.
double weighted_reflectance(Spectrum refl, int status, int response);

/// The density in a filter; less that of the paper.
double weighted_density(Spectrum refl, Paper paper, int status, int response);

} // namespace vantrel
