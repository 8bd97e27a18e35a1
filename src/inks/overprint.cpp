#include "inks/overprint.h"

#include <array>
#include <cmath>
#include <limits>

namespace vantrel {
namespace {

constexpr double kStrong = 0.6;      // from here on the lighter ink adds to the denser one,
constexpr double kLargestGain = 0.5; // by this density in the band where it absorbs most

double band_density(double refl)
{
    constexpr double kOpaque = 999;
    const double density = std::log10(100 / refl);
    return refl == 0 || density > kOpaque ? kOpaque : density;
}

/// The densities of two inks in one band.
struct Pair {
    double lighter, denser;
};

Pair pair(double d1, double d2)
{
    if (d1 < d2)
        return {d1, d2};
    if (d2 <= d1)
        return {d2, d1};
    constexpr double none = std::numeric_limits<double>::quiet_NaN();
    return {none, none};
}

} // namespace

Bands overprint(Spectrum first, Spectrum second)
{
    std::array<Pair, kBands> density;
    double largest = 0;
    for (int i = 0; i < kBands; ++i) {
        density[i] = pair(band_density(first[i]), band_density(second[i]));
        if (density[i].lighter > largest)
            largest = density[i].lighter;
    }
    const double share = largest != 0 ? kLargestGain / largest : 0;
    Bands refl;
    for (int i = 0; i < kBands; ++i) {
        double printed = density[i].denser;
        if (density[i].lighter > kStrong)
            printed += share * density[i].lighter;
        refl[i] = 100 / std::pow(10.0, printed);
    }
    return refl;
}

static double mean_of(double v1, double v2) { return 0.5 * v1 + 0.5 * v2; }

static double mean_of(double v1, double v2, double v3)
{
    constexpr double third = 0.3333333;
    return v1 * third + v2 * third + v3 * third;
}

Lab mean(const Lab &first, const Lab &second)
{
    return {mean_of(first.L, second.L), mean_of(first.a, second.a), mean_of(first.b, second.b)};
}

Lab mean(const Lab &first, const Lab &second, const Lab &third)
{
    return {mean_of(first.L, second.L, third.L), mean_of(first.a, second.a, third.a),
            mean_of(first.b, second.b, third.b)};
}

} // namespace vantrel
