#include "density/density.h"

#include "density/ccr.h"
#include "density/den_weight.h"
#include "density/spectral.h"
#include "density/spectralx.h"
#include "density/weighted.h"

#include <algorithm>

namespace vantrel {

static double clamped(double density) { return std::clamp(density, 0.0, 5.0); }

std::optional<double> density(Spectrum refl, Paper paper, int status, int response)
{
    switch (status) {
    case SPECTRAL_STATUS:
        // The wavelength is cut to its band toward 400 nm, from either side.
        if (response < 391 || response > 709)
            return std::nullopt;
        return clamped(spectral_density(refl[(response - 400) / 10]));
    case SPECTRALX_STATUS:
        if (response < 0 || response >= kBands)
            return std::nullopt;
        if (response == VISUAL_RESPONSE)
            return clamped(weighted_density(refl, paper, T_STATUS, VISUAL_RESPONSE));
        return clamped(band_density(refl, paper, band_to_read(refl, response)));
    case CCR2_STATUS:
        if (response < 0 || response >= kBands)
            return std::nullopt;
        return is_response(response) ? ccr_densities(refl, paper, status).density[response] : 0;
    default:
        if (!is_status(status) || !is_response(response))
            return std::nullopt;
        return weighted_density(refl, paper, status, response);
    }
}

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
            status == SPECTRAL_STATUS ? darkest_wavelength(refl, paper) : VISUAL_RESPONSE;
        std::fill_n(set.density, NUM_RESPONSES, *density(refl, paper, status, response));
        return set;
    }
    default:
        for (const int response : responses_of(status))
            set.density[response] = weighted_density(refl, paper, status, response);
        return set;
    }
}

} // namespace vantrel
