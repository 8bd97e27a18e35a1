#pragma once

#include "base/elementary.h"
#include "base/numeric.h"
#include "base/spectrum.h"

namespace vantrel {

// CIE 1976 (L*a*b*), CIE 15, with the constants as decimals.
inline constexpr double kLinearLimit = 0.008856; ///< up to this ratio the cube root is a line
inline constexpr double kRootSlope = 7.787;
inline constexpr double kLightnessSlope = 903.292; ///< 116 · 7.787

/// t^0.3333333333.
template <class V> V cube_root(V t) { return near_cube_root(t, 0.3333333333); }

/// The function f of CIE 15.
template <class V> V lab_root(V t)
{
    return select(t <= kLinearLimit, kRootSlope * t + 0.137931034, cube_root(t));
}

template <class V> LabOf<V> lab_from_xyz(const XyzOf<V> &xyz, const Xyz &white)
{
    const V yr = xyz.y / white.y;
    const auto [fx, fz] =
        side_by_side([](auto t) { return lab_root(t); }, xyz.x / white.x, xyz.z / white.z);
    const V fy = lab_root(yr);
    const V L = select(yr <= kLinearLimit, kLightnessSlope * yr, 116 * fy - 16);
    return {L, 500 * (fx - fy), 200 * (fy - fz)};
}

/// L* of Y/Yn.
double lightness(double y_ratio);

template <class V> V two_decimals(V v)
{
    return whole_part(select(v < 0, 100 * v - 0.5, 100 * v + 0.5)) / 100;
}

/// a* and b* rounded to two decimals, halves away from zero.
template <class Lab> Lab rounded(const Lab &lab)
{
    return {lab.L, two_decimals(lab.a), two_decimals(lab.b)};
}

/// An a* of 0 counts as 0.000001.
template <class V> V off_axis(V a) { return select(a == 0, V(0.000001), a); }

/// The chroma of a colour as it is.
template <class Lab> auto chroma(const Lab &lab)
{
    return sqrt(square(off_axis(lab.a)) + square(lab.b));
}

/// L*C*h of a colour as it is.
template <class Lab> auto lch_from_lab(const Lab &lab)
{
    const auto h = atan2(lab.b, off_axis(lab.a)) / kPi * 180;
    return LchOf<decltype(chroma(lab))>{lab.L, chroma(lab), select(h < 0, h + 360, h)};
}

Lab lab_from_lch(const Lch &lch);

/// The chains from a spectrum.
Lab lab_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs);
Lch lch_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs);

} // namespace vantrel
