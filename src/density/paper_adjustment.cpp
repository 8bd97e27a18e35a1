#include "density/paper_adjustment.h"

#include "base/elementary.h"

namespace vantrel {

static double density_of(double refl) { return refl == 0 ? 100 : log10(100 / refl); }

// 100 / 10^(Ds + k (Ds - Dp))
double adjusted_for_paper(double refl, double paper)
{
    const double sample_density = density_of(refl);
    const double above_paper = sample_density - density_of(paper);
    const double gain = above_paper > 0.5 ? 1 : 2;
    return 100 / exp10(sample_density + gain * above_paper);
}

Bands adjusted_for_paper(Spectrum refl, Spectrum paper)
{
    Bands result;
    for (int i = 0; i < kBands; ++i)
        result[i] = adjusted_for_paper(refl[i], paper[i]);
    return result;
}

} // namespace vantrel
