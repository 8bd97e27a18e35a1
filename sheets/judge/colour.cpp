#include "judge/colour.h"

#include <fmt/compile.h>
#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>

namespace vantrel::sheets {
namespace {

bool has_ten_degrees(ILLUM_OBS illuminant) { return illuminant % 2 == 1; }

using Matrix = double[3][3];

// Bradford adaptation from D50 to D65, and XYZ under D65 to linear sRGB: CSS Color Module Level 4,
// sample code for colour conversions.
constexpr Matrix d50_to_d65 = {
    {0.955473421488075, -0.02309845494876471, 0.06325924320057072},
    {-0.0283697093338637, 1.0099953980813041, 0.021041441191917323},
    {0.012314014864481998, -0.020507649298898964, 1.330365926242124},
};
constexpr Matrix xyz_to_linear = {
    {12831.0 / 3959, -329.0 / 214, -1974.0 / 3959},
    {-851781.0 / 878810, 1648619.0 / 878810, 36519.0 / 878810},
    {705.0 / 12673, -2585.0 / 12673, 705.0 / 667},
};

using Triple = std::array<double, 3>;

Triple product(const Matrix &matrix, const Triple &vector)
{
    Triple out{};
    for (std::size_t i = 0; i < 3; ++i)
        for (std::size_t j = 0; j < 3; ++j)
            out[i] += matrix[i][j] * vector[j];
    return out;
}

// IEC 61966-2-1; what is outside the display's gamut is cut off, and black where it is no number.
std::uint8_t level_of(double linear)
{
    if (!(linear > 0))
        return 0;
    const double v = linear <= 0.0031308 ? 12.92 * linear
                                         : 1.055 * std::pow(std::min(linear, 1.0), 1 / 2.4) - 0.055;
    return static_cast<std::uint8_t>(std::lround(255 * v));
}

// The eye is adapted to the white that L*a*b* is of, on the display as on the sheet: whatever the
// illuminant, the same L*a*b* is shown alike.
Rgb srgb_of(const CIELABCOORD &lab)
{
    const double from[3] = {lab.L, lab.a, lab.b};
    double xyz[3];
    LabToXYZ(from, D50_2DEG, xyz);
    const Triple d65 = product(d50_to_d65, {xyz[0] / 100, xyz[1] / 100, xyz[2] / 100});
    const Triple linear = product(xyz_to_linear, d65);
    return {level_of(linear[0]), level_of(linear[1]), level_of(linear[2])};
}

} // namespace

CIELABCOORD lab_of(const Spectrum &refl, ILLUM_OBS illuminant)
{
    double lab[3];
    ReflToCIELAB(refl.data(), illuminant, lab);
    return {lab[0], lab[1], lab[2]};
}

CIELABCOORD lab_of(const Measurement &sheet, const Patch &patch, ILLUM_OBS illuminant)
{
    return sheet.kind == Kind::colours ? patch.lab.value() : lab_of(patch.refl, illuminant);
}

Colour colour_of(const CIELABCOORD &lab) { return {lab, srgb_of(lab)}; }

Colour colour_of(const Spectrum &refl, ILLUM_OBS illuminant)
{
    return colour_of(lab_of(refl, illuminant));
}

Colour colour_of(const Measurement &sheet, const Patch &patch, ILLUM_OBS illuminant)
{
    return colour_of(lab_of(sheet, patch, illuminant));
}

ILLUM_OBS usual_second(ILLUM_OBS first)
{
    if (first == A_2DEG || first == A_10DEG)
        return has_ten_degrees(first) ? D65_10DEG : D65_2DEG;
    return has_ten_degrees(first) ? A_10DEG : A_2DEG;
}

CIELCHCOORD lch_of(const CIELABCOORD &lab)
{
    const double from[3] = {lab.L, lab.a, lab.b};
    double lch[3];
    CIELabToCIELCH(from, lch);
    return {lch[0], lch[1], lch[2]};
}

double delta_e00(const CIELABCOORD &first, const CIELABCOORD &second)
{
    double delta_e = 0;
    LabToDE2000(&first, &second, 1, 1, &delta_e);
    return delta_e;
}

std::string hex(const Rgb &rgb)
{
    return fmt::format(FMT_COMPILE("#{:02x}{:02x}{:02x}"), rgb.red, rgb.green, rgb.blue);
}

} // namespace vantrel::sheets
