// The exported CIE94 and the DIN 6172 metamerism index.
#include "vantrel.h"

#include "base/require.h"
#include "colorimetry/lab.h"
#include "difference/de94.h"
#include "difference/din6172.h"

using namespace vantrel;

int LabToDE94(const CIELABCOORD *sample, const CIELABCOORD *reference, double kL, double kC,
              double *deltaE)
{
    VANTREL_REQUIRE(sample && reference && deltaE, "0");
    *deltaE = delta_e94(*sample, *reference, kL, kC);
    return 1;
}

int CIELChToDE94(const CIELCHCOORD *sample, const CIELCHCOORD *reference, double kL, double kC,
                 double *deltaE)
{
    VANTREL_REQUIRE(sample && reference && deltaE, "0");
    *deltaE = delta_e94(lab_from_lch(*sample), lab_from_lch(*reference), kL, kC);
    return 1;
}

int ReflToDIN6172(const double *first, const double *second, int illumObs1, int illumObs2,
                  double *index)
{
    VANTREL_REQUIRE(first && second && index, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs1) && is_illum_obs(illumObs2), "0");
    *index = metamerism_index(spectrum(first), spectrum(second), static_cast<ILLUM_OBS>(illumObs1),
                              static_cast<ILLUM_OBS>(illumObs2));
    return 1;
}
