#include "inks/error_weights.h"

#include "base/elementary.h"
#include "colorimetry/tristimulus.h"

#include <cmath>

namespace vantrel {

BandDifferences band_differences(Spectrum first, Spectrum second, ILLUM_OBS illum_obs)
{
    BandDifferences difference = xyz_by_band(second, illum_obs);
    const auto subtracted = xyz_by_band(first, illum_obs);
    for (int i = 0; i < kBands; ++i) {
        difference[i].x -= subtracted[i].x;
        difference[i].y -= subtracted[i].y;
        difference[i].z -= subtracted[i].z;
    }
    return difference;
}

// Signed cube roots, scaled so that the largest magnitude is 100.
static Bands scaled_roots(Bands values)
{
    double largest = 0;
    for (double &v : values) {
        const double root = near_cube_root(std::fabs(v), 0.333333333333);
        if (root > largest)
            largest = root;
        v = v < 0 ? -root : root;
    }
    if (largest > 0)
        for (double &v : values)
            v = v / largest * 100;
    return values;
}

// They weigh all bands of an output alike and drop out when it is scaled, save for its last bits.
static constexpr double kRedGreen = 25000000;
static constexpr double kYellowBlue = 8000000;

Bands a_error_weights(const BandDifferences &difference, const Xyz &white)
{
    const double kx = kRedGreen / white.x;
    const double ky = kRedGreen / white.y;
    Bands v;
    for (int i = 0; i < kBands; ++i)
        v[i] = kx * difference[i].x - ky * difference[i].y;
    return scaled_roots(v);
}

Bands b_error_weights(const BandDifferences &difference, const Xyz &white)
{
    const double ky = kYellowBlue / white.y;
    const double kz = kYellowBlue / white.z;
    Bands v;
    for (int i = 0; i < kBands; ++i)
        v[i] = ky * difference[i].y - kz * difference[i].z;
    return scaled_roots(v);
}

} // namespace vantrel
