// The colour of a spectrum, as a host shows it.
#pragma once

#include "read/measurement.h"

#include <cstdint>
#include <string>

namespace vantrel::sheets {

// Drive levels of the screen preview.
struct Rgb {
    std::uint8_t red = 0, green = 0, blue = 0;
};

struct Colour {
    CIELABCOORD lab{};
    Rgb rgb;
};

CIELABCOORD lab_of(const Spectrum &refl, ILLUM_OBS illuminant);

// The preview is that under D65, the white of displays: under another illuminant white paper would
// look tinted beside it.
Colour colour_of(const Spectrum &refl, ILLUM_OBS illuminant);

// As it looks under this illuminant to an eye that is adapted to the display.
Rgb preview_of(const Spectrum &refl, ILLUM_OBS illuminant);

// The usual illuminant to tell metamerism beside another: A beside daylight and lamps, D65 beside
// A, with the same observer.
ILLUM_OBS usual_second(ILLUM_OBS first);

CIELCHCOORD lch_of(const CIELABCOORD &lab);
double delta_e00(const CIELABCOORD &first, const CIELABCOORD &second);
std::string hex(const Rgb &rgb); // #rrggbb

} // namespace vantrel::sheets
