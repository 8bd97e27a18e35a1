#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// L*, a*, b*, C*, h in single precision; a* and b* as they are, C* and h of the rounded ones.
struct Labch {
    float L, a, b, C, h;
};

Labch labch_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs);

// How a sample differs from its standard, coordinate by coordinate.
const wchar_t *lightness_words(const Labch &standard, const Labch &sample);
const wchar_t *red_green_words(const Labch &standard, const Labch &sample);
const wchar_t *yellow_blue_words(const Labch &standard, const Labch &sample);
const wchar_t *chroma_words(const Labch &standard, const Labch &sample);
const wchar_t *hue_words(const Labch &standard, const Labch &sample);

} // namespace vantrel
