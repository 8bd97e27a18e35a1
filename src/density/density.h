#pragma once

#include "base/spectrum.h"

namespace vantrel {

inline bool is_status(int status) { return status >= 0 && status < NUM_STATUSES; }
inline bool is_response(int response) { return response >= 0 && response < NUM_RESPONSES; }

/// Σ R w in order of the bands, w the filter of the status and response.
double weighted_sum(Spectrum refl, int status, int response);

/// Filter-weighted reflectance in percent, at least 0.001.
double weighted_reflectance(Spectrum refl, int status, int response);

/// ISO 5-4: -log10 of the filter-weighted reflectance factor, at most 5; less that of the paper.
double weighted_density(Spectrum refl, Paper paper, int status, int response);

/// -log10 of a reflectance in percent, at most 7.
double spectral_density(double refl);

/// The density of any status; nothing for an unknown status or a response that it does not take.
std::optional<double> density(Spectrum refl, Paper paper, int status, int response);

} // namespace vantrel
