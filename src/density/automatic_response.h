#pragma once

#include "base/spectrum.h"
#include "colorimetry/lab.h"
#include "density/achromatic.h"
#include "density/weighted.h"

namespace vantrel {

/// The response (or wavelength, or band) that reads this ink.
int automatic_response(Spectrum refl, int status, Paper paper);

// Over a paper the contrast is exaggerated by adjusted_for_paper(). For an ISO status the same but
// for the last digits (1e-14 of a reflectance) is had in a fraction of the time: with Ds =
// log10(100 / R) and Ds - Dp = log10(P / R) it is R (R / P)^k.

inline constexpr double kAdjustmentStep = 0.31622776601683794; // 10^-0.5, where k falls to 1

template <class V> V roughly_adjusted(V refl, V ratio)
{
    return select(ratio < kAdjustmentStep, refl * ratio, refl * ratio * ratio);
}

/// A sample on a paper, as they are measured, and not too near to the step: the adjusted
/// reflectance stays of ordinary size. What is not stays with the logarithms.
template <class V> auto is_roughly_adjusted(V refl, V paper, V ratio)
{
    return (refl > 1e-3) & (refl < 200) & (paper > 1) & (paper < 200) &
           (abs(ratio - kAdjustmentStep) >= 1e-12);
}

/// A response, and whether a change in the last digits of the spectrum could not give another: the
/// colour keeps its distance from the achromatic line, and the largest density from the others.
template <class V> struct FirmResponse {
    V response;
    decltype(V() < V()) firm;
};

/// The response of an ISO status to a spectrum of this colour.
template <class V>
FirmResponse<V> firm_response(const BandsOf<V> &refl, const LabOf<V> &lab, int status)
{
    constexpr double kLightnessMargin = 1e-9;
    constexpr double kChromaMargin = 0.02; // more than to round both a* and b* can change it
    constexpr double kDensityMargin = 1e-6;
    const AchromaticLine &line = achromatic_line();
    const V C = chroma(lab);
    const auto chromatic = line.is_chromatic(lab.L, C);
    FirmResponse<V> result = {VISUAL_RESPONSE, C >= 0}; // no if C is not a number
    for (const double dL : {-kLightnessMargin, kLightnessMargin})
        for (const double dC : {-kChromaMargin, kChromaMargin})
            result.firm = result.firm & !(line.is_chromatic(lab.L + dL, C + dC) ^ chromatic);
    if (!any(chromatic))
        return result;

    V densities[NUM_RESPONSES] = {};
    for (const int r : responses_of(status))
        densities[r] = density_of_sum(weighted_sum(refl, weights_of(status, r)));
    V largest = 0;
    for (int r = VISUAL_RESPONSE; r < NUM_RESPONSES; ++r) {
        result.response = select(chromatic & (densities[r] > largest), r, result.response);
        largest = larger(largest, densities[r]);
    }
    for (int r = VISUAL_RESPONSE; r < NUM_RESPONSES; ++r)
        result.firm = result.firm & !(chromatic & (result.response != r) &
                                      (densities[r] > largest - kDensityMargin));
    return result;
}

} // namespace vantrel
