#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// CIE94 with kH = 1 (CIE 116), weighted by the chroma of the reference.
double delta_e94(const Lab &sample, const Lab &reference, double kL, double kC);

} // namespace vantrel
