#include "print/dot_area.h"

#include "base/elementary.h"
#include "print/patches.h"

namespace vantrel {

double tint_density(double Ds, double dot_area, double n)
{
    const double a = dot_area / 100;
    return -0.4342945 * n * log(a * exp10(-Ds / n) - a + 1);
}

std::optional<double> dot_area(Spectrum solid, Spectrum tint, Paper paper, int status, int response,
                               double n)
{
    const auto densities = patch_densities({solid, tint}, paper, status, response);
    if (!densities || n == 0)
        return std::nullopt;
    const auto [Ds, Dt, unused] = *densities;
    return dot_area(Ds, Dt, n);
}

std::optional<double> dot_gain(Spectrum solid, Spectrum tint, Paper paper, int status, int response,
                               double n, int nominal)
{
    const auto area = dot_area(solid, tint, paper, status, response, n);
    if (!area)
        return std::nullopt;
    return dot_gain(*area, nominal);
}

} // namespace vantrel
