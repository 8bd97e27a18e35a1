// The exported density weights, densities, density sets and settable bands.
#include "vantrel.h"

#include "base/require.h"
#include "density/automatic_response.h"
#include "density/band_constants.h"
#include "density/ccr.h"
#include "density/den_weight.h"
#include "density/density.h"
#include "density/paper_adjustment.h"
#include "density/spectral.h"
#include "density/weighted.h"

#include <algorithm>

using namespace vantrel;

int GetNumStatuses() { return NUM_STATUSES; }

int GetNumResponses() { return NUM_RESPONSES; }

int GetNumStatusResponses(int status)
{
    VANTREL_REQUIRE(is_status(status), "FALSE");
    return responses_of(status).count;
}

int GetNormalizedDensityWeights(int status, int response, double *weights, double *first,
                                double *peak, double *last)
{
    VANTREL_REQUIRE(weights, "0");
    VANTREL_REQUIRE(is_status(status) && is_response(response), "0");
    const Weights row = weights_of(status, response);
    const Profile found = profile(row);
    if (first)
        *first = found.first;
    if (last)
        *last = found.last;
    if (found.peak_weight == 0)
        return 0;
    if (peak)
        *peak = found.peak;
    store(normalized(row, found.peak_weight), weights);
    return 1;
}

int ReflToDensity(const double *refl, const double *paper, int status, int response,
                  double *density)
{
    VANTREL_REQUIRE(refl && density, "0");
    const auto result = vantrel::density(spectrum(refl), vantrel::paper(paper), status, response);
    VANTREL_REQUIRE(result, "0");
    *density = *result;
    return 1;
}

int ReflToReflDensity(const double *refl, int status, int response, double *weightedRefl)
{
    VANTREL_REQUIRE(refl && weightedRefl, "0");
    VANTREL_REQUIRE(is_status(status) && is_response(response), "0");
    *weightedRefl = weighted_reflectance(spectrum(refl), status, response);
    return 1;
}

double CalculateSpectralDensity(double refl) { return spectral_density(refl); }

void AdjustForPaperRefls(const double *refl, const double *paper, double *adjusted)
{
    store(adjusted_for_paper(spectrum(refl), spectrum(paper)), adjusted);
}

int ReflToDensities(const double *refl, const double *paper, int status, DENSITYSTRUCT *densities)
{
    VANTREL_REQUIRE(densities && refl, "0");
    const auto result = vantrel::densities(spectrum(refl), vantrel::paper(paper), status);
    VANTREL_REQUIRE(result, "0");
    *densities = *result;
    return 1;
}

int ReflToDensitiesNoPaper(const double *refl, int status, DENSITYSTRUCT *densities)
{
    VANTREL_REQUIRE(densities && refl, "0");
    const auto result = vantrel::densities(spectrum(refl), std::nullopt, status);
    VANTREL_REQUIRE(result, "0");
    *densities = *result;
    return 1;
}

int DetermineDensityResponse(const double *refl, int status, const double *paper)
{
    VANTREL_REQUIRE(refl, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    return automatic_response(spectrum(refl), status, vantrel::paper(paper));
}

void FindDensityMax(DENSITYSTRUCT *densities, double &density, int &response, int includeVisual)
{
    const Extreme found = largest(*densities, includeVisual, response);
    density = found.density;
    response = found.response;
}

void FindDensityMin(DENSITYSTRUCT *densities, double &density, int &response, int includeVisual)
{
    const Extreme found = smallest(*densities, includeVisual, response);
    density = found.density;
    response = found.response;
}

int CalculateCCRDensities(const double *refl, const double *paper, int status, double *densities)
{
    VANTREL_REQUIRE(refl && densities, "0");
    VANTREL_REQUIRE(status == CCR1_STATUS || status == CCR2_STATUS, "0");
    const Densities set = ccr_densities(spectrum(refl), vantrel::paper(paper), status);
    std::copy_n(set.density, NUM_RESPONSES, densities);
    return 1;
}

static std::optional<Shape> shape(const double *values)
{
    return values ? std::optional(Shape(values, kShape)) : std::nullopt;
}

static void store_shape(int response, double *values)
{
    if (values)
        std::copy_n(band_shape(response).begin(), kShape, values);
}

void SetHiFiConstants(const double *wavelengths, const double *shape1, const double *shape2,
                      const double *shape3)
{
    VANTREL_REQUIRE_ELSE(wavelengths, "0", );
    set_band(HIFI1_RESPONSE, wavelengths[0], shape(shape1));
    set_band(HIFI2_RESPONSE, wavelengths[1], shape(shape2));
    set_band(HIFI3_RESPONSE, wavelengths[2], shape(shape3));
}

void GetHiFiConstants(double *wavelengths, double *shape1, double *shape2, double *shape3)
{
    for (int i = 0; wavelengths && i < 3; ++i)
        wavelengths[i] = band_centre(HIFI1_RESPONSE + i);
    store_shape(HIFI1_RESPONSE, shape1);
    store_shape(HIFI2_RESPONSE, shape2);
    store_shape(HIFI3_RESPONSE, shape3);
}

void SetHexachromeConstants(const double *wavelengths, const double *shape1, const double *shape2)
{
    VANTREL_REQUIRE_ELSE(wavelengths, "0", );
    set_band(HEXACHROME1_RESPONSE, wavelengths[0], shape(shape1));
    set_band(HEXACHROME2_RESPONSE, wavelengths[1], shape(shape2));
}

void GetHexachromeConstants(double *wavelengths, double *shape1, double *shape2)
{
    for (int i = 0; wavelengths && i < 2; ++i)
        wavelengths[i] = band_centre(HEXACHROME1_RESPONSE + i);
    store_shape(HEXACHROME1_RESPONSE, shape1);
    store_shape(HEXACHROME2_RESPONSE, shape2);
}
