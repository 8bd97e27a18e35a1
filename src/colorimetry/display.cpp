#include "colorimetry/display.h"

#include "colorimetry/display_levels.h"

namespace vantrel {

// From XYZ to the linear intensities of the display: the inverse of the XYZ of its primaries at
// full drive, (24.831, 14.243, 1.5904), (27.747, 54.177, 10.143) and (16.107, 7.528, 83.690).
static constexpr double kRed[] = {0.0565079577, -0.0273655486, -0.00841397808};
static constexpr double kGreen[] = {-0.0149585, 0.026018255, 0.000538548644};
static constexpr double kBlue[] = {0.000739082442, -0.00263330137, 0.012043483};

static unsigned int level(const double (&row)[3], const Xyz &xyz)
{
    double v = row[0] * xyz.x + row[1] * xyz.y + row[2] * xyz.z;
    if (!(v > 0)) // also a not-a-number
        v = 0;
    else if (v > 0.999)
        v = 0.999;
    const double thousandths = v * 1000;
    const int whole = static_cast<int>(thousandths);
    return kDisplayLevels[thousandths - whole >= 0.5 ? whole + 1 : whole];
}

unsigned int rgb_from_xyz(const Xyz &xyz)
{
    return level(kRed, xyz) | level(kGreen, xyz) << 8 | level(kBlue, xyz) << 16;
}

} // namespace vantrel
