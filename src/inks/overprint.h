#pragma once

#include "base/elementary.h"
#include "base/spectrum.h"

namespace vantrel {

namespace inks {

inline constexpr double kStrong = 0.6;      // from here on the lighter ink adds to the denser one,
inline constexpr double kLargestGain = 0.5; // by this density in the band where it absorbs most

template <class V> V band_density(V refl)
{
    constexpr double kOpaque = 999;
    const V density = log10(100 / refl);
    return select((refl == 0) | (density > kOpaque), kOpaque, density);
}

/// The densities of two inks in one band.
template <class V> struct Pair {
    V lighter, denser;
};

template <class V> Pair<V> pair(V d1, V d2)
{
    constexpr double none = elementary::kNan;
    return {select(d1 < d2, d1, select(d2 <= d1, d2, none)),
            select(d1 < d2, d2, select(d2 <= d1, d1, none))};
}

} // namespace inks

/// Two inks printed over one another: in each band the density of the denser ink, and where both
/// absorb strongly a share of the density of the other. A reading below 0 has no density; the
/// overprint is not a number in its band, and the other bands do not feel it.
template <class V> BandsOf<V> overprint(const BandsOf<V> &first, const BandsOf<V> &second)
{
    std::array<inks::Pair<V>, kBands> density;
    V largest = 0;
    for (int i = 0; i < kBands; ++i) {
        const auto [d1, d2] =
            side_by_side([](auto v) { return inks::band_density(v); }, first[i], second[i]);
        density[i] = inks::pair(d1, d2);
        largest = larger(largest, density[i].lighter);
    }
    const V share = select(largest != 0, inks::kLargestGain / largest, 0);
    BandsOf<V> refl;
    for (int i = 0; i < kBands; ++i) {
        const auto &[lighter, denser] = density[i];
        const V printed = select(lighter > inks::kStrong, denser + share * lighter, denser);
        refl[i] = 100 / exp10(printed);
    }
    return refl;
}
inline Bands overprint(Spectrum first, Spectrum second)
{
    return overprint<double>(bands(first), bands(second));
}

/// Colours of inks printed over one another, without spectra: their means. Each of three colours
/// has the weight 0.3333333.
Lab mean(const Lab &first, const Lab &second);
Lab mean(const Lab &first, const Lab &second, const Lab &third);

} // namespace vantrel
