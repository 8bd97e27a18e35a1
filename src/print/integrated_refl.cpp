#include "print/integrated_refl.h"

#include "base/elementary.h"
#include "density/den_weight.h"

namespace vantrel {

double integrated_refl(double density, int status, int response)
{
    const auto peak = static_cast<double>(profile(weights_of(status, response)).peak_weight);
    return 10000000 / (peak * exp10(density));
}

} // namespace vantrel
