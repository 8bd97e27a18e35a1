#include "difference/cmc.h"

#include "base/numeric.h"
#include "colorimetry/lab.h"
#include "difference/cie76.h"

#include <cmath>

namespace vantrel {

double delta_e_cmc(const Lab &sample, const Lab &reference, double l, double c, bool round)
{
    const auto [L2, C2, h2] = lch_from_lab(round ? rounded(reference) : reference);
    const double SL = L2 > 16 ? 0.040975 * L2 / (1 + 0.01765 * L2) : 0.511;
    const double SC = 0.0638 * C2 / (1 + 0.0131 * C2) + 0.638;
    const double C4 = C2 * C2 * C2 * C2;
    const double F = std::sqrt(C4 / (C4 + 1900));
    const double T = 164 < h2 && h2 < 345 ? 0.56 + std::fabs(0.2 * std::cos((168 + h2) * kPi / 180))
                                          : 0.36 + std::fabs(0.4 * std::cos((35 + h2) * kPi / 180));
    const double SH = SC * (F * T + 1 - F);

    const double dL = sample.L - reference.L;
    const double dC = chroma(round ? rounded(sample) : sample) - C2;
    const double dE = delta_e76(sample, reference);
    const double dH = std::sqrt(std::fabs(square(dE) - square(dL) - square(dC)));
    return std::sqrt(square(dL / (l * SL)) + square(dC / (c * SC)) + square(dH / SH));
}

} // namespace vantrel
