#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// CIE 1976 ΔE*ab (CIE 15).
double delta_e76(const Lab &first, const Lab &second);

/// Signed CIE 1976 ΔH*ab (CIE 15): positive when the second hue lies counter-clockwise of the
/// first.
double delta_h(const Lab &first, const Lab &second);

/// CIE94 with kH = 1 (CIE 116), weighted by the chroma of the reference.
double delta_e94(const Lab &sample, const Lab &reference, double kL, double kC);

/// CMC(l:c) (ISO 105-J03).
double delta_e_cmc(const Lab &sample, const Lab &reference, double l, double c);

/// DIN 6172: how far the difference of a pair moves between two combinations.
double metamerism_index(Spectrum first, Spectrum second, ILLUM_OBS illum_obs1,
                        ILLUM_OBS illum_obs2);

} // namespace vantrel
