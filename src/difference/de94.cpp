#include "difference/de94.h"

#include "base/numeric.h"

#include <cmath>

namespace vantrel {

double delta_e94(const Lab &sample, const Lab &reference, double kL, double kC)
{
    const double dL = sample.L - reference.L;
    const double da = sample.a - reference.a;
    const double db = sample.b - reference.b;
    const double Cr = std::sqrt(square(reference.a) + square(reference.b));
    const double dC = std::sqrt(square(sample.a) + square(sample.b)) - Cr;
    const double dH = std::sqrt(std::fabs(square(da) + square(db) - square(dC)));
    const double SC = 1 + 0.045 * Cr;
    const double SH = 1 + 0.015 * Cr;
    return std::sqrt(square(dL / kL) + square(dC / (kC * SC)) + square(dH / SH));
}

} // namespace vantrel
