// The pairs of a comparison as limits judge them.
#pragma once

#include "judge/limits.h"
#include "judge/pair_report.h"
#include "judge/paper.h"

#include <vector>

namespace vantrel::sheets {

// Gains and tone values of tints are against the mean solid of the same ink on the same side, over
// that side's paper. Of a collection of colours all are spot colours.
std::vector<ControlPatch> control_patches(const std::vector<PairReport> &pairs,
                                          const Paper &reference_paper, const Paper &sample_paper,
                                          ILLUM_OBS illuminant, int status, bool collection);

} // namespace vantrel::sheets
