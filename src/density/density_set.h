#pragma once

#include "base/spectrum.h"

namespace vantrel {

using Densities = DENSITYSTRUCT;

/// A density of a set and its response.
struct Extreme {
    double density;
    int response;
};

/// The largest density above 0; 0 and the preset response where there is none.
Extreme largest(const Densities &set, bool include_visual, int preset_response);

/// The smallest density below 100 that is not exactly 0; 100 and the preset response where there is
/// none.
Extreme smallest(const Densities &set, bool include_visual, int preset_response);

} // namespace vantrel
