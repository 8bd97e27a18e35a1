// The tone scales of inks and the scales of greys, beside their aims.
#pragma once

#include "judge/limits.h"
#include "judge/pair_report.h"
#include "judge/paper.h"

#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

// A tint of one ink beside its aim, in percent; missing where there is no density, or no solid.
struct ToneStep {
    std::string ink; // device field
    double nominal;
    std::optional<double> aim, area;      // dot areas by density
    std::optional<double> aim_sctv, sctv; // ISO 20654, of spot inks
};

// A patch of black, of equal parts of cyan, magenta and yellow, or of parts in grey balance.
struct GreyPlace {
    std::string scale; // K, CMY or CMY grey
    double nominal;    // of black, or of cyan
};

// Nothing of a patch that is on no scale.
std::optional<GreyPlace> grey_place_of(const ControlPatch &patch);

struct GreyStep : GreyPlace {
    std::string name;
    double delta_ch, delta_l;                   // from the aim
    std::optional<double> aim_density, density; // visual, over the paper
};

// By ink and nominal value; of patches of one nominal value the first.
std::vector<ToneStep> tones_of(const std::vector<ControlPatch> &controls);

// By scale, from light to dark; of patches of the same inks the first. The papers are those of
// reference and sample.
std::vector<GreyStep> greys_of(const std::vector<PairReport> &pairs,
                               const std::vector<ControlPatch> &controls,
                               const Paper &reference_paper, const Paper &paper, int status);

} // namespace vantrel::sheets
