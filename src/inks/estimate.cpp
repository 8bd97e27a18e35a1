#include "inks/estimate.h"

#include "inks/overprint.h"
#include "inks/tint.h"

#include <algorithm>
#include <cstddef>

namespace vantrel {

Bands estimate(const double *inks, Percentages percent, Spectrum paper, TintModel tint)
{
    const auto layer = [&](std::size_t i) {
        const Spectrum ink = spectrum(inks + kBands * i);
        return percent[i] < 100 ? tint(ink, percent[i], paper) : bands(ink);
    };
    Bands printed = layer(0);
    for (std::size_t i = 1; i < percent.size(); ++i)
        printed = overprint(printed, layer(i));
    return printed;
}

Lab estimate_colour(const double *inks, Percentages percent, const Lab &paper)
{
    const auto layer = [&](std::size_t i) {
        const Lab ink = lab_of(inks + 3 * i);
        return percent[i] < 100 ? colour_tint(ink, percent[i], paper) : ink;
    };
    if (percent.size() == 1)
        return layer(0);
    if (percent.size() == 2)
        return mean(layer(0), layer(1));
    const Lab printed = mean(layer(0), layer(1), layer(2));
    const bool all_tints =
        std::all_of(percent.begin(), percent.end(), [](int p) { return p < 100; });
    return all_tints ? Lab{printed.L, 0, 0} : printed;
}

} // namespace vantrel
