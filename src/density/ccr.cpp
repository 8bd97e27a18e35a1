#include "density/ccr.h"

#include "base/elementary.h"
#include "base/numeric.h"
#include "density/weighted.h"

#include <algorithm>

namespace vantrel {
namespace {

struct Rgb {
    double r, g, b;
};

Rgb factors1(const Rgb &refl)
{
    const auto [R, G, B] = refl;
    constexpr double kCubeRoot = 0.33333333;
    return {0.836822509765625 + 0.1 * near_cube_root(R / G, kCubeRoot) +
                0.06171607971191406 * near_cube_root(G / R, kCubeRoot),
            0.97772216796875 + 0.05f * B / (R + G) + 0.0015811920166015625 * (R / G),
            0.9998779296875 + 0.00010299599671270698 * (G / B)};
}

Rgb factors2(const Rgb &refl)
{
    const auto [R, G, B] = refl;
    return {0.9293f - 0.003 * (R / G) + 0.01002f * (G / R), 0.952f - 0.0006f * (R / G),
            0.8988f + 0.05f * G / (R + B) + 0.02164f * (G / B)};
}

/// How much of the correction is left out: all of it from density 0.1 down, less and less as the
/// densest filter reads more.
double fade(double least)
{
    constexpr double kThreshold = 0.794328234;
    if (!(least < kThreshold))
        return 1;
    return square(square(square(1 - (kThreshold - least) / kThreshold)));
}

Rgb correction(const Rgb &refl, int status)
{
    const double f = fade(std::min({refl.r, refl.g, refl.b}));
    if (f == 1)
        return {1, 1, 1};
    const Rgb c = status == CCR1_STATUS ? factors1(refl) : factors2(refl);
    return {c.r - c.r * f + f, c.g - c.g * f + f, c.b - c.b * f + f};
}

Densities ccr_densities(Spectrum refl, int status)
{
    const Rgb rgb = {weighted_reflectance(refl, status, RED_RESPONSE) / 100,
                     weighted_reflectance(refl, status, GREEN_RESPONSE) / 100,
                     weighted_reflectance(refl, status, BLUE_RESPONSE) / 100};
    const Rgb c = correction(rgb, status);
    const double visual = status == CCR1_STATUS ? 0.75 * rgb.g + 0.25 * rgb.r
                                                : 0.763 * c.g * rgb.g + 0.237 * c.r * rgb.r;
    return {{0 - log10(visual), 0 - log10(c.r * rgb.r), 0 - log10(c.g * rgb.g),
             0 - log10(c.b * rgb.b)}};
}

} // namespace

Densities ccr_densities(Spectrum refl, Paper paper, int status)
{
    Densities set = ccr_densities(refl, status);
    if (paper) {
        const Densities paper_set = ccr_densities(*paper, status);
        for (int r = VISUAL_RESPONSE; r <= BLUE_RESPONSE; ++r)
            set.density[r] -= paper_set.density[r];
    }
    return set;
}

} // namespace vantrel
