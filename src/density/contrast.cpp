#include "density/contrast.h"

#include <cmath>

namespace vantrel {
namespace {

double density_of(double refl) { return refl == 0 ? 100 : std::log10(100 / refl); }

/// The definition: 100 / 10^(Ds + k (Ds - Dp)).
double by_densities(double refl, double paper)
{
    const double sample_density = density_of(refl);
    const double above_paper = sample_density - density_of(paper);
    const double gain = above_paper > 0.5 ? 1 : 2;
    return 100 / std::pow(10, sample_density + gain * above_paper);
}

/// Reflectances in percent whose densities lose less than 1e-13 to rounding.
bool is_ordinary(double refl) { return refl > 1e-6 && refl < 1e6; }

// With Ds = log10(100 / R) and Ds - Dp = log10(P / R), the definition is R (R / P)^k: one division
// in place of two logarithms and a power. What remains for the logarithms is a value that is not
// ordinary, and a density too near to the step at 0.5 for rounding not to matter.
double adjusted(double refl, double paper)
{
    constexpr double kStep = 0.31622776601683794; // 10^-0.5
    const double ratio = refl / paper;
    if (!is_ordinary(refl) || !is_ordinary(paper) || std::fabs(ratio - kStep) < 1e-12)
        return by_densities(refl, paper);
    return ratio < kStep ? refl * ratio : refl * ratio * ratio;
}

} // namespace

std::array<double, kBands> adjusted_for_paper(Spectrum refl, Spectrum paper)
{
    std::array<double, kBands> result;
    for (int i = 0; i < kBands; ++i)
        result[i] = adjusted(refl[i], paper[i]);
    return result;
}

} // namespace vantrel
