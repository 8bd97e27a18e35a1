#include "colorimetry/lab.h"

#include "base/numeric.h"
#include "colorimetry/illuminants.h"
#include "colorimetry/tristimulus.h"

#include <cmath>

namespace vantrel {

double cube_root(double t) { return std::exp(0.3333333333 * std::log(t)); }

static double f(double t)
{
    return t <= kLinearLimit ? kRootSlope * t + 0.137931034 : cube_root(t);
}

Lab lab_from_xyz(const Xyz &xyz, const Xyz &white)
{
    const double yr = xyz.y / white.y;
    const double fx = f(xyz.x / white.x);
    const double fy = f(yr);
    const double fz = f(xyz.z / white.z);
    const double L = yr <= kLinearLimit ? kLightnessSlope * yr : 116 * fy - 16;
    return {L, 500 * (fx - fy), 200 * (fy - fz)};
}

double lightness(double y_ratio)
{
    return y_ratio <= kLinearLimit ? kLightnessSlope * y_ratio : 116 * cube_root(y_ratio) - 16;
}

static double two_decimals(double v)
{
    return whole_part(v < 0 ? 100 * v - 0.5 : 100 * v + 0.5) / 100;
}

Lab rounded(const Lab &lab) { return {lab.L, two_decimals(lab.a), two_decimals(lab.b)}; }

static double off_axis(double a) { return a == 0 ? 0.000001 : a; }

double chroma(const Lab &lab) { return std::sqrt(square(off_axis(lab.a)) + square(lab.b)); }

Lch lch_from_lab(const Lab &lab)
{
    double h = std::atan2(lab.b, off_axis(lab.a)) / kPi * 180;
    if (h < 0)
        h += 360;
    return {lab.L, chroma(lab), h};
}

Lab lab_from_lch(const Lch &lch)
{
    const double angle = lch.h * kPi / 180;
    return {lch.L, std::cos(angle) * lch.C, std::sin(angle) * lch.C};
}

Lab lab_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs)
{
    return lab_from_xyz(xyz_from_spectrum(refl, illum_obs), white_point(illum_obs));
}

Lch lch_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs)
{
    return lch_from_lab(rounded(lab_from_spectrum(refl, illum_obs)));
}

} // namespace vantrel
