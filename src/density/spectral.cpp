#include "density/spectral.h"

#include "base/elementary.h"
#include "density/paper_adjustment.h"

#include <algorithm>

namespace vantrel {

double spectral_density(double refl) { return 0 - log10(std::max(refl, 1e-5) / 100); }

int darkest_wavelength(Spectrum refl, Paper paper)
{
    if (paper)
        return darkest_wavelength(adjusted_for_paper(refl, *paper), std::nullopt);
    int darkest = 2;
    double largest = 0;
    for (int band = 2; band < kBands; band += 2) {
        const double density = spectral_density(refl[band]);
        if (density > largest) {
            darkest = band;
            largest = density;
        }
    }
    return 400 + 10 * darkest;
}

} // namespace vantrel
