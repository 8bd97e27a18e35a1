#pragma once

#include "base/spectrum.h"

#include <array>

namespace vantrel {

/// Target over reading in the red, the green and the two blue channels.
using ChannelFactors = std::array<double, 4>;
using PolWeights = POLWEIGHTSTRUCT;
/// The readings of a spectrum in the four channels.
using Targets = std::span<const double, 4>;

/// A second adjustment of an adjusted spectrum has a factor of 1 give or take rounding noise.
inline constexpr double kRoundingNoise = 1e-12;

/// The factors of the channels that a response stands for (the visual one: all four); the others,
/// and a channel that reads 0, have 1.
ChannelFactors channel_factors(Spectrum refl, int response, Targets targets,
                               const PolWeights &weights);

/// The factor of a spectrum: the mean over the channels that the response stands for, 1 where there
/// is none or the mean is 0. Nothing for a factor above 1: a filter adds no light; an excess of no
/// more than `noise` counts as 1.
std::optional<double> overall_factor(const ChannelFactors &factors, int response, double noise = 0);

Bands scaled(Spectrum refl, double factor);

/// The spectrum adjusted in the channel of its own Status E response.
std::optional<Bands> polarised(Spectrum refl, Targets targets, const PolWeights &weights,
                               double noise = 0);

} // namespace vantrel
