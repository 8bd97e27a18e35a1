#pragma once

#include "vantrel.h"

#include <algorithm>
#include <array>
#include <optional>
#include <span>

namespace vantrel {

inline constexpr int kBands = VANTREL_BANDS;

/// Reflectance in percent, band i at 400 + 10 i nm.
using Spectrum = std::span<const double, kBands>;
/// A spectrum, or one value for each band, by value.
using Bands = std::array<double, kBands>;
template <class V> using BandsOf = std::array<V, kBands>;
/// A spectrum that is written.
using SpectrumOut = std::span<double, kBands>;

/// The paper that a reading is relative to, if any.
using Paper = std::optional<Spectrum>;

// Records of one colour, or of several side by side: V is double or Lanes<N>.
template <class V> struct Colour {
    struct Lab {
        V L, a, b;
    };
    struct Lch {
        V L, C, h;
    };
};
template <> struct Colour<double> {
    using Lab = CIELABCOORD;
    using Lch = CIELCHCOORD;
};
template <class V> using LabOf = typename Colour<V>::Lab;
template <class V> using LchOf = typename Colour<V>::Lch;
using Lab = LabOf<double>;
using Lch = LchOf<double>;

/// Tristimulus values, Y = 100 for the perfect white.
template <class V> struct XyzOf {
    V x, y, z;
};
using Xyz = XyzOf<double>;

inline Spectrum spectrum(const double *refl) { return Spectrum(refl, kBands); }
inline SpectrumOut spectrum_out(double *refl) { return SpectrumOut(refl, kBands); }

inline Bands bands(Spectrum refl)
{
    Bands copy;
    std::copy(refl.begin(), refl.end(), copy.begin());
    return copy;
}
inline void store(const Bands &values, double *out) { std::copy_n(values.begin(), kBands, out); }

inline Paper paper(const double *refl) { return refl ? Paper(spectrum(refl)) : std::nullopt; }

inline bool is_illum_obs(int illum_obs) { return illum_obs >= 0 && illum_obs < NUM_ILLUM_OBS; }

/// Three doubles of a caller as a record, and back.
inline Xyz xyz_of(const double *v) { return {v[0], v[1], v[2]}; }
inline Lab lab_of(const double *v) { return {v[0], v[1], v[2]}; }
inline Lch lch_of(const double *v) { return {v[0], v[1], v[2]}; }

template <class Record> void store(const Record &record, double *out)
{
    const auto [first, second, third] = record;
    out[0] = first;
    out[1] = second;
    out[2] = third;
}

/// A result that there may not be; 1 where there is one.
inline int store(const std::optional<double> &result, double *out)
{
    if (!result)
        return 0;
    *out = *result;
    return 1;
}

} // namespace vantrel
