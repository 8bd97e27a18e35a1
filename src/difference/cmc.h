#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// CMC(l:c) (ISO 105-J03). Chroma and hue are those of rounded a* and b*, or of a* and b* as they
/// are.
double delta_e_cmc(const Lab &sample, const Lab &reference, double l, double c, bool round = true);

} // namespace vantrel
