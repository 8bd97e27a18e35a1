#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Drive levels of the preview display, red | green << 8 | blue << 16.
unsigned int rgb_from_xyz(const Xyz &xyz);

} // namespace vantrel
