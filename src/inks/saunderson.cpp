#include "inks/saunderson.h"

namespace vantrel {

double saunderson(double refl, double k1, double k2)
{
    const double r = refl / 100;
    return (r - k1) / (1 - k1 - k2 + k2 * r) * 100;
}

double unsaunderson(double refl, double k1, double k2)
{
    if (refl < kBlack)
        return refl;
    const double r = refl / 100;
    return ((1 - k1 - k2) + k1 / r) / (1 / r - k2) * 100;
}

} // namespace vantrel
