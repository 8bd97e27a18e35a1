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

static const wchar_t *words(float difference, const wchar_t *below, const wchar_t *above)
{
    if (std::fabs(difference) <= 0.5f)
        return L"On Target";
    return difference < 0 ? below : above;
}

const wchar_t *lightness_words(const Labch &standard, const Labch &sample)
{
    return words(sample.L - standard.L, L"Too Dark", L"Too Light");
}

const wchar_t *red_green_words(const Labch &standard, const Labch &sample)
{
    return words(sample.a - standard.a, L"Too Green", L"Too Red");
}

const wchar_t *yellow_blue_words(const Labch &standard, const Labch &sample)
{
    return words(sample.b - standard.b, L"Too Blue", L"Too Yellow");
}

const wchar_t *chroma_words(const Labch &standard, const Labch &sample)
{
    return words(sample.C - standard.C, L"Too Dull", L"Too Bright");
}

// The neighbours of a hue, clockwise and counter-clockwise, by the hue angle of the standard:
// each range excludes its lower and includes its upper bound.
struct HueRange {
    double upper;
    const wchar_t *clockwise, *counter_clockwise;
};
static constexpr HueRange kHueRanges[] = {
    {35, L"Too Blue", L"Too Yellow"},       {55, L"Too Red", L"Too Yellow"},
    {125, L"Too Red", L"Too Green"},        {145, L"Too Yellow", L"Too Green"},
    {215, L"Too Yellow", L"Too Blue"},      {235, L"Too Green", L"Too Blue"},
    {305, L"Too Green", L"Too Red"},        {325, L"Too Blue", L"Too Red"},
    {INFINITY, L"Too Blue", L"Too Yellow"},
};

const wchar_t *hue_words(const Labch &standard, const Labch &sample)
{
    const HueRange *range = kHueRanges;
    while (standard.h > range->upper)
        ++range;
    return words(sample.h - standard.h, range->clockwise, range->counter_clockwise);
}

} // namespace vantrel
