#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// One band of halftone_tint().
template <class V> V halftone_band(V ink, int percent, V paper)
{
    const double bare = 100.0 - percent;
    return percent == 0 ? paper : ink + (paper - ink) * bare / 100;
}

/// A tint as a halftone: ink and bare paper mixed by area (Murray-Davies).
Bands halftone_tint(Spectrum ink, int percent, Spectrum paper);

/// A tint as a film of that share of the full thickness.
Bands film_tint(Spectrum ink, int percent, Spectrum paper);

/// A tint of a colour: ink and paper mixed.
Lab colour_tint(const Lab &ink, int percent, const Lab &paper);

/// The colour that a preview shows for a tint: the lightnesses mixed, a* and b* of the ink.
Lab preview_tint(const Lab &ink, int percent, const Lab &paper);

} // namespace vantrel
