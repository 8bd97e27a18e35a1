#include "paper/whiteness.h"

#include "paper/whiteness_references.h"

namespace vantrel {

std::optional<double> whiteness(const Yxy &colour, ILLUM_OBS illum_obs)
{
    for (const auto &[reference, xn, yn] : kWhitenessReferences) {
        if (reference != illum_obs)
            continue;
        double W = colour.Y + 800 * (xn - colour.x);
        W += 1700 * (yn - colour.y);
        if (W > 40 && W < 5 * colour.Y - 280)
            return W;
    }
    return std::nullopt;
}

} // namespace vantrel
