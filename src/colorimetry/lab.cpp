#include "colorimetry/lab.h"

#include "colorimetry/illuminants.h"
#include "colorimetry/tristimulus.h"

namespace vantrel {

double lightness(double y_ratio)
{
    return y_ratio <= kLinearLimit ? kLightnessSlope * y_ratio : 116 * cube_root(y_ratio) - 16;
}

Lab lab_from_lch(const Lch &lch)
{
    const double angle = lch.h * kPi / 180;
    return {lch.L, cos(angle) * lch.C, sin(angle) * lch.C};
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
