// Ids and names of patches that contradict each other.
#pragma once

#include "read/doubts.h"

#include <string_view>
#include <vector>

namespace vantrel::sheets {

// The zone that ends a name (C100 Z5), and the name without it; 0 where there is none.
struct ZonedName {
    std::string_view name;
    int zone = 0;
};
ZonedName zoned_name(std::string_view name);

// Gaps in the count of ids, places or zones, and ids and names that stand for several patches.
void doubt_labels(const std::vector<Patch> &patches, std::vector<Doubt> &out);

} // namespace vantrel::sheets
