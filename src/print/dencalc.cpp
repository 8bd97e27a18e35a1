// The exported print attributes.
#include "vantrel.h"

#include "base/require.h"
#include "density/den_weight.h"
#include "density/density.h"
#include "density/hue_gray.h"
#include "print/contrast_trap.h"
#include "print/density_ratio.h"
#include "print/dot_area.h"
#include "print/integrated_refl.h"
#include "print/polarisation_intercept.h"

using namespace vantrel;

int DensityToDotArea(double solidDensity, double tintDensity, double nFactor, double *dotArea)
{
    VANTREL_REQUIRE(dotArea, "0");
    VANTREL_REQUIRE(nFactor != 0, "0");
    *dotArea = dot_area(solidDensity, tintDensity, nFactor);
    return 1;
}

int DensityFromDotArea(double solidDensity, double dotArea, double nFactor, double *tintDensity)
{
    if (!tintDensity || nFactor == 0)
        return 0;
    *tintDensity = tint_density(solidDensity, dotArea, nFactor);
    return 1;
}

int ReflToDotArea(const double *solid, const double *tint, const double *paper, int status,
                  int response, double nFactor, double *dotArea)
{
    VANTREL_REQUIRE(solid && tint && dotArea, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto result =
        dot_area(spectrum(solid), spectrum(tint), vantrel::paper(paper), status, response, nFactor);
    VANTREL_REQUIRE(result, "0");
    *dotArea = *result;
    return 1;
}

int ReflToDotGain(const double *solid, const double *tint, const double *paper, int status,
                  int response, double nFactor, int nominalDotArea, double *dotGain)
{
    VANTREL_REQUIRE(solid && tint && dotGain, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto result = dot_gain(spectrum(solid), spectrum(tint), vantrel::paper(paper), status,
                                 response, nFactor, nominalDotArea);
    VANTREL_REQUIRE(result, "0");
    *dotGain = *result;
    return 1;
}

int DensityToPrintContrast(double solidDensity, double tintDensity, double *contrast)
{
    if (!contrast)
        return 0;
    return store(print_contrast(solidDensity, tintDensity), contrast);
}

int ReflToPrintContrast(const double *solid, const double *tint, const double *paper, int status,
                        int response, double *contrast)
{
    VANTREL_REQUIRE(solid && tint && contrast, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    return store(
        print_contrast(spectrum(solid), spectrum(tint), vantrel::paper(paper), status, response),
        contrast);
}

int DensityToTrap(double overprintDensity, double secondDensity, double firstDensity, double *trap)
{
    if (!trap)
        return 0;
    return store(vantrel::trap(overprintDensity, secondDensity, firstDensity), trap);
}

int ReflToTrap(const double *second, const double *first, const double *overprint,
               const double *paper, int status, int response, double *trap)
{
    VANTREL_REQUIRE(second && first && overprint && trap, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    return store(vantrel::trap(spectrum(second), spectrum(first), spectrum(overprint),
                               vantrel::paper(paper), status, response),
                 trap);
}

int DensityToHueGray(double redDensity, double greenDensity, double blueDensity, double *grayness,
                     double *hueError)
{
    VANTREL_REQUIRE(grayness && hueError, "0");
    const HueGray result = hue_gray({{0, redDensity, greenDensity, blueDensity}});
    *grayness = result.grayness;
    *hueError = result.hue_error;
    return 1;
}

int ReflToHueGray(const double *refl, const double *paper, int status, double *grayness,
                  double *hueError)
{
    VANTREL_REQUIRE(refl && grayness && hueError, "0");
    VANTREL_REQUIRE(is_status(status) && status != SPECTRALX_STATUS, "0");
    const auto set = densities(spectrum(refl), vantrel::paper(paper), process_status(status));
    if (!set)
        return 9;
    const HueGray result = hue_gray(*set);
    *grayness = result.grayness;
    *hueError = result.hue_error;
    return 1;
}

int DensitytoIntegratedRefl(double density, int status, int response, double *refl)
{
    if (!refl || !(density > 0))
        return 0;
    VANTREL_REQUIRE(is_status(status) && status != SPECTRALX_STATUS, "0");
    VANTREL_REQUIRE(is_response(response) && response != VISUAL_RESPONSE, "0");
    *refl = integrated_refl(density, status, response);
    return 1;
}

int ReflToPolIntercept(const double *refl, double redDensity, double greenDensity,
                       double blueDensity, double *intercept)
{
    VANTREL_REQUIRE(refl && intercept, "0");
    store(polarisation_intercept(spectrum(refl), redDensity, greenDensity, blueDensity), intercept);
    return 1;
}

double DensityRatio(const double *reference, const double *sample, int status)
{
    return density_ratio(spectrum(reference), spectrum(sample), status);
}

int ColorAtEquivalentDensity(const double *reference, const double *sample, int status,
                             double *refl)
{
    const double ratio = density_ratio(spectrum(reference), spectrum(sample), status);
    for (int i = 0; i < kBands; ++i)
        refl[i] = at_equivalent_density(sample[i], ratio);
    return 1;
}
