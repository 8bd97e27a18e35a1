#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Σ R w in order of the bands, w the filter of the status and response.
double weighted_sum(Spectrum refl, int status, int response);

/// Filter-weighted reflectance in percent, at least 0.001.
double weighted_reflectance(Spectrum refl, int status, int response);

/// ISO 5-4: -log10 of the filter-weighted reflectance factor, at most 5; less that of the paper.
double weighted_density(Spectrum refl, Paper paper, int status, int response);

} // namespace vantrel
