#include "colorimetry/illuminants.h"

namespace vantrel {
namespace {

struct IlluminantRow {
    ILLUM_OBS illum_obs;
    Illuminant illuminant;
};

// White points of ASTM E308; those of F12 are the sums of its weights in tristimulus_weights.cpp.
// Hunter's constants: 175 and 70 for C_2DEG, for the others about 175 √(Xn / 98.074) and
// 70 √(Zn / 118.232).
// clang-format off
constexpr IlluminantRow kIlluminants[] = {
    {A_2DEG,    {{109.850, 100.000,  35.585}, 185.21, 38.41}},
    {A_10DEG,   {{111.144, 100.000,  35.200}, 186.30, 38.20}},
    {C_2DEG,    {{ 98.074, 100.000, 118.232}, 175.00, 70.00}},
    {C_10DEG,   {{ 97.285, 100.000, 116.145}, 174.30, 69.38}},
    {D50_2DEG,  {{ 96.422, 100.000,  82.521}, 173.52, 58.48}},
    {D50_10DEG, {{ 96.720, 100.000,  81.427}, 173.79, 58.10}},
    {D65_2DEG,  {{ 95.047, 100.000, 108.883}, 172.28, 67.18}},
    {D65_10DEG, {{ 94.811, 100.000, 107.304}, 172.06, 66.69}},
    {F2_2DEG,   {{ 99.186, 100.000,  67.393}, 175.99, 52.85}},
    {F2_10DEG,  {{103.279, 100.000,  69.027}, 179.59, 53.49}},
    {F7_2DEG,   {{ 95.041, 100.000, 108.747}, 172.28, 67.14}},
    {F7_10DEG,  {{ 95.792, 100.000, 107.686}, 172.95, 66.81}},
    {F11_2DEG,  {{100.962, 100.000,  64.350}, 177.56, 51.65}},
    {F11_10DEG, {{103.863, 100.000,  65.607}, 180.10, 52.16}},
    {F12_2DEG,  {{108.112, 100.005,  39.245}, 183.74, 40.33}},
    {F12_10DEG, {{111.379,  99.997,  40.365}, 186.50, 40.91}},
    {D75_2DEG,  {{ 94.972, 100.000, 122.638}, 172.18, 71.34}},
    {D75_10DEG, {{ 94.416, 100.000, 120.641}, 171.45, 70.79}},
};
// clang-format on

constexpr bool illuminants_in_order()
{
    int i = 0;
    for (const IlluminantRow &row : kIlluminants)
        if (row.illum_obs != i++)
            return false;
    return i == NUM_ILLUM_OBS;
}
static_assert(illuminants_in_order());

// A digit that slips changes the sum of its column.
constexpr bool adds_up(double (*value)(const Illuminant &), double sum)
{
    for (const IlluminantRow &row : kIlluminants)
        sum -= value(row.illuminant);
    return -1e-9 < sum && sum < 1e-9;
}
static_assert(adds_up([](const Illuminant &i) { return i.white.x; }, 1806.355));
static_assert(adds_up([](const Illuminant &i) { return i.white.y; }, 1800.002));
static_assert(adds_up([](const Illuminant &i) { return i.white.z; }, 1490.996));
static_assert(adds_up([](const Illuminant &i) { return i.ka; }, 3184.80));
static_assert(adds_up([](const Illuminant &i) { return i.kb; }, 1033.91));

} // namespace

const Illuminant &illuminant(ILLUM_OBS illum_obs) { return kIlluminants[illum_obs].illuminant; }

} // namespace vantrel
