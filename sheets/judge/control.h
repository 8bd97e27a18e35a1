// The pairs of a comparison as limits judge them.
#pragma once

#include "judge/limits.h"
#include "judge/pair_report.h"
#include "judge/pairs.h"
#include "judge/paper.h"
#include "read/measurement.h"

#include <map>
#include <string>
#include <vector>

namespace vantrel::sheets {

// One of the two sheets.
struct JudgedSheet {
    const Measurement &measurement;
    Paper paper;
    std::vector<int> zones; // of the patches; 0 for none

    bool has_spectra() const { return measurement.kind != Kind::colours; }
};

// The solids of each ink, by its device field.
std::map<std::string, Pair> solids_of(const std::vector<ControlPatch> &controls,
                                      const std::vector<Pair> &pairs);

// Gains and tone values of tints are against the solid of the same ink on the same side, over that
// side's paper: zone by zone where solids have zones, with the mean of these. Warns of zones
// without a solid. Of a collection of colours all are spot colours. The reports are those of the
// pairs.
std::vector<ControlPatch> control_patches(const std::vector<PairReport> &reports,
                                          const std::vector<Pair> &pairs,
                                          const JudgedSheet &references, const JudgedSheet &samples,
                                          ILLUM_OBS illuminant, int status,
                                          std::vector<std::string> &warnings);

} // namespace vantrel::sheets
