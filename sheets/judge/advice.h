// What to change at the press so that a solid comes nearer to its aim.
#pragma once

#include "read/measurement.h"

#include <optional>
#include <string>
#include <string_view>

namespace vantrel::sheets {

struct Advice {
    double thickness = 1;      // of the film, 1 as printed
    double density_change = 0; // in the response that reads the solid
    double de00 = 0;           // to the aim, as printed
    double de00_after = 0;     // with this film

    // Whether ink alone brings it there: otherwise the hue is off by ink, paper or trapping.
    bool reaches_aim() const { return de00_after <= kReached; }

    static constexpr double kReached = 2; // ΔE00
};

// How far the model can be trusted, in two lines.
inline constexpr std::string_view kAdviceFrom =
    "Film model: on measured ramps its change was within 0.02 of the right one where it came to "
    "ΔE00 2 of the aim,";
inline constexpr std::string_view kAdviceElse = "and off by up to 0.6 where it did not.";

std::string advice_from(); // both

// "more ink", "less ink", "on its aim", or why ink does not bring it there.
std::string_view words_of(const Advice &advice);

struct SolidAdvice {
    std::string ink;
    Advice advice;
    std::string patch{}; // the solid; empty for the mean of its zones
};

// The film of this ink on this paper that comes nearest to the aim, between half and twice as thick
// as it was printed; EstimateReflsForThickness(). Nothing where no response reads the solid.
std::optional<Advice> advise(const Spectrum &solid, const Spectrum &paper, const CIELABCOORD &aim,
                             ILLUM_OBS illuminant, int status);

} // namespace vantrel::sheets
