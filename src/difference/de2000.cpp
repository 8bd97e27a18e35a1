#include "difference/de2000.h"

#include "base/numeric.h"

namespace vantrel {
namespace {

constexpr double kTolerance = 1e-5;

double hue(double a, double b)
{
    return is_zero(b, kTolerance) && is_zero(a, kTolerance) ? 0 : degrees(std::atan2(b, a));
}

// Hues of opposite colours are 180 degrees apart but for the rounding of two arc tangents; that
// noise must not decide which way round the circle the difference is taken.
constexpr double kHalfTurn = 180 + 1e-11;

double hue_difference(double h1, double h2)
{
    const double dh = h2 - h1;
    if (std::fabs(dh) <= kHalfTurn)
        return dh;
    return dh > 0 ? dh - 360 : dh + 360;
}

double mean_hue(double h1, double h2)
{
    const double sum = h1 + h2;
    if (std::fabs(h1 - h2) <= kHalfTurn)
        return sum / 2;
    return sum < 360 ? (sum + 360) / 2 : (sum - 360) / 2;
}

/// C^7 / (C^7 + 25^7)
double chroma_share(double C, double pow25_7)
{
    const double C2 = C * C;
    const double C7 = C2 * C2 * C2 * C;
    return C7 / (C7 + pow25_7);
}

} // namespace

double delta_e2000(const Lab &first, const Lab &second, const Factors &k, double pow25_7)
{
    const double C1 = std::sqrt(square(first.a) + square(first.b));
    const double C2 = std::sqrt(square(second.a) + square(second.b));
    const double G = 0.5 * (1 - std::sqrt(chroma_share((C1 + C2) / 2, pow25_7)));
    const double a1p = (1 + G) * first.a;
    const double a2p = (1 + G) * second.a;
    const double C1p = std::sqrt(square(a1p) + square(first.b));
    const double C2p = std::sqrt(square(a2p) + square(second.b));
    const double h1p = hue(a1p, first.b);
    const double h2p = hue(a2p, second.b);
    const bool neutral = is_zero(C1p * C2p, kTolerance);

    const double dLp = second.L - first.L;
    const double dCp = C2p - C1p;
    const double dhp = neutral ? 0 : hue_difference(h1p, h2p);
    const double dHp = 2 * std::sqrt(C1p * C2p) * std::sin(radians(dhp / 2));

    const double Lp = (first.L + second.L) / 2;
    const double Cp = (C1p + C2p) / 2;
    const double hp = neutral ? h1p + h2p : mean_hue(h1p, h2p);
    const double T = 1 - 0.17 * std::cos(radians(hp - 30)) + 0.24 * std::cos(radians(2 * hp)) +
                     0.32 * std::cos(radians(3 * hp + 6)) - 0.20 * std::cos(radians(4 * hp - 63));
    const double SL = 1 + 0.015 * square(Lp - 50) / std::sqrt(20 + square(Lp - 50));
    const double SC = 1 + 0.045 * Cp;
    const double SH = 1 + 0.015 * Cp * T;
    const double dTheta = 30 * std::exp(-square((hp - 275) / 25));
    const double RC = 2 * std::sqrt(chroma_share(Cp, pow25_7));
    const double RT = -std::sin(radians(2 * dTheta)) * RC;

    const double tL = dLp / (k.kL * SL);
    const double tC = dCp / (k.kC * SC);
    const double tH = dHp / (k.kH * SH);
    return std::sqrt(square(tL) + square(tC) + square(tH) + RT * tC * tH);
}

} // namespace vantrel
