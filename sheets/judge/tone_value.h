// The tone value of spot colours.
#pragma once

#include <vantrel.h>

#include <optional>

namespace vantrel::sheets {

// Spot colour tone value (ISO 20654) in percent; nothing where the solid has the paper's colour.
std::optional<double> spot_colour_tone_value(const CIELABCOORD &paper, const CIELABCOORD &solid,
                                             const CIELABCOORD &tint);

} // namespace vantrel::sheets
