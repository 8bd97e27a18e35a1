#include "density/hue_gray.h"

namespace vantrel {

HueGray hue_gray(const Densities &set)
{
    const double high = largest(set, false, RED_RESPONSE).density;
    const double low = smallest(set, false, RED_RESPONSE).density;
    const double middle = set.density[RED_RESPONSE] + set.density[GREEN_RESPONSE] +
                          set.density[BLUE_RESPONSE] - high - low;
    return {high == 0 ? 100 : 100 * (low / high),
            high == low ? 100 : 100 * ((middle - low) / (high - low))};
}

} // namespace vantrel
