// The colour of a spectrum, as a host shows it.
#ifndef VANTREL_TOOL_COLOUR_H
#define VANTREL_TOOL_COLOUR_H

#include <cstdint>
#include <string>

#include "measurement.h"

// Drive levels of the screen preview.
struct Rgb {
    std::uint8_t red = 0, green = 0, blue = 0;
};

struct Colour {
    CIELABCOORD lab{};
    Rgb rgb;
};

Colour colour_of(const Spectrum &refl, ILLUM_OBS illuminant);
CIELCHCOORD lch_of(const CIELABCOORD &lab);
double delta_e00(const CIELABCOORD &first, const CIELABCOORD &second);
std::string hex(const Rgb &rgb); // #rrggbb

#endif
