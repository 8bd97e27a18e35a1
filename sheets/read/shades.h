// Patches beside others with more ink.
#pragma once

#include "read/doubts.h"

#include <set>
#include <vector>

namespace vantrel::sheets {

using Named = std::set<const Patch *>; // in a doubt already

// More ink is not lighter: tone scales, greys, overprints beside their solids. Those patches are
// named that contradict most others.
void doubt_order(const std::vector<Patch> &patches, Kind kind, const Named &named,
                 std::vector<Doubt> &out);

} // namespace vantrel::sheets
