#include "density/weighted.h"

#include "density/den_weight.h"

#include <algorithm>
#include <cmath>

namespace vantrel {
namespace {

// A weight row sums to 100 000 and a spectrum is in percent.
constexpr double kToFactor = 1e-7;
constexpr double kToPercent = 1e-5f;
constexpr double kLeastFactor = 1e-5;
constexpr double kLeastPercent = 0.0009999999310821295;
static_assert(kToPercent == 9.999999747378752e-6);

// Subtracted from 0 rather than negated, so that a perfect white has 0 and not -0.
double density_of_sum(double sum)
{
    return 0 - std::log10(std::max(sum * kToFactor, kLeastFactor));
}

} // namespace

double weighted_sum(Spectrum refl, int status, int response)
{
    const Weights weights = weights_of(status, response);
    double sum = 0;
    for (int i = 0; i < kBands; ++i)
        sum += refl[i] * static_cast<double>(weights[i]);
    return sum;
}

double weighted_reflectance(Spectrum refl, int status, int response)
{
    return std::max(weighted_sum(refl, status, response) * kToPercent, kLeastPercent);
}

double weighted_density(Spectrum refl, Paper paper, int status, int response)
{
    if (!paper)
        return density_of_sum(weighted_sum(refl, status, response));
    // Both sums in one pass: the additions of the one run in the shadow of the other.
    const Weights weights = weights_of(status, response);
    double sum = 0, paper_sum = 0;
    for (int i = 0; i < kBands; ++i) {
        const double weight = static_cast<double>(weights[i]);
        sum += refl[i] * weight;
        paper_sum += (*paper)[i] * weight;
    }
    return density_of_sum(sum) - density_of_sum(paper_sum);
}

} // namespace vantrel
