// The colour of a spectrum, as a host shows it.
#pragma once

#include "read/measurement.h"

#include <cstdint>
#include <string>

namespace vantrel::sheets {

// sRGB levels of the screen preview.
struct Rgb {
    std::uint8_t red = 0, green = 0, blue = 0;
};

struct Colour {
    CIELABCOORD lab{};
    Rgb rgb;
};

CIELABCOORD lab_of(const Spectrum &refl, ILLUM_OBS illuminant);

// Of a patch of this sheet: where the sheet holds colours alone, what it says, for whichever
// illuminant.
CIELABCOORD lab_of(const Measurement &sheet, const Patch &patch, ILLUM_OBS illuminant);

// The preview is the sRGB colour of the same L*a*b*, adapted from D50.
Colour colour_of(const CIELABCOORD &lab);
Colour colour_of(const Spectrum &refl, ILLUM_OBS illuminant);
Colour colour_of(const Measurement &sheet, const Patch &patch, ILLUM_OBS illuminant);

// The usual illuminant to tell metamerism beside another: A beside daylight and lamps, D65 beside
// A, with the same observer.
ILLUM_OBS usual_second(ILLUM_OBS first);

CIELCHCOORD lch_of(const CIELABCOORD &lab);
double delta_e00(const CIELABCOORD &first, const CIELABCOORD &second);
std::string hex(const Rgb &rgb); // #rrggbb

} // namespace vantrel::sheets
