// What a page does not hold of a result that is too large for it.
#pragma once

#include <cstddef>
#include <string>

namespace vantrel::sheets {

struct LeftOut {
    std::size_t count = 0; // of patches or pairs
    std::string kept;      // what was kept before all others, in words
};

} // namespace vantrel::sheets
