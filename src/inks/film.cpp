#include "inks/film.h"

namespace vantrel {

Bands film(Spectrum ink, double thickness, Spectrum paper)
{
    Bands refl;
    for (int i = 0; i < kBands; ++i)
        refl[i] = film_band(ink[i], thickness, absorbance(paper[i]));
    return refl;
}

} // namespace vantrel
