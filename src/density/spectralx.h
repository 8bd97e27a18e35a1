#pragma once

#include "base/spectrum.h"

#include <array>

namespace vantrel {

struct SpectralXConstants {
    double tolerance; ///< within which a windowed sum counts as near the lowest, in its units
    double reserved;  ///< kept for the host
    double centre;    ///< weights of the window: the band itself, which must be 1,
    double inner;     ///< the bands next to it,
    double outer;     ///< and those beyond
};

const SpectralXConstants &spectralx_constants();
void set_spectralx_constants(const SpectralXConstants &constants);

/// -log10 of the weighted mean reflectance factor from a band upward; 5 where nothing is reflected.
double window_density(Spectrum refl, int first_band, std::span<const double> weights);

/// The density of the five-band window around a band of 2 to 28, less that of the paper.
double band_density(Spectrum refl, Paper paper, int band);

/// Absorption peaks, at least one.
struct Peaks {
    std::array<DENSITYPOINT, kBands> points;
    int count;
};
Peaks absorption_peaks(Spectrum refl);

/// Index of the peak, of at least one, that borders the brightest stretch of the spectrum, on the
/// side nearer to the crest of that stretch.
int choose_peak(Spectrum refl, std::span<const DENSITYPOINT> peaks);

/// The band of the peak that is chosen so.
int absorption_band(Spectrum refl);

/// The band that a request names, 2 to 28; any other request leaves the choice to the spectrum.
int band_to_read(Spectrum refl, int request);

} // namespace vantrel
