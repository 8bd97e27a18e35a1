// Ids and names of patches that contradict each other.
#pragma once

#include "read/doubts.h"

#include <vector>

namespace vantrel::sheets {

// Gaps in the count of ids or of places, and ids and names that stand for several patches.
void doubt_labels(const std::vector<Patch> &patches, std::vector<Doubt> &out);

} // namespace vantrel::sheets
