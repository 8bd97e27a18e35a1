// The exported emulation of readings through a polarisation filter.
#include "vantrel.h"

#include "base/require.h"
#include "density/automatic_response.h"
#include "density/den_weight.h"
#include "density/density.h"
#include "density/hue_gray.h"
#include "polarisation/adjust.h"
#include "polarisation/densities.h"
#include "print/contrast_trap.h"
#include "print/dot_area.h"

#include <array>
#include <initializer_list>

using namespace vantrel;

namespace {

Targets four(const double *targets) { return Targets(targets, 4); }

/// A spectrum of a call and its targets.
struct Reading {
    const double *refl, *targets;
};

/// Up to three patches of a call and the paper, where there is one, each adjusted in its own
/// response.
struct Patches {
    std::array<Bands, 3> patch{};
    std::optional<Bands> adjusted_paper;

    Paper paper() const { return adjusted_paper ? Paper(*adjusted_paper) : std::nullopt; }
};

/// Nothing where one of them cannot be adjusted.
std::optional<Patches> adjusted(std::initializer_list<Reading> patches, Reading paper,
                                const PolWeights &weights)
{
    Patches result;
    for (Bands *out = result.patch.data(); const auto &[refl, targets] : patches) {
        const auto patch = polarised(spectrum(refl), four(targets), weights);
        if (!patch)
            return std::nullopt;
        *out++ = *patch;
    }
    if (paper.refl) {
        result.adjusted_paper = polarised(spectrum(paper.refl), four(paper.targets), weights);
        if (!result.adjusted_paper)
            return std::nullopt;
    }
    return result;
}

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
    const auto read = adjusted({{refl, targets}}, {paper, paperTargets}, *weights);
    VANTREL_REQUIRE(read, "0");
    return automatic_response(read->patch[0], status, read->paper());
}

int PolReflToDensity(const double *refl, const double *targets, const double *paper,
                     const double *paperTargets, const POLWEIGHTSTRUCT *weights, int status,
                     int response, double *density)
{
    VANTREL_REQUIRE(density, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto read = adjusted({{refl, targets}}, {paper, paperTargets}, *weights);
    VANTREL_REQUIRE(read, "0");
    return store(vantrel::density(read->patch[0], read->paper(), status, response), density);
}

int PolReflToDensities(const double *refl, const double *targets, const double *paper,
                       const double *paperTargets, const POLWEIGHTSTRUCT *weights, int status,
                       DENSITYSTRUCT *densities)
{
    VANTREL_REQUIRE(refl && densities, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto read = adjusted({}, {paper, paperTargets}, *weights);
    const auto result =
        read ? polarised_densities(spectrum(refl), four(targets), read->paper(), *weights, status)
             : std::nullopt;
    *densities = result.value_or(Densities{});
    return result ? 1 : 0;
}

int PolReflToHueGray(const double *refl, const double *targets, const double *paper,
                     const double *paperTargets, const POLWEIGHTSTRUCT *weights, int status,
                     double *grayness, double *hueError)
{
    VANTREL_REQUIRE(refl && grayness && hueError, "0");
    VANTREL_REQUIRE(is_status(status) && status != SPECTRALX_STATUS, "0");
    auto read = adjusted({}, {paper, paperTargets}, *weights);
    VANTREL_REQUIRE(read, "0");
    // The density set adjusts the paper that it is given, here one that is adjusted already.
    if (paper) {
        read->adjusted_paper =
            polarised(*read->adjusted_paper, four(paperTargets), *weights, kRoundingNoise);
        if (!read->adjusted_paper)
            return 9;
    }
    const auto set = polarised_densities(spectrum(refl), four(targets), read->paper(), *weights,
                                         process_status(status));
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
    const auto read =
        adjusted({{solid, solidTargets}, {tint, tintTargets}}, {paper, paperTargets}, *weights);
    VANTREL_REQUIRE(read, "0");
    const auto &[s, t, unused] = read->patch;
    return store(dot_area(s, t, read->paper(), status, response, nFactor), dotArea);
}

int PolReflToDotGain(const double *solid, const double *solidTargets, const double *tint,
                     const double *tintTargets, const double *paper, const double *paperTargets,
                     const POLWEIGHTSTRUCT *weights, int status, int response, double nFactor,
                     int nominalDotArea, double *dotGain)
{
    VANTREL_REQUIRE(dotGain, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto read =
        adjusted({{solid, solidTargets}, {tint, tintTargets}}, {paper, paperTargets}, *weights);
    VANTREL_REQUIRE(read, "0");
    const auto &[s, t, unused] = read->patch;
    return store(dot_gain(s, t, read->paper(), status, response, nFactor, nominalDotArea), dotGain);
}

int PolReflToPrintContrast(const double *solid, const double *solidTargets, const double *tint,
                           const double *tintTargets, const double *paper,
                           const double *paperTargets, const POLWEIGHTSTRUCT *weights, int status,
                           int response, double *contrast)
{
    VANTREL_REQUIRE(contrast, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto read =
        adjusted({{solid, solidTargets}, {tint, tintTargets}}, {paper, paperTargets}, *weights);
    VANTREL_REQUIRE(read, "0");
    const auto &[s, t, unused] = read->patch;
    return store(print_contrast(s, t, read->paper(), status, response), contrast);
}

int PolReflToTrap(const double *second, const double *secondTargets, const double *first,
                  const double *firstTargets, const double *overprint,
                  const double *overprintTargets, const double *paper, const double *paperTargets,
                  const POLWEIGHTSTRUCT *weights, int status, int response, double *trap)
{
    VANTREL_REQUIRE(trap, "0");
    VANTREL_REQUIRE(is_status(status), "0");
    const auto read =
        adjusted({{second, secondTargets}, {first, firstTargets}, {overprint, overprintTargets}},
                 {paper, paperTargets}, *weights);
    VANTREL_REQUIRE(read, "0");
    const auto &[second_down, first_down, printed] = read->patch;
    return store(vantrel::trap(second_down, first_down, printed, read->paper(), status, response),
                 trap);
}
