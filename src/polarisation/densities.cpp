#include "polarisation/densities.h"

#include "density/density.h"

namespace vantrel {
namespace {

/// Which channel adjusts the spectrum for a response, and the one status that has the response.
struct AdjustedResponse {
    int response, channel;
    int only_status = -1;
};
constexpr AdjustedResponse kAdjustedResponses[] = {
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

std::optional<Densities> polarised_densities(Spectrum refl, Targets targets, Paper adjusted_paper,
                                             const PolWeights &weights, int status)
{
    if (status == SPECTRAL_STATUS || status == SPECTRALX_STATUS) {
        const auto adjusted = polarised(refl, targets, weights);
        return adjusted ? densities(*adjusted, adjusted_paper, status) : std::nullopt;
    }
    const ChannelFactors factors = channel_factors(refl, VISUAL_RESPONSE, targets, weights);
    std::array<Bands, BLUE_RESPONSE + 1> adjusted;
    for (int channel = VISUAL_RESPONSE; channel <= BLUE_RESPONSE; ++channel) {
        const auto factor = overall_factor(factors, channel);
        if (!factor)
            return std::nullopt;
        adjusted[channel] = scaled(refl, *factor);
    }
    // The corrected densities of a paper come as a set; it is computed once.
    const bool as_set = adjusted_paper && status == CCR2_STATUS;
    const Densities paper_set =
        as_set ? *densities(*adjusted_paper, std::nullopt, status) : Densities{};
    const Paper paper = as_set ? std::nullopt : adjusted_paper;
    Densities set{};
    for (const auto &[response, channel, only_status] : kAdjustedResponses)
        if (only_status < 0 || only_status == status)
            set.density[response] =
                *density(adjusted[channel], paper, status, response) - paper_set.density[response];
    return set;
}

} // namespace vantrel
