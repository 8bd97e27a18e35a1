#pragma once

#include "density/density_set.h"

#include <optional>

namespace vantrel {

/// The density of any status; nothing for an unknown status or a response that it does not take.
std::optional<double> density(Spectrum refl, Paper paper, int status, int response);

/// Every response that the status measures; nothing for an unknown status.
std::optional<Densities> densities(Spectrum refl, Paper paper, int status);

} // namespace vantrel
