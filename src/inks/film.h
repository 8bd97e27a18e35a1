#pragma once

#include "base/elementary.h"
#include "base/spectrum.h"
#include "inks/saunderson.h"

namespace vantrel {

// The surface of a printed film.
inline constexpr double kFilmSurface = 0;
inline constexpr double kFilmInside = 0.6;

/// Absorbance of a layer in natural logarithms.
template <class V> V absorbance(V refl)
{
    return 2 - log(saunderson(refl, kFilmSurface, kFilmInside));
}

/// One band of film() over a paper of absorbance Dp.
template <class V> V film_band(V ink, double thickness, V Dp)
{
    const V Di = thickness == 0 ? V(0) : (absorbance(ink) - Dp) * thickness;
    const V printed = exp(2 - select(Di < 0, 0, Di) - Dp);
    return select(ink < kBlack, ink, unsaunderson(printed, kFilmSurface, kFilmInside));
}

/// The spectrum of an ink at a relative film thickness (1 is the film as measured): Beer-Lambert
/// between Saunderson corrections, nowhere lighter than the paper.
Bands film(Spectrum ink, double thickness, Spectrum paper);

} // namespace vantrel
