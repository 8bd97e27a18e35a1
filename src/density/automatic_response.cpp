#include "density/automatic_response.h"

#include "colorimetry/lab.h"
#include "density/achromatic.h"
#include "density/density.h"
#include "density/hue_gray.h"
#include "density/paper_adjustment.h"
#include "density/spectral.h"
#include "density/spectralx.h"

#include <cmath>

namespace vantrel {
namespace {

double hue_error(Spectrum refl)
{
    return hue_gray(*densities(refl, std::nullopt, E_STATUS)).hue_error;
}

/// The third HiFi ink and cyan are both darkest in the red; the hue error tells them apart.
int hifi_response(Spectrum refl, int response)
{
    if (response == HIFI3_RESPONSE || response == RED_RESPONSE)
        return hue_error(refl) > 39.5 ? HIFI3_RESPONSE : RED_RESPONSE;
    return response;
}

/// The hue error tells the Hexachrome inks from yellow, and their hue one from the other.
int hexachrome_response(Spectrum refl, const Lab &lab, int response)
{
    if (response == HEXACHROME1_RESPONSE || response == BLUE_RESPONSE)
        response = hue_error(refl) > 30 ? HEXACHROME1_RESPONSE : BLUE_RESPONSE;
    if (response == HEXACHROME1_RESPONSE || response == HEXACHROME2_RESPONSE) {
        const double hue = lch_from_lab(lab).h;
        response = 90 < hue && hue < 270 ? HEXACHROME2_RESPONSE : HEXACHROME1_RESPONSE;
    }
    return response;
}

int response_of(Spectrum refl, int status)
{
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

/// A sample on a paper, as they are measured: the adjusted reflectance stays of ordinary size.
bool is_ordinary(double refl, double paper)
{
    return refl > 1e-3 && refl < 200 && paper > 1 && paper < 200;
}

// With Ds = log10(100 / R) and Ds - Dp = log10(P / R) that is R (R / P)^k. What is not ordinary, or
// too near to the step at a density of 0.5, stays with the logarithms.
double roughly_adjusted(double refl, double paper)
{
    constexpr double kStep = 0.31622776601683794; // 10^-0.5
    const double ratio = refl / paper;
    if (!is_ordinary(refl, paper) || std::fabs(ratio - kStep) < 1e-12)
        return adjusted_for_paper(refl, paper);
    return ratio < kStep ? refl * ratio : refl * ratio * ratio;
}

/// adjusted_for_paper() but for the last digits (1e-14 of a reflectance), in a fraction of the
/// time.
Bands roughly_adjusted(Spectrum refl, Spectrum paper)
{
    Bands result;
    for (int i = 0; i < kBands; ++i)
        result[i] = roughly_adjusted(refl[i], paper[i]);
    return result;
}

/// The response of an ISO status, where a change in the last digits of the spectrum could not give
/// another: the colour keeps its distance from the achromatic line, and the largest density from
/// the others.
std::optional<int> firm_response(Spectrum refl, int status)
{
    constexpr double kLightnessMargin = 1e-9;
    constexpr double kChromaMargin = 0.02; // more than to round both a* and b* can change it
    constexpr double kDensityMargin = 1e-6;
    const Lab lab = lab_from_spectrum(refl, D65_10DEG);
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

int automatic_response(Spectrum refl, int status, Paper paper)
{
    if (status == SPECTRAL_STATUS)
        return darkest_wavelength(refl, paper);
    if (!paper)
        return response_of(refl, status);
    // Whatever the speed, the answer is that of the exact adjustment, even where the densities of
    // two responses tie (in filters whose weights do not all but cancel out).
    if (status <= T_STATUS)
        if (const auto response = firm_response(roughly_adjusted(refl, *paper), status))
            return *response;
    return response_of(adjusted_for_paper(refl, *paper), status);
}

} // namespace vantrel
