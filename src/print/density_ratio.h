#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// The density of a sample in percent of that of a reference, at most 1000, both in the response
/// that measures the reference. A density that cannot be measured counts as 0; over a reference of
/// density 0 the ratio is 1000 for a sample above 0 and otherwise 0.
double density_ratio(Spectrum reference, Spectrum sample, int status);

/// One band of a sample printed at another density: its K/S divided by a density ratio in percent
/// (Kubelka and Munk, opaque layer), as it is for a ratio of 0 or less.
double at_equivalent_density(double refl, double ratio);

} // namespace vantrel
