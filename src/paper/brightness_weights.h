#pragma once

namespace vantrel {

/// A band of the brightness function, with its weight in percent.
struct BrightnessWeight {
    int nanometres;
    double weight;
};

// The blue-weighted brightness function of paper with its maximum at 460 nm, in the manner of the
// R457 of ISO 2470, at 10 nm.
// clang-format off
inline constexpr BrightnessWeight kBrightnessWeights[] = {
    {400,  0.225},
    {410,  1.490},
    {420,  3.923},
    {430,  7.451},
    {440, 12.333},
    {450, 17.591},
    {460, 21.028},
    {470, 18.665},
    {480, 11.402},
    {490,  4.569},
    {500,  1.264},
    {510,  0.062},
    {520, -0.004},
};
// clang-format on

constexpr bool brightness_weights_hold()
{
    double sum = 0;
    int nanometres = 400;
    for (const BrightnessWeight &band : kBrightnessWeights) {
        if (band.nanometres != nanometres)
            return false;
        nanometres += 10;
        sum += band.weight;
    }
    return nanometres == 530 && 99.99899999 < sum && sum < 99.99900001;
}
static_assert(brightness_weights_hold());

} // namespace vantrel
