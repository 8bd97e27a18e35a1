// Measurements of one patch, and their mean.
#pragma once

#include "read/measurement.h"

#include <cstddef>
#include <optional>
#include <vector>

namespace vantrel::sheets {

struct Repeats {
    Patch patch; // the first, with the mean of the spectra, or of L*a*b* where there are no others
    std::size_t count = 1;
    std::optional<double> spread; // of several: the largest ΔE00 from their mean
};

// Whether a mean with this spread is of other patches than one: of two that are ΔE00 10 apart.
// Zones of one press sheet and repeats by one instrument differ by 1 to 4, papers of two makes
// by 7.
bool is_of_others(const std::optional<double> &spread);

// Of the patches at these places, at least one.
Repeats mean_of(const Measurement &sheet, const std::vector<std::size_t> &places,
                ILLUM_OBS illuminant);

} // namespace vantrel::sheets
