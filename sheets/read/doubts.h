// What the numbers of a sheet say against themselves: slips of an export or of a hand.
#pragma once

#include "read/measurement.h"

#include <cstddef>
#include <string>
#include <vector>

namespace vantrel::sheets {

struct Doubt {
    std::size_t line; // 0 where it is about no single patch
    std::string text;
};

// Of reflectances in percent: rows that are fractions or were not measured, a patch as white as the
// perfect white, bands that read the same everywhere or stand out of those beside them,
// reflectances below zero, spectra that stand twice, and solids that read as another ink than the
// device values say. Of all: ink values that are no percentages, gaps in the count of ids or
// places, ids and names of several patches, and patches that are lighter than others with less ink.
// Held are values beyond the range that was measured.
std::vector<Doubt> doubts_about(const std::vector<Patch> &patches, Kind kind, bool held);

} // namespace vantrel::sheets
