#include "density/density_set.h"

namespace vantrel {

Extreme largest(const Densities &set, bool include_visual, int preset_response)
{
    Extreme result = {0, preset_response};
    for (int r = include_visual ? VISUAL_RESPONSE : RED_RESPONSE; r < NUM_RESPONSES; ++r)
        if (set.density[r] > result.density)
            result = {set.density[r], r};
    return result;
}

Extreme smallest(const Densities &set, bool include_visual, int preset_response)
{
    Extreme result = {100, preset_response};
    for (int r = include_visual ? VISUAL_RESPONSE : RED_RESPONSE; r < NUM_RESPONSES; ++r)
        if (set.density[r] != 0 && set.density[r] < result.density)
            result = {set.density[r], r};
    return result;
}

} // namespace vantrel
