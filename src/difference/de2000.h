#pragma once

#include "base/elementary.h"
#include "base/numeric.h"
#include "base/spectrum.h"

namespace vantrel {

inline constexpr double kPow25To7 = 6103515625;

/// The parametric factors of CIEDE2000.
struct Factors {
    double kL, kC, kH;
};

/// True for a not-a-number as well.
template <class V> auto is_zero(V value, double tolerance) { return !(abs(value) > tolerance); }

template <class V> V degrees(V radians)
{
    return select(radians < 0, radians + 6.283185307179586, radians) * 57.29577951308232;
}

template <class V> V radians(V degrees) { return degrees * 0.017453292519943295; }

namespace de2000 {

inline constexpr double kTolerance = 1e-5;

template <class V> V hue(V a, V b)
{
    return select(is_zero(b, kTolerance) & is_zero(a, kTolerance), 0, degrees(atan2(b, a)));
}

// Hues of opposite colours are 180 degrees apart but for the rounding of two arc tangents; that
// noise must not decide which way round the circle the difference is taken.
inline constexpr double kHalfTurn = 180 + 1e-11;

template <class V> V hue_difference(V h1, V h2)
{
    const V dh = h2 - h1;
    return select(abs(dh) <= kHalfTurn, dh, select(dh > 0, dh - 360, dh + 360));
}

template <class V> V mean_hue(V h1, V h2)
{
    const V sum = h1 + h2;
    const V opposite = select(sum < 360, (sum + 360) / 2, (sum - 360) / 2);
    return select(abs(h1 - h2) <= kHalfTurn, sum / 2, opposite);
}

/// C^7 / (C^7 + 25^7)
template <class V> V chroma_share(V C, double pow25_7)
{
    const V C2 = C * C;
    const V C7 = C2 * C2 * C2 * C;
    return C7 / (C7 + pow25_7);
}

} // namespace de2000

/// CIEDE2000 (CIE 142, ISO/CIE 11664-6); pow25_7 is 25^7.
template <class Lab>
auto delta_e2000(const Lab &first, const Lab &second, const Factors &k, double pow25_7)
{
    using namespace de2000;
    using V = decltype(Lab::L);
    const V C1 = sqrt(square(first.a) + square(first.b));
    const V C2 = sqrt(square(second.a) + square(second.b));
    const V G = 0.5 * (1 - sqrt(chroma_share((C1 + C2) / 2, pow25_7)));
    const V a1p = (1 + G) * first.a;
    const V a2p = (1 + G) * second.a;
    const V C1p = sqrt(square(a1p) + square(first.b));
    const V C2p = sqrt(square(a2p) + square(second.b));
    const auto [h1p, h2p] =
        side_by_side([](auto a, auto b) { return hue(a, b); }, a1p, a2p, first.b, second.b);
    const auto neutral = is_zero(C1p * C2p, kTolerance);

    const V dLp = second.L - first.L;
    const V dCp = C2p - C1p;
    const V dhp = select(neutral, 0, hue_difference(h1p, h2p));

    const V Lp = (first.L + second.L) / 2;
    const V Cp = (C1p + C2p) / 2;
    const V hp = select(neutral, h1p + h2p, mean_hue(h1p, h2p));
    const auto cosine = [](auto angle) { return cos(radians(angle)); };
    const auto [cos1, cos2] = side_by_side(cosine, hp - 30, 2 * hp);
    const auto [cos3, cos4] = side_by_side(cosine, 3 * hp + 6, 4 * hp - 63);
    const V T = 1 - 0.17 * cos1 + 0.24 * cos2 + 0.32 * cos3 - 0.20 * cos4;
    const V SL = 1 + 0.015 * square(Lp - 50) / sqrt(20 + square(Lp - 50));
    const V SC = 1 + 0.045 * Cp;
    const V SH = 1 + 0.015 * Cp * T;
    const V dTheta = 30 * exp(-square((hp - 275) / 25));
    const auto [half_sine, rotation] =
        side_by_side([](auto angle) { return sin(radians(angle)); }, dhp / 2, 2 * dTheta);
    const V dHp = 2 * sqrt(C1p * C2p) * half_sine;
    const V RC = 2 * sqrt(chroma_share(Cp, pow25_7));
    const V RT = -rotation * RC;

    const V tL = dLp / (k.kL * SL);
    const V tC = dCp / (k.kC * SC);
    const V tH = dHp / (k.kH * SH);
    return sqrt(square(tL) + square(tC) + square(tH) + RT * tC * tH);
}

} // namespace vantrel
