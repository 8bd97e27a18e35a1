#include "density/weighted.h"

#include <algorithm>

namespace vantrel {

static constexpr double kToPercent = 1e-5f;
static constexpr double kLeastPercent = 0.0009999999310821295;
static_assert(kToPercent == 9.999999747378752e-6);

double weighted_sum(Spectrum refl, int status, int response)
{
    return weighted_sum(refl, weights_of(status, response));
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
    const auto [density, paper_density] =
        side_by_side([](auto v) { return density_of_sum(v); }, sum, paper_sum);
    return density - paper_density;
}

} // namespace vantrel
