#include "judge/colour.h"

#include <fmt/format.h>

namespace vantrel::sheets {
namespace {

bool has_ten_degrees(ILLUM_OBS illuminant) { return illuminant % 2 == 1; }

} // namespace

CIELABCOORD lab_of(const Spectrum &refl, ILLUM_OBS illuminant)
{
    double lab[3];
    ReflToCIELAB(refl.data(), illuminant, lab);
    return {lab[0], lab[1], lab[2]};
}

Colour colour_of(const Spectrum &refl, ILLUM_OBS illuminant)
{
    return {lab_of(refl, illuminant),
            preview_of(refl, has_ten_degrees(illuminant) ? D65_10DEG : D65_2DEG)};
}

Rgb preview_of(const Spectrum &refl, ILLUM_OBS illuminant)
{
    unsigned int rgb = 0;
    ReflToRGB(refl.data(), illuminant, &rgb);
    const auto level = [&](int shift) { return static_cast<std::uint8_t>(rgb >> shift & 0xFF); };
    return {level(0), level(8), level(16)};
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
    return fmt::format("#{:02x}{:02x}{:02x}", rgb.red, rgb.green, rgb.blue);
}

} // namespace vantrel::sheets
