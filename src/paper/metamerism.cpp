#include "paper/metamerism.h"

#include "colorimetry/lab.h"
#include "difference/cie76.h"

namespace vantrel {

static double delta_e76(Spectrum standard, Spectrum sample, ILLUM_OBS illum_obs)
{
    return delta_e76(lab_from_spectrum(sample, illum_obs), lab_from_spectrum(standard, illum_obs));
}

double metamerism(Spectrum standard, Spectrum sample, ILLUM_OBS illum_obs1, ILLUM_OBS illum_obs2)
{
    return delta_e76(standard, sample, illum_obs1) + delta_e76(standard, sample, illum_obs2);
}

} // namespace vantrel
