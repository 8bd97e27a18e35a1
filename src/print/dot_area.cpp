#include "print/dot_area.h"

#include "print/patches.h"

#include <cmath>

namespace vantrel {

// The light that a density absorbs.
static double absorptance(double density, double n) { return 1 - std::pow(10.0, -density / n); }

double dot_area(double Ds, double Dt, double n)
{
    const double solid = absorptance(Ds, n);
    return solid == 0 ? 100 : 100 * (absorptance(Dt, n) / solid);
}

double tint_density(double Ds, double dot_area, double n)
{
    const double a = dot_area / 100;
    return -0.4342945 * n * std::log(a * std::pow(10.0, -Ds / n) - a + 1);
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
    return *area >= nominal ? *area - nominal : 0;
}

} // namespace vantrel
