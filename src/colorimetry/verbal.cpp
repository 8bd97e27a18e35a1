#include "colorimetry/verbal.h"

#include "colorimetry/lab.h"

#include <cmath>

namespace vantrel {

Labch labch_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs)
{
    const Lab lab = lab_from_spectrum(refl, illum_obs);
    const Lch lch = lch_from_lab(rounded(lab));
    return {static_cast<float>(lab.L), static_cast<float>(lab.a), static_cast<float>(lab.b),
            static_cast<float>(lch.C), static_cast<float>(lch.h)};
}

static Word word(float difference, Word below, Word above)
{
    if (std::fabs(difference) <= 0.5f)
        return Word::on_target;
    return difference < 0 ? below : above;
}

Word lightness_word(const Labch &standard, const Labch &sample)
{
    return word(sample.L - standard.L, Word::too_dark, Word::too_light);
}

Word red_green_word(const Labch &standard, const Labch &sample)
{
    return word(sample.a - standard.a, Word::too_green, Word::too_red);
}

Word yellow_blue_word(const Labch &standard, const Labch &sample)
{
    return word(sample.b - standard.b, Word::too_blue, Word::too_yellow);
}

Word chroma_word(const Labch &standard, const Labch &sample)
{
    return word(sample.C - standard.C, Word::too_dull, Word::too_bright);
}

// The neighbours of a hue, clockwise and counter-clockwise, by the hue angle of the standard:
// each range excludes its lower and includes its upper bound.
struct HueRange {
    double upper;
    Word clockwise, counter_clockwise;
};
static constexpr HueRange kHueRanges[] = {
    {35, Word::too_blue, Word::too_yellow},       {55, Word::too_red, Word::too_yellow},
    {125, Word::too_red, Word::too_green},        {145, Word::too_yellow, Word::too_green},
    {215, Word::too_yellow, Word::too_blue},      {235, Word::too_green, Word::too_blue},
    {305, Word::too_green, Word::too_red},        {325, Word::too_blue, Word::too_red},
    {INFINITY, Word::too_blue, Word::too_yellow},
};

Word hue_word(const Labch &standard, const Labch &sample)
{
    const HueRange *range = kHueRanges;
    while (standard.h > range->upper)
        ++range;
    return word(sample.h - standard.h, range->clockwise, range->counter_clockwise);
}

} // namespace vantrel
