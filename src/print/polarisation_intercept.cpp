#include "print/polarisation_intercept.h"

#include "base/elementary.h"
#include "density/automatic_response.h"
#include "density/weighted.h"

namespace vantrel {

std::optional<double> polarisation_intercept(Spectrum refl, double Dr, double Dg, double Db)
{
    const auto intercept = [&](int response, double density) {
        const double measured = weighted_sum(refl, E_STATUS, response) / 100;
        return (measured - 100000 * exp10(-density)) / 10;
    };
    switch (automatic_response(refl, E_STATUS, std::nullopt)) {
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
