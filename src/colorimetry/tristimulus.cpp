#include "colorimetry/tristimulus.h"

#include <cstring>

namespace vantrel {

Xyz integrate(Spectrum refl, TristimulusWeights &weights)
{
    Pair xy{}, z{};
    for (int i = 0; i < kBands; ++i) {
        xy += refl[i] * weights[i].xy;
        z += refl[i] * weights[i].z;
    }
    return {xy[0] / kWeightScale, xy[1] / kWeightScale, z[0] / kWeightScale};
}

#ifdef VANTREL_AVX2
[[gnu::target("avx2")]] Xyz integrate_avx2(Spectrum refl, TristimulusWeights &weights)
{
    using Lanes = double __attribute__((vector_size(32)));
    Lanes sum{};
    for (int i = 0; i < kBands; ++i) {
        Lanes band;
        std::memcpy(&band, &weights[i], sizeof band);
        sum += refl[i] * band;
    }
    return {sum[0] / kWeightScale, sum[1] / kWeightScale, sum[2] / kWeightScale};
}

// False until the library is initialised: a call before that takes the plain way.
static const bool has_avx2 = __builtin_cpu_supports("avx2");
#endif

Xyz xyz_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs)
{
    TristimulusWeights &weights = tristimulus_weights(illum_obs);
#ifdef VANTREL_AVX2
    if (has_avx2)
        return integrate_avx2(refl, weights);
#endif
    return integrate(refl, weights);
}

std::array<Xyz, kBands> xyz_by_band(Spectrum refl, ILLUM_OBS illum_obs)
{
    TristimulusWeights &weights = tristimulus_weights(illum_obs);
    std::array<Xyz, kBands> bands;
    for (int i = 0; i < kBands; ++i) {
        const Pair xy = refl[i] * weights[i].xy / kWeightScale;
        bands[i] = {xy[0], xy[1], refl[i] * weights[i].z[0] / kWeightScale};
    }
    return bands;
}

} // namespace vantrel
