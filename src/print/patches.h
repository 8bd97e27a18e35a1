#pragma once

#include "density/density.h"

#include <array>
#include <initializer_list>

namespace vantrel {

/// The densities of up to three patches over one paper, which is measured once; nothing where the
/// response is not one of the status.
std::optional<std::array<double, 3>> patch_densities(std::initializer_list<Spectrum> patches,
                                                     Paper paper, int status, int response);

} // namespace vantrel
