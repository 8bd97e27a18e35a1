#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// CMC(l:c) (ISO 105-J03).
double delta_e_cmc(const Lab &sample, const Lab &reference, double l, double c);

} // namespace vantrel
