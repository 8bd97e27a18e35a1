#pragma once

#include "density/density_set.h"
#include "polarisation/adjust.h"

namespace vantrel {

/// The density set of a spectrum over an adjusted paper, each response measured on the spectrum as
/// its own channel adjusts it (Status Spectral and SpectralX: on the spectrum adjusted in its own
/// response). Nothing where an adjustment fails.
std::optional<Densities> polarised_densities(Spectrum refl, Targets targets, Paper adjusted_paper,
                                             const PolWeights &weights, int status);

} // namespace vantrel
