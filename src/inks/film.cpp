#include "inks/film.h"

#include "inks/saunderson.h"

#include <cmath>

namespace vantrel {

// The surface of a printed film.
static constexpr double kSurface = 0;
static constexpr double kInside = 0.6;

// Absorbance of a layer in natural logarithms.
static double absorbance(double refl) { return 2 - std::log(saunderson(refl, kSurface, kInside)); }

Bands film(Spectrum ink, double thickness, Spectrum paper)
{
    Bands refl;
    for (int i = 0; i < kBands; ++i) {
        if (ink[i] < kBlack) {
            refl[i] = ink[i];
            continue;
        }
        const double Dp = absorbance(paper[i]);
        double Di = thickness == 0 ? 0 : (absorbance(ink[i]) - Dp) * thickness;
        if (Di < 0)
            Di = 0;
        refl[i] = unsaunderson(std::exp(2 - Di - Dp), kSurface, kInside);
    }
    return refl;
}

} // namespace vantrel
