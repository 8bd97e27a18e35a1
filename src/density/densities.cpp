#include "density/densities.h"

#include "colorimetry/lab.h"
#include "density/achromatic.h"
#include "density/ccr.h"
#include "density/contrast.h"
#include "density/den_weight.h"
#include "density/density.h"
#include "density/spectralx.h"

#include <algorithm>

namespace vantrel {
namespace {

/// Every second band from 420 nm.
int darkest_wavelength(Spectrum refl)
{
    int darkest = 2;
    double largest = 0;
    for (int band = 2; band < kBands; band += 2) {
        const double density = spectral_density(refl[band]);
        if (density > largest) {
            darkest = band;
            largest = density;
        }
    }
    return 400 + 10 * darkest;
}

double hue_error(Spectrum refl, int status)
{
    double grayness = 0, error = 0;
    ReflToHueGray(refl.data(), nullptr, status, &grayness, &error);
    return error;
}

/// The third HiFi ink and cyan are both darkest in the red; the hue error tells them apart.
int hifi_response(Spectrum refl, int response)
{
    if (response == HIFI3_RESPONSE || response == RED_RESPONSE)
        return hue_error(refl, HIFI_STATUS) > 39.5 ? HIFI3_RESPONSE : RED_RESPONSE;
    return response;
}

/// The hue error tells the Hexachrome inks from yellow, and their hue one from the other.
int hexachrome_response(Spectrum refl, const Lab &lab, int response)
{
    if (response == HEXACHROME1_RESPONSE || response == BLUE_RESPONSE)
        response = hue_error(refl, HEXACHROME_STATUS) > 30 ? HEXACHROME1_RESPONSE : BLUE_RESPONSE;
    if (response == HEXACHROME1_RESPONSE || response == HEXACHROME2_RESPONSE) {
        const double hue = lch_from_lab(lab).h;
        response = 90 < hue && hue < 270 ? HEXACHROME2_RESPONSE : HEXACHROME1_RESPONSE;
    }
    return response;
}

int response_of(Spectrum refl, int status)
{
    if (status == SPECTRAL_STATUS)
        return darkest_wavelength(refl);
    const Lab lab = rounded(lab_from_spectrum(refl, D65_10DEG));
    if (!is_chromatic(lab.L, chroma(lab)))
        return VISUAL_RESPONSE;
    if (status == SPECTRALX_STATUS)
        return absorption_band(refl);
    const auto set = densities(refl, std::nullopt, status);
    if (!set)
        return NUM_RESPONSES;
    const int response = largest(*set, true, VISUAL_RESPONSE).response;
    switch (status) {
    case HIFI_STATUS:
        return hifi_response(refl, response);
    case HEXACHROME_STATUS:
        return hexachrome_response(refl, lab, response);
    default:
        return response;
    }
}

/// The response of an ISO status, where a change in the last digits of the spectrum could not give
/// another: the colour keeps its distance from the achromatic line, and the largest density from
/// the others.
std::optional<int> firm_response(Spectrum refl, int status)
{
    constexpr double kLightnessMargin = 1e-9;
    constexpr double kChromaMargin = 0.02; // more than a rounding step of both a* and b*
    constexpr double kDensityMargin = 1e-6;
    const Lab lab = rounded(lab_from_spectrum(refl, D65_10DEG));
    const double C = chroma(lab);
    const bool chromatic = is_chromatic(lab.L, C);
    for (const double L : {lab.L - kLightnessMargin, lab.L + kLightnessMargin})
        if (is_chromatic(L, C - kChromaMargin) != chromatic ||
            is_chromatic(L, C + kChromaMargin) != chromatic)
            return std::nullopt;
    if (!chromatic)
        return VISUAL_RESPONSE;
    const Densities set = *densities(refl, std::nullopt, status);
    const Extreme first = largest(set, true, VISUAL_RESPONSE);
    for (int r = VISUAL_RESPONSE; r < NUM_RESPONSES; ++r)
        if (r != first.response && set.density[r] > first.density - kDensityMargin)
            return std::nullopt;
    return first.response;
}

} // namespace

std::optional<Densities> densities(Spectrum refl, Paper paper, int status)
{
    if (!is_status(status))
        return std::nullopt;
    Densities set{};
    switch (status) {
    case CCR1_STATUS:
    case CCR2_STATUS:
        return ccr_densities(refl, paper, status);
    case SPECTRAL_STATUS:
    case SPECTRALX_STATUS: {
        const int response =
            status == SPECTRAL_STATUS ? density_response(refl, status, paper) : VISUAL_RESPONSE;
        std::ranges::fill(set.density, *density(refl, paper, status, response));
        return set;
    }
    default:
        for (const int response : responses_of(status))
            set.density[response] = weighted_density(refl, paper, status, response);
        return set;
    }
}

Extreme largest(const Densities &set, bool include_visual, int preset_response)
{
    Extreme result = {0, preset_response};
    for (int r = include_visual ? VISUAL_RESPONSE : RED_RESPONSE; r < NUM_RESPONSES; ++r)
        if (set.density[r] > result.density)
            result = {set.density[r], r};
    return result;
}

Extreme smallest(const Densities &set, bool include_visual, int preset_response)
{
    Extreme result = {100, preset_response};
    for (int r = include_visual ? VISUAL_RESPONSE : RED_RESPONSE; r < NUM_RESPONSES; ++r)
        if (set.density[r] != 0 && set.density[r] < result.density)
            result = {set.density[r], r};
    return result;
}

int density_response(Spectrum refl, int status, Paper paper)
{
    if (!paper)
        return response_of(refl, status);
    // Whatever the speed, the answer is that of the exact adjustment, even where the densities of
    // two responses tie (in filters whose weights do not all but cancel out).
    if (status <= T_STATUS)
        if (const auto response = firm_response(roughly_adjusted_for_paper(refl, *paper), status))
            return *response;
    return response_of(adjusted_for_paper(refl, *paper), status);
}

} // namespace vantrel
