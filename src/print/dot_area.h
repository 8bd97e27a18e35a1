#pragma once

#include "base/elementary.h"
#include "base/spectrum.h"

namespace vantrel {

/// The light that a density absorbs.
template <class V> V absorptance(V density, double n) { return 1 - exp10(-density / n); }

/// Dot area in percent of a tint beside its solid, by what they absorb; 100 where the solid absorbs
/// nothing.
template <class V> V absorbed_area(V solid, V tint)
{
    return select(solid == 0, 100, 100 * (tint / solid));
}

/// Yule-Nielsen dot area in percent of a tint of density Dt beside its solid of density Ds; with
/// n = 1 it is Murray-Davies.
inline double dot_area(double Ds, double Dt, double n)
{
    const auto [solid, tint] = side_by_side([n](auto D) { return absorptance(D, n); }, Ds, Dt);
    return absorbed_area(solid, tint);
}

/// Its inverse: the tint density of a dot area in percent.
double tint_density(double Ds, double dot_area, double n);

/// The dot area of a measured tint; nothing where a density cannot be measured or n is 0.
std::optional<double> dot_area(Spectrum solid, Spectrum tint, Paper paper, int status, int response,
                               double n);

/// What a tint has over its nominal dot area, not below 0.
template <class V> V dot_gain(V area, int nominal)
{
    return select(area >= nominal, area - nominal, 0);
}

/// What a measured tint has over its nominal dot area, not below 0; nothing as for dot_area.
std::optional<double> dot_gain(Spectrum solid, Spectrum tint, Paper paper, int status, int response,
                               double n, int nominal);

} // namespace vantrel
