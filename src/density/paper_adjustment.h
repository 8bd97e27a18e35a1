#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// A reflectance with its contrast against the paper exaggerated: the density above the paper is
/// tripled, or doubled where it is more than 0.5.
double adjusted_for_paper(double refl, double paper);
Bands adjusted_for_paper(Spectrum refl, Spectrum paper);

} // namespace vantrel
