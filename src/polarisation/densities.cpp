#include "polarisation/densities.h"

#include "density/density.h"

namespace vantrel {
namespace {

/// Which channel adjusts the spectrum for a response, and the one status that has the response.
struct Row {
    int response, channel;
    int only_status = -1;
};
constexpr Row kRows[] = {
    {VISUAL_RESPONSE, VISUAL_RESPONSE},
    {RED_RESPONSE, RED_RESPONSE},
    {GREEN_RESPONSE, GREEN_RESPONSE},
    {BLUE_RESPONSE, BLUE_RESPONSE},
    {HIFI1_RESPONSE, GREEN_RESPONSE, HIFI_STATUS},
    {HIFI2_RESPONSE, RED_RESPONSE, HIFI_STATUS},
    {HIFI3_RESPONSE, RED_RESPONSE, HIFI_STATUS},
    {HEXACHROME1_RESPONSE, BLUE_RESPONSE, HEXACHROME_STATUS},
    {HEXACHROME2_RESPONSE, RED_RESPONSE, HEXACHROME_STATUS},
};

} // namespace

std::optional<Densities> polarised_densities(Spectrum refl, const double *targets,
                                             Paper adjusted_paper, const PolWeights &weights,
                                             int status)
{
    if (status == SPECTRAL_STATUS || status == SPECTRALX_STATUS) {
        const auto adjusted = polarised(refl, targets, weights);
        return adjusted ? densities(*adjusted, adjusted_paper, status) : std::nullopt;
    }
    const ChannelFactors factors = channel_factors(refl, VISUAL_RESPONSE, targets, weights);
    Densities set{};
    for (const auto &[response, channel, only_status] : kRows) {
        if (only_status >= 0 && only_status != status)
            continue;
        const auto factor = overall_factor(factors, channel);
        if (!factor)
            return std::nullopt;
        set.density[response] =
            density(scaled(refl, *factor), adjusted_paper, status, response).value_or(0);
    }
    return set;
}

} // namespace vantrel
