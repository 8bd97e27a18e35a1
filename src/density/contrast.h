#pragma once

#include "base/spectrum.h"

#include <array>

namespace vantrel {

/// The spectrum with its contrast against the paper exaggerated: in every band the density above
/// the paper is tripled, or doubled where it is more than 0.5.
std::array<double, kBands> adjusted_for_paper(Spectrum refl, Spectrum paper);

} // namespace vantrel
