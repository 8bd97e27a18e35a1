// What to change at the press so that a solid comes nearer to its aim.
#pragma once

#include "read/measurement.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace vantrel::sheets {

struct Advice {
    double thickness = 1;      // of the film, 1 as printed
    double density_change = 0; // in the response that reads the solid
    double de00 = 0;           // to the aim, as printed
    double de00_after = 0;     // with this film
};

// How far the model can be trusted, in two lines.
inline constexpr std::string_view kAdviceFrom =
    "Film model: on measured ramps its change was within 0.02 of the right one where it came to "
    "ΔE00 2 of the aim,";
inline constexpr std::string_view kAdviceElse = "and off by up to 1.4 where it did not.";

std::string advice_from(); // both

// "more ink", "less ink", "on its aim", or why ink does not bring it there. Where the nearest film
// is farther than ΔE00 2 the hue is off by ink, paper or trapping; ink is changed where that takes
// away ΔE00 0.5 and a fifth of the difference at the least.
std::string_view words_of(const Advice &advice);

struct SolidAdvice {
    std::string ink;
    Advice advice;
    std::string patch{};   // the solid, of several the first
    std::size_t count = 1; // of which this is for the mean
};
std::string name_of(const SolidAdvice &advice); // "M100 (mean of 6)"

// The film of this ink on this paper that comes nearest to the aim, a quarter to four times as
// thick as it was printed; EstimateReflsForThickness(). Nothing where no response reads the solid.
std::optional<Advice> advise(const Spectrum &solid, const Spectrum &paper, const CIELABCOORD &aim,
                             ILLUM_OBS illuminant, int status);

} // namespace vantrel::sheets
