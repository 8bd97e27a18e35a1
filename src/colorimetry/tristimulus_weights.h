#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// A pair of doubles that one instruction of any processor multiplies.
using Pair = double __attribute__((vector_size(16)));

/// The weights of a band side by side: X and Y, Z and an idle lane.
struct alignas(32) BandWeights {
    Pair xy, z;
};
using TristimulusWeights = const BandWeights[kBands];

/// The weights of a combination, in 1/100 000.
TristimulusWeights &tristimulus_weights(ILLUM_OBS illum_obs);

} // namespace vantrel
