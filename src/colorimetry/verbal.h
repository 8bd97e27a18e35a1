#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// L*, a*, b*, C*, h in single precision; a* and b* as they are, C* and h of the rounded ones.
struct Labch {
    float L, a, b, C, h;
};

Labch labch_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs);

/// The words of a difference; the first one stands for none.
enum class Word {
    none,
    on_target,
    too_dark,
    too_light,
    too_green,
    too_red,
    too_blue,
    too_yellow,
    too_bright,
    too_dull
};
inline constexpr const wchar_t *kWords[] = {L"",           L"On Target", L"Too Dark", L"Too Light",
                                            L"Too Green",  L"Too Red",   L"Too Blue", L"Too Yellow",
                                            L"Too Bright", L"Too Dull"};

// How a sample differs from its standard, coordinate by coordinate.
Word lightness_word(const Labch &standard, const Labch &sample);
Word red_green_word(const Labch &standard, const Labch &sample);
Word yellow_blue_word(const Labch &standard, const Labch &sample);
Word chroma_word(const Labch &standard, const Labch &sample);
Word hue_word(const Labch &standard, const Labch &sample);

} // namespace vantrel
