#pragma once

#include "colorimetry/lab.h"
#include "difference/cie76.h"

namespace vantrel {

/// CMC(l:c) (ISO 105-J03). Chroma and hue are those of rounded a* and b*, or of a* and b* as they
/// are.
template <class Lab>
auto delta_e_cmc(const Lab &sample, const Lab &reference, double l, double c, bool round = true)
{
    using V = decltype(Lab::L);
    const auto [L2, C2, h2] = lch_from_lab(round ? rounded(reference) : reference);
    const V SL = select(L2 > 16, 0.040975 * L2 / (1 + 0.01765 * L2), 0.511);
    const V SC = 0.0638 * C2 / (1 + 0.0131 * C2) + 0.638;
    const V C4 = C2 * C2 * C2 * C2;
    const V F = sqrt(C4 / (C4 + 1900));
    const auto greenish = (164 < h2) & (h2 < 345);
    const V cosine = cos((select(greenish, 168, 35) + h2) * kPi / 180);
    const V T = select(greenish, 0.56, 0.36) + abs(select(greenish, 0.2, 0.4) * cosine);
    const V SH = SC * (F * T + 1 - F);

    const V dL = sample.L - reference.L;
    const V dC = chroma(round ? rounded(sample) : sample) - C2;
    const V dE = delta_e76(sample, reference);
    const V dH = sqrt(abs(square(dE) - square(dL) - square(dC)));
    return sqrt(square(dL / (l * SL)) + square(dC / (c * SC)) + square(dH / SH));
}

} // namespace vantrel
