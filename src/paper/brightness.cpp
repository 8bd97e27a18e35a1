#include "paper/brightness.h"

#include "paper/brightness_weights.h"

namespace vantrel {

double brightness(Spectrum refl)
{
    double sum = 0;
    int i = 0;
    for (const BrightnessWeight &band : kBrightnessWeights)
        sum += band.weight * refl[i++];
    return sum / 100;
}

} // namespace vantrel
