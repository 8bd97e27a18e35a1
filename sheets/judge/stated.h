// What files say of the illuminant and the observer of their colours.
#pragma once

#include "read/measurement.h"

#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

struct IlluminantChoice {
    ILLUM_OBS illuminant;
    std::string by; // "request", "file" or "default"

    operator ILLUM_OBS() const { return illuminant; }
};

// The one asked for, or else what the first of the files states that states any, files of colours
// alone before others, or else D50, 2 degrees. Throws RequestError where two files of colours alone
// state different ones. Warns where a file states another one, one that the library does not have,
// or, holding colours alone, none, and where the L*a*b* that a file holds beside its spectra are
// not theirs.
IlluminantChoice illuminant_for(const std::optional<ILLUM_OBS> &wish,
                                const std::vector<const Measurement *> &sheets,
                                std::vector<std::string> &warnings);

} // namespace vantrel::sheets
