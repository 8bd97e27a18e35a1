#include "density/achromatic.h"

#include <cmath>

namespace vantrel {
namespace {

// State. The slope of the default line is cut to 14 decimals.
constinit AchromaticPoints points = {84, 14, 3, 11};
constinit AchromaticLine line_of_greys = {-0.11428571428571, 12.6};

} // namespace

const AchromaticPoints &achromatic_points() { return points; }

bool set_achromatic_points(const AchromaticPoints &through)
{
    const double slope = (through.C2 - through.C1) / (through.L2 - through.L1);
    const double intercept = through.C2 - through.L2 * slope;
    // An infinite L* makes a level line, which is finite.
    if (!std::isfinite(through.L1) || !std::isfinite(slope) || !std::isfinite(intercept))
        return false;
    points = through;
    line_of_greys = {slope, intercept};
    return true;
}

const AchromaticLine &achromatic_line() { return line_of_greys; }

} // namespace vantrel
