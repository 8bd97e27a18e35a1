// The exported emulation of readings through a polarisation filter.
#include "vantrel.h"

#include "base/require.h"
#include "density/density.h"
#include "polarisation/adjust.h"
#include "polarisation/densities.h"
#include "print/contrast_trap.h"
#include "print/dot_area.h"
#include "print/hue_gray.h"

#include <algorithm>

using namespace vantrel;

namespace {

Targets four(const double *targets) { return Targets(targets, 4); }

// The paper of a call, adjusted where there is one; failed where it cannot be adjusted.
struct PolarisedPaper {
    PolarisedPaper(Paper refl, const double *targets, const POLWEIGHTSTRUCT &weights,
                   double noise = 0)
    {
        if (!refl)
            return;
        adjusted = polarised(*refl, four(targets), weights, noise);
        failed = !adjusted;
    }
    operator Paper() const { return adjusted ? Paper(*adjusted) : std::nullopt; }

    std::optional<Bands> adjusted;
    bool failed = false;
};

} // namespace

int PolReflAdjust(const double *refl, int response, const double *targets, double *adjusted,
                  const POLWEIGHTSTRUCT *weights)
{
    const auto factor = overall_factor(
        channel_factors(spectrum(refl), response, four(targets), *weights), response);
    VANTREL_REQUIRE(factor, "0");
    store(scaled(spectrum(refl), *factor), adjusted);
    return 1;
}

int PolReflAutoAdjust(const double *refl, const double *targets, double *adjusted,
                      const POLWEIGHTSTRUCT *weights)
{
    const auto result = polarised(spectrum(refl), four(targets), *weights);
    VANTREL_REQUIRE(result, "0");
    store(*result, adjusted);
    return 1;
}

int PolDetermineDensityResponse(const double *refl, const double *targets, int status,
                                const double *paper, const double *paperTargets,
                                const POLWEIGHTSTRUCT *weights)
{
    VANTREL_REQUIRE(is_status(status), "0");
    const auto sample = polarised(spectrum(refl), four(targets), *weights);
    const PolarisedPaper adjustedPaper(vantrel::paper(paper), paperTargets, *weights);
    VANTREL_REQUIRE(sample && !adjustedPaper.failed, "0");
    return density_response(*sample, status, adjustedPaper);
}

int PolReflToDensity(const double *refl, const double *targets, const double *paper,
                     const double *paperTargets, const POLWEIGHTSTRUCT *weights, int status,
                     int response, double *density)
{
    VANTREL_REQUIRE(density, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto sample = polarised(spectrum(refl), four(targets), *weights);
    const PolarisedPaper adjustedPaper(vantrel::paper(paper), paperTargets, *weights);
    VANTREL_REQUIRE(sample && !adjustedPaper.failed, "0");
    return store(vantrel::density(*sample, adjustedPaper, status, response), density);
}

int PolReflToDensities(const double *refl, const double *targets, const double *paper,
                       const double *paperTargets, const POLWEIGHTSTRUCT *weights, int status,
                       DENSITYSTRUCT *densities)
{
    VANTREL_REQUIRE(refl && densities, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const PolarisedPaper adjustedPaper(vantrel::paper(paper), paperTargets, *weights);
    const auto result = adjustedPaper.failed ? std::nullopt
                                             : polarised_densities(spectrum(refl), four(targets),
                                                                   adjustedPaper, *weights, status);
    *densities = result.value_or(Densities{});
    return result ? 1 : 0;
}

int PolReflToHueGray(const double *refl, const double *targets, const double *paper,
                     const double *paperTargets, const POLWEIGHTSTRUCT *weights, int status,
                     double *grayness, double *hueError)
{
    VANTREL_REQUIRE(refl && grayness && hueError, "0");
    VANTREL_REQUIRE(is_status(status) && status != SPECTRALX_STATUS, "0");
    const PolarisedPaper adjustedPaper(vantrel::paper(paper), paperTargets, *weights);
    VANTREL_REQUIRE(!adjustedPaper.failed, "0");
    // The density set adjusts the paper that it is given, here one that is adjusted already.
    const PolarisedPaper twice(adjustedPaper, paperTargets, *weights, kRoundingNoise);
    if (twice.failed)
        return 9;
    const auto set =
        polarised_densities(spectrum(refl), four(targets), twice, *weights, process_status(status));
    if (!set)
        return 9;
    const HueGray result = hue_gray(*set);
    *grayness = result.grayness;
    *hueError = result.hue_error;
    return 1;
}

int PolReflToDotArea(const double *solid, const double *solidTargets, const double *tint,
                     const double *tintTargets, const double *paper, const double *paperTargets,
                     const POLWEIGHTSTRUCT *weights, int status, int response, double nFactor,
                     double *dotArea)
{
    VANTREL_REQUIRE(dotArea, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto adjustedSolid = polarised(spectrum(solid), four(solidTargets), *weights);
    const auto adjustedTint = polarised(spectrum(tint), four(tintTargets), *weights);
    const PolarisedPaper adjustedPaper(vantrel::paper(paper), paperTargets, *weights);
    VANTREL_REQUIRE(adjustedSolid && adjustedTint && !adjustedPaper.failed, "0");
    return store(dot_area(*adjustedSolid, *adjustedTint, adjustedPaper, status, response, nFactor),
                 dotArea);
}

int PolReflToDotGain(const double *solid, const double *solidTargets, const double *tint,
                     const double *tintTargets, const double *paper, const double *paperTargets,
                     const POLWEIGHTSTRUCT *weights, int status, int response, double nFactor,
                     int nominalDotArea, double *dotGain)
{
    VANTREL_REQUIRE(dotGain, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto adjustedSolid = polarised(spectrum(solid), four(solidTargets), *weights);
    const auto adjustedTint = polarised(spectrum(tint), four(tintTargets), *weights);
    const PolarisedPaper adjustedPaper(vantrel::paper(paper), paperTargets, *weights);
    VANTREL_REQUIRE(adjustedSolid && adjustedTint && !adjustedPaper.failed, "0");
    return store(dot_gain(*adjustedSolid, *adjustedTint, adjustedPaper, status, response, nFactor,
                          nominalDotArea),
                 dotGain);
}

int PolReflToPrintContrast(const double *solid, const double *solidTargets, const double *tint,
                           const double *tintTargets, const double *paper,
                           const double *paperTargets, const POLWEIGHTSTRUCT *weights, int status,
                           int response, double *contrast)
{
    VANTREL_REQUIRE(contrast, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto adjustedSolid = polarised(spectrum(solid), four(solidTargets), *weights);
    const auto adjustedTint = polarised(spectrum(tint), four(tintTargets), *weights);
    const PolarisedPaper adjustedPaper(vantrel::paper(paper), paperTargets, *weights);
    VANTREL_REQUIRE(adjustedSolid && adjustedTint && !adjustedPaper.failed, "0");
    return store(print_contrast(*adjustedSolid, *adjustedTint, adjustedPaper, status, response),
                 contrast);
}

int PolReflToTrap(const double *second, const double *secondTargets, const double *first,
                  const double *firstTargets, const double *overprint,
                  const double *overprintTargets, const double *paper, const double *paperTargets,
                  const POLWEIGHTSTRUCT *weights, int status, int response, double *trap)
{
    VANTREL_REQUIRE(trap, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto adjustedSecond = polarised(spectrum(second), four(secondTargets), *weights);
    const auto adjustedFirst = polarised(spectrum(first), four(firstTargets), *weights);
    const auto adjustedOverprint = polarised(spectrum(overprint), four(overprintTargets), *weights);
    const PolarisedPaper adjustedPaper(vantrel::paper(paper), paperTargets, *weights);
    VANTREL_REQUIRE(adjustedSecond && adjustedFirst && adjustedOverprint && !adjustedPaper.failed,
                    "0");
    return store(vantrel::trap(*adjustedSecond, *adjustedFirst, *adjustedOverprint, adjustedPaper,
                               status, response),
                 trap);
}
