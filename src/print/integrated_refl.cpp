#include "print/integrated_refl.h"

#include "density/den_weight.h"
#include "density/densities.h"
#include "density/density.h"

#include <cmath>

namespace vantrel {

double integrated_refl(double density, int status, int response)
{
    const auto peak = static_cast<double>(profile(weights_of(status, response)).peak_weight);
    return 10000000 / (peak * std::pow(10.0, density));
}

std::optional<double> polarisation_intercept(Spectrum refl, double Dr, double Dg, double Db)
{
    const auto intercept = [&](int response, double density) {
        const double measured = weighted_sum(refl, E_STATUS, response) / 100;
        return (measured - 100000 * std::pow(10.0, -density)) / 10;
    };
    switch (density_response(refl, E_STATUS, std::nullopt)) {
    case VISUAL_RESPONSE:
        return (intercept(RED_RESPONSE, Dr) + intercept(GREEN_RESPONSE, Dg) +
                intercept(BLUE_RESPONSE, Db)) /
               3;
    case RED_RESPONSE:
        return intercept(RED_RESPONSE, Dr);
    case GREEN_RESPONSE:
        return intercept(GREEN_RESPONSE, Dg);
    case BLUE_RESPONSE:
        return intercept(BLUE_RESPONSE, Db);
    default:
        return std::nullopt;
    }
}

} // namespace vantrel
