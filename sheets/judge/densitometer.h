// Densities of patches over one paper, and the print attributes that rest on them.
#pragma once

#include "read/measurement.h"

#include <optional>

namespace vantrel::sheets {

// A density over the paper, in the response that reads the ink; both missing where there is none.
struct DensityReading {
    std::optional<int> response;
    std::optional<double> density;
};

class Densitometer {
public:
    Densitometer(const Spectrum &paper, int status) : paper(paper), status(status) {}

    // The response that reads this ink, as DetermineDensityResponse() gives it; nothing where there
    // is none.
    std::optional<int> response(const Spectrum &refl) const;

    DensityReading read(const Spectrum &refl) const;

    // Over the paper under every status: SPECTRAL_STATUS, which takes no paper, included.
    double density(const Spectrum &refl, int response) const;

    // Visual, over the paper; by E_STATUS under the statuses of wavelengths, which have no filters.
    double neutral_density(const Spectrum &refl) const;

    // Measured in the solid's response; nothing where the solid has no density above the paper's.
    std::optional<double> dot_area(const Spectrum &solid, const Spectrum &tint,
                                   double n_factor) const;
    std::optional<double> print_contrast(const Spectrum &solid, const Spectrum &tint) const;

    // Measured in the response of the second-down ink; nothing where that ink has no density.
    std::optional<double> trap(const Spectrum &first, const Spectrum &second,
                               const Spectrum &overprint) const;

    struct HueGray {
        double hue_error;
        double grayness;
    };
    // Nothing under the two spectral statuses, which do not measure three filters.
    std::optional<HueGray> hue_gray(const Spectrum &refl) const;

private:
    const Spectrum &paper;
    int status;
};

} // namespace vantrel::sheets
