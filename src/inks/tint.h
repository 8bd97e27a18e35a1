#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// A tint as a halftone: ink and bare paper mixed by area (Murray-Davies).
Bands halftone_tint(Spectrum ink, int percent, Spectrum paper);

/// A tint as a film of that share of the full thickness.
Bands film_tint(Spectrum ink, int percent, Spectrum paper);

/// A tint of a colour: ink and paper mixed.
Lab colour_tint(const Lab &ink, int percent, const Lab &paper);

/// The colour that a preview shows for a tint: the lightnesses mixed, a* and b* of the ink.
Lab preview_tint(const Lab &ink, int percent, const Lab &paper);

} // namespace vantrel
