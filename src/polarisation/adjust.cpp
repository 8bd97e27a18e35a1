#include "polarisation/adjust.h"

#include "density/automatic_response.h"

namespace vantrel {

static double channel_factor(Spectrum refl, const double *weights, double target)
{
    double reading = 0;
    for (int i = 0; i < kBands; ++i)
        reading += weights[i] * refl[i];
    return reading == 0 ? 1 : target / reading;
}

ChannelFactors channel_factors(Spectrum refl, int response, Targets targets,
                               const PolWeights &weights)
{
    const bool all = response == VISUAL_RESPONSE;
    ChannelFactors f{};
    if (all || response == RED_RESPONSE)
        f[0] = channel_factor(refl, weights.RedWeights, targets[0]);
    if (all || response == GREEN_RESPONSE)
        f[1] = channel_factor(refl, weights.GreenWeights, targets[1]);
    if (all || response == BLUE_RESPONSE) {
        f[2] = channel_factor(refl, weights.BlueWeights, targets[2]);
        f[3] = channel_factor(refl, weights.BlueWeights2, targets[3]);
    }
    return f;
}

static double mean_factor(const ChannelFactors &f, int response)
{
    switch (response) {
    case VISUAL_RESPONSE:
        return (f[0] + f[1] + f[2] + f[3]) / 4;
    case RED_RESPONSE:
        return f[0];
    case GREEN_RESPONSE:
        return f[1];
    case BLUE_RESPONSE:
        return (f[2] + f[3]) / 2;
    default:
        return 1;
    }
}

std::optional<double> overall_factor(const ChannelFactors &factors, int response, double noise)
{
    const double factor = mean_factor(factors, response);
    if (factor > 1 + noise)
        return std::nullopt;
    return factor == 0 || factor > 1 ? 1 : factor;
}

Bands scaled(Spectrum refl, double factor)
{
    Bands result;
    for (int i = 0; i < kBands; ++i)
        result[i] = refl[i] * factor;
    return result;
}

std::optional<Bands> polarised(Spectrum refl, Targets targets, const PolWeights &weights,
                               double noise)
{
    const int response = automatic_response(refl, E_STATUS, std::nullopt);
    const auto factor =
        overall_factor(channel_factors(refl, response, targets, weights), response, noise);
    if (!factor)
        return std::nullopt;
    return scaled(refl, *factor);
}

} // namespace vantrel
