// Which patch of a sheet is the partner of which of another.
#pragma once

#include "read/measurement.h"

#include <cstddef>
#include <string_view>
#include <utility>
#include <vector>

namespace vantrel::sheets {

enum class Pairing { automatic, name, id, order };
std::string_view name_of(Pairing pairing); // auto, name, id, order

struct Pairs {
    Pairing by;                                               // not automatic
    std::vector<std::pair<std::size_t, std::size_t>> matched; // in the order of the reference
    std::vector<std::size_t> only_reference, only_sample;
};

// Patches of the same name or id, the first with the first where there are several, or those at the
// same place. Automatic pairing goes by name, or else by id, where at least half of the shorter
// sheet's patches find a partner, or else by order where the sheets are equally long. Throws
// RequestError where no patch finds one.
Pairs pairs_of(const Measurement &reference, const Measurement &sample, Pairing wish);

} // namespace vantrel::sheets
