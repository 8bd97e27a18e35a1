#include "difference/din6172.h"

#include "colorimetry/lab.h"
#include "difference/cie76.h"

namespace vantrel {

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
