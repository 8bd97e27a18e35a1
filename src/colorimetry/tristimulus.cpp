#include "colorimetry/tristimulus.h"

#include "colorimetry/tristimulus_weights.h"

namespace vantrel {
namespace {

constexpr double kScale = 100000.0;

// The sums run in order of the bands, one lane each for X, Y and Z: the same bits on any processor.
[[gnu::always_inline]] inline Xyz integrate(Spectrum refl, TristimulusWeights &weights)
{
    Lanes sum{};
    for (int i = 0; i < kBands; ++i)
        sum += refl[i] * weights[i];
    return {sum[0] / kScale, sum[1] / kScale, sum[2] / kScale};
}

#ifdef __x86_64__
[[gnu::target("avx2")]] Xyz integrate_avx2(Spectrum refl, TristimulusWeights &weights)
{
    return integrate(refl, weights);
}
const bool has_avx2 = __builtin_cpu_supports("avx2");
#endif

} // namespace

Xyz xyz_from_spectrum(Spectrum refl, ILLUM_OBS illum_obs)
{
    TristimulusWeights &weights = tristimulus_weights(illum_obs);
#ifdef __x86_64__
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
        const Lanes band = refl[i] * weights[i] / kScale;
        bands[i] = {band[0], band[1], band[2]};
    }
    return bands;
}

} // namespace vantrel
