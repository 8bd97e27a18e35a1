#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// One to three inks and how much of each, 0 to 100 percent, in the order of printing.
using Percentages = std::span<const int>;

/// A model of a tint below 100 percent: halftone_tint or film_tint.
using TintModel = Bands (*)(Spectrum ink, int percent, Spectrum paper);

/// The spectrum of the inks, 31 values each, printed over one another.
Bands estimate(const double *inks, Percentages percent, Spectrum paper, TintModel tint);

/// Their colour from L*a*b*, 3 values each. Three tints together are a neutral.
Lab estimate_colour(const double *inks, Percentages percent, const Lab &paper);

} // namespace vantrel
