#include "density/achromatic.h"

namespace vantrel {
namespace {

struct Line {
    double slope, intercept;
};

// State. The slope of the default line is cut to 14 decimals.
constinit AchromaticPoints points = {84, 14, 3, 11};
constinit Line line = {-0.11428571428571, 12.6};

} // namespace

const AchromaticPoints &achromatic_points() { return points; }

void set_achromatic_points(const AchromaticPoints &new_points)
{
    points = new_points;
    line.slope = (points.C2 - points.C1) / (points.L2 - points.L1);
    line.intercept = points.C2 - points.L2 * line.slope;
}

bool is_chromatic(double L, double C) { return C > line.slope * L + line.intercept; }

} // namespace vantrel
