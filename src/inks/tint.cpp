#include "inks/tint.h"

#include "inks/film.h"

namespace vantrel {

Bands halftone_tint(Spectrum ink, int percent, Spectrum paper)
{
    Bands refl;
    for (int i = 0; i < kBands; ++i)
        refl[i] = halftone_band(ink[i], percent, paper[i]);
    return refl;
}

Bands film_tint(Spectrum ink, int percent, Spectrum paper)
{
    return film(ink, percent / 100.0, paper);
}

static double mixed(double ink, double percent, double paper)
{
    return ink * percent / 100 + paper * (100 - percent) / 100;
}

Lab colour_tint(const Lab &ink, int percent, const Lab &paper)
{
    return {mixed(ink.L, percent, paper.L), mixed(ink.a, percent, paper.a),
            mixed(ink.b, percent, paper.b)};
}

Lab preview_tint(const Lab &ink, int percent, const Lab &paper)
{
    const double t = percent / 100.0;
    return {ink.L * t + paper.L * (1 - t), ink.a, ink.b};
}

} // namespace vantrel
