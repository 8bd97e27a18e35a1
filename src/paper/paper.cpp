// The exported paper measures.
#include "vantrel.h"

#include "base/require.h"
#include "colorimetry/tristimulus.h"
#include "paper/brightness.h"
#include "paper/metamerism.h"
#include "paper/whiteness.h"

using namespace vantrel;

int ReflToBrightness(const double *refl, double *result)
{
    VANTREL_REQUIRE(result, "pBrightness");
    VANTREL_REQUIRE(refl, "Refl");
    *result = brightness(spectrum(refl));
    return 1;
}

int Metamerism(const double *standard, const double *sample, ILLUM_OBS illumObs1,
               ILLUM_OBS illumObs2, double *result)
{
    VANTREL_REQUIRE(result, "pMetamerism");
    VANTREL_REQUIRE(standard, "StdRefls");
    VANTREL_REQUIRE(sample, "SampRefls");
    VANTREL_REQUIRE(is_illum_obs(illumObs1) && is_illum_obs(illumObs2), "0");
    *result = metamerism(spectrum(standard), spectrum(sample), illumObs1, illumObs2);
    return 1;
}

static int store_whiteness(const Yxy &colour, ILLUM_OBS illum_obs, double *result)
{
    const auto index = whiteness(colour, illum_obs);
    *result = index.value_or(-999);
    return index ? 1 : 0;
}

int ReflToWhiteE313_98(const double *refl, ILLUM_OBS illumObs, double *result)
{
    VANTREL_REQUIRE(refl && result, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    const auto colour = yxy_from_xyz(xyz_from_spectrum(spectrum(refl), illumObs));
    return colour ? store_whiteness(*colour, illumObs, result) : 0;
}

int CIEYxyToWhiteE313_98(const double *Yxy, ILLUM_OBS illumObs, double *result)
{
    VANTREL_REQUIRE(Yxy && result, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    return store_whiteness({Yxy[0], Yxy[1], Yxy[2]}, illumObs, result);
}
