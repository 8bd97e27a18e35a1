#include "density/automatic_response.h"

#include "density/density.h"
#include "density/hue_gray.h"
#include "density/paper_adjustment.h"
#include "density/spectral.h"
#include "density/spectralx.h"

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

Bands roughly_adjusted_for_paper(Spectrum refl, Spectrum paper)
{
    Bands result;
    for (int i = 0; i < kBands; ++i) {
        const double ratio = refl[i] / paper[i];
        result[i] = is_roughly_adjusted(refl[i], paper[i], ratio)
                        ? roughly_adjusted(refl[i], ratio)
                        : adjusted_for_paper(refl[i], paper[i]);
    }
    return result;
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
    if (status <= T_STATUS) {
        const Bands adjusted = roughly_adjusted_for_paper(refl, *paper);
        const auto [response, firm] =
            firm_response(adjusted, lab_from_spectrum(adjusted, D65_10DEG), status);
        if (firm)
            return static_cast<int>(response);
    }
    return response_of(adjusted_for_paper(refl, *paper), status);
}

} // namespace vantrel
