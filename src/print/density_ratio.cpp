#include "print/density_ratio.h"

#include "base/lanes.h"
#include "base/numeric.h"
#include "density/automatic_response.h"
#include "density/density.h"

namespace vantrel {

static constexpr double kLargestRatio = 1000;
static constexpr double kBlackKS = 1000; ///< K/S of a reflectance of 0

double density_ratio(Spectrum reference, Spectrum sample, int status)
{
    const int response = automatic_response(reference, status, std::nullopt);
    const double Dref = density(reference, std::nullopt, status, response).value_or(0);
    const double Dsmp = density(sample, std::nullopt, status, response).value_or(0);
    if (Dref == 0)
        return Dsmp > 0 ? kLargestRatio : 0;
    const double ratio = 100 * (Dsmp / Dref);
    return ratio > kLargestRatio ? kLargestRatio : ratio;
}

double at_equivalent_density(double refl, double ratio)
{
    if (ratio <= 0)
        return refl;
    const double R = refl / 100;
    const double ks = R == 0 ? kBlackKS : square(1 - R) / (2 * R) * 100 / ratio;
    const double root = sqrt(square(ks) + 2 * ks);
    // Beyond black the difference of two large numbers has lost its digits; this is its equal.
    return 100 * (ks > kBlackKS ? 1 / (1 + ks + root) : 1 + ks - root);
}

} // namespace vantrel
