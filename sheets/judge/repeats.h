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

// Of the patches at these places, at least one.
Repeats mean_of(const Measurement &sheet, const std::vector<std::size_t> &places,
                ILLUM_OBS illuminant);

} // namespace vantrel::sheets
