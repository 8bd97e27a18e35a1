#include "difference/cielab.h"

#include "base/numeric.h"
#include "colorimetry/lab.h"

#include <cmath>

namespace vantrel {

double delta_e76(const Lab &first, const Lab &second)
{
    return std::sqrt(square(first.L - second.L) + square(first.a - second.a) +
                     square(first.b - second.b));
}

double delta_h(const Lab &first, const Lab &second)
{
    const Lch lch1 = lch_from_lab(rounded(first));
    const Lch lch2 = lch_from_lab(rounded(second));
    const double dH = std::sqrt(std::fabs(square(second.a - first.a) + square(second.b - first.b) -
                                          square(lch2.C - lch1.C)));
    double dh = lch2.h - lch1.h;
    if (dh > 180)
        dh -= 360;
    if (dh < -180)
        dh += 360;
    return dh < 0 ? -dH : dH;
}

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

double delta_e_cmc(const Lab &sample, const Lab &reference, double l, double c)
{
    const auto [L2, C2, h2] = lch_from_lab(rounded(reference));
    const double SL = L2 > 16 ? 0.040975 * L2 / (1 + 0.01765 * L2) : 0.511;
    const double SC = 0.0638 * C2 / (1 + 0.0131 * C2) + 0.638;
    const double C4 = C2 * C2 * C2 * C2;
    const double F = std::sqrt(C4 / (C4 + 1900));
    const double T = 164 < h2 && h2 < 345 ? 0.56 + std::fabs(0.2 * std::cos((168 + h2) * kPi / 180))
                                          : 0.36 + std::fabs(0.4 * std::cos((35 + h2) * kPi / 180));
    const double SH = SC * (F * T + 1 - F);

    const double dL = sample.L - reference.L;
    const double dC = chroma(rounded(sample)) - C2;
    const double dE = delta_e76(sample, reference);
    const double dH = std::sqrt(std::fabs(square(dE) - square(dL) - square(dC)));
    return std::sqrt(square(dL / (l * SL)) + square(dC / (c * SC)) + square(dH / SH));
}

double metamerism_index(Spectrum first, Spectrum second, ILLUM_OBS illum_obs1, ILLUM_OBS illum_obs2)
{
    const Lab lab11 = lab_from_spectrum(first, illum_obs1);
    const Lab lab21 = lab_from_spectrum(second, illum_obs1);
    const Lab lab12 = lab_from_spectrum(first, illum_obs2);
    const Lab lab22 = lab_from_spectrum(second, illum_obs2);
    const Lab under1 = {lab21.L - lab11.L, lab21.a - lab11.a, lab21.b - lab11.b};
    const Lab under2 = {lab22.L - lab12.L, lab22.a - lab12.a, lab22.b - lab12.b};
    return delta_e76(under1, under2);
}

} // namespace vantrel
