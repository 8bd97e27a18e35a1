#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// X, Y, Z and an idle lane: the weights of a band stand side by side, so that one instruction
/// multiplies the three.
using Lanes = double __attribute__((vector_size(32)));
using TristimulusWeights = const Lanes[kBands];

/// The weights of a combination, in 1/100 000.
TristimulusWeights &tristimulus_weights(ILLUM_OBS illum_obs);

} // namespace vantrel
