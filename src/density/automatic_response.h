#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// The response (or wavelength, or band) that reads this ink.
int automatic_response(Spectrum refl, int status, Paper paper);

} // namespace vantrel
