#include "density/contrast.h"

#include <cmath>

namespace vantrel {
namespace {

double density_of(double refl) { return refl == 0 ? 100 : std::log10(100 / refl); }

/// 100 / 10^(Ds + k (Ds - Dp))
double adjusted(double refl, double paper)
{
    const double sample_density = density_of(refl);
    const double above_paper = sample_density - density_of(paper);
    const double gain = above_paper > 0.5 ? 1 : 2;
    return 100 / std::pow(10, sample_density + gain * above_paper);
}

/// A sample on a paper, as they are measured: the adjusted reflectance stays of ordinary size.
bool is_ordinary(double refl, double paper)
{
    return refl > 1e-3 && refl < 200 && paper > 1 && paper < 200;
}

// With Ds = log10(100 / R) and Ds - Dp = log10(P / R) that is R (R / P)^k. What is not ordinary, or
// too near to the step at a density of 0.5, stays with the logarithms.
double roughly_adjusted(double refl, double paper)
{
    constexpr double kStep = 0.31622776601683794; // 10^-0.5
    const double ratio = refl / paper;
    if (!is_ordinary(refl, paper) || std::fabs(ratio - kStep) < 1e-12)
        return adjusted(refl, paper);
    return ratio < kStep ? refl * ratio : refl * ratio * ratio;
}

} // namespace

Bands adjusted_for_paper(Spectrum refl, Spectrum paper)
{
    Bands result;
    for (int i = 0; i < kBands; ++i)
        result[i] = adjusted(refl[i], paper[i]);
    return result;
}

Bands roughly_adjusted_for_paper(Spectrum refl, Spectrum paper)
{
    Bands result;
    for (int i = 0; i < kBands; ++i)
        result[i] = roughly_adjusted(refl[i], paper[i]);
    return result;
}

} // namespace vantrel
