#include "colorimetry/spaces.h"

#include "base/lanes.h"
#include "base/numeric.h"
#include "colorimetry/lab.h"

namespace vantrel {

Luv luv_from_xyz(const Xyz &xyz, const Xyz &white)
{
    const double L = lightness(xyz.y / white.y);
    const double d = xyz.x + 15 * xyz.y + 3 * xyz.z;
    if (d == 0)
        return {L, 0, 0};
    const double dn = white.x + 15 * white.y + 3 * white.z;
    return {L, 13 * L * (4 * xyz.x / d - 4 * white.x / dn),
            13 * L * (9 * xyz.y / d - 9 * white.y / dn)};
}

std::optional<Xyz> chromaticity(const Xyz &xyz)
{
    const double sum = xyz.x + xyz.y + xyz.z;
    if (sum == 0)
        return std::nullopt;
    return Xyz{xyz.x / sum, xyz.y / sum, xyz.z / sum};
}

std::optional<Yxy> yxy_from_xyz(const Xyz &xyz)
{
    const auto result = chromaticity(xyz);
    return result ? std::optional(Yxy{xyz.y, result->x, result->y}) : std::nullopt;
}

std::optional<HunterLab> hunter_from_xyz(const Xyz &xyz, const Illuminant &illuminant)
{
    if (!chromaticity(xyz))
        return std::nullopt;
    const auto &[white, ka, kb] = illuminant;
    const double yr = xyz.y / white.y;
    const double root = sqrt(yr);
    if (root == 0)
        return HunterLab{0, 0, 0};
    return HunterLab{100 * root, ka * (xyz.x / white.x - yr) / root,
                     kb * (yr - xyz.z / white.z) / root};
}

static double six_decimals(double v) { return whole_part(v * 1000000 + 0.5) / 1000000; }

static double cube(double v) { return six_decimals(v * v * v); }

static constexpr double kRootOffset = 16.0 / 116.0;

// The inverse of f: the line where it yields a small ratio, otherwise the cube.
static double ratio(double f)
{
    const double linear = six_decimals((f - kRootOffset) / kRootSlope);
    return linear > kLinearLimit ? cube(f) : linear;
}

Xyz xyz_from_lab(const Lab &lab, const Xyz &white)
{
    double yr = six_decimals(lab.L / kLightnessSlope);
    double fy;
    if (yr <= kLinearLimit) {
        fy = six_decimals(kRootSlope * yr + kRootOffset);
    } else {
        fy = (lab.L + 16) / 116;
        yr = cube(fy);
    }
    return {ratio(lab.a / 500 + fy) * white.x, yr * white.y, ratio(fy - lab.b / 200) * white.z};
}

} // namespace vantrel
