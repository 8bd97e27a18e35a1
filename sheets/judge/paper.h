// The paper of a sheet, which densities and differences are over.
#pragma once

#include "read/measurement.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

struct Paper {
    std::string name;
    Spectrum refl{};
    std::optional<CIELABCOORD> lab{}; // where the sheet holds colours alone
};

CIELABCOORD lab_of(const Paper &paper, ILLUM_OBS illuminant);

// The patch of this name or id. Without a name the first patch, with a warning where its device
// values have ink. Throws RequestError.
Paper paper_of(const Measurement &sheet, std::string_view name, std::vector<std::string> &warnings);

} // namespace vantrel::sheets
