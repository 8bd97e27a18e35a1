#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Two inks printed over one another: in each band the density of the denser ink, and where both
/// absorb strongly a share of the density of the other. A reading below 0 has no density; the
/// overprint is not a number in its band, and the other bands do not feel it.
Bands overprint(Spectrum first, Spectrum second);

/// Colours of inks printed over one another, without spectra: their means. Each of three colours
/// has the weight 0.3333333.
Lab mean(const Lab &first, const Lab &second);
Lab mean(const Lab &first, const Lab &second, const Lab &third);

} // namespace vantrel
