// The tone scales of inks and the scales of greys, beside their aims.
#pragma once

#include "judge/control.h"

#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

// The tints of one ink and nominal value beside their aim, in percent: the means of so many patches
// of the sample; missing where there is no density, or no solid.
struct ToneStep {
    std::string ink; // device field
    double nominal;
    std::optional<double> aim, area;      // dot areas by density
    std::optional<double> aim_sctv, sctv; // ISO 20654, of spot inks
    std::size_t patches = 0;
};

// A patch of black, of equal parts of cyan, magenta and yellow, or of parts in grey balance.
struct GreyPlace {
    std::string scale; // K, CMY or CMY grey
    double nominal;    // of black, or of cyan
};

// Nothing of a patch that is on no scale.
std::optional<GreyPlace> grey_place_of(const ControlPatch &patch);

struct GreyStep : GreyPlace {
    std::string name;         // with the number of patches, where this is the mean of several
    double delta_ch, delta_l; // from the aim
    std::optional<double> aim_density, density; // visual, over the paper
};

// By ink and nominal value.
std::vector<ToneStep> tones_of(const std::vector<ControlPatch> &controls,
                               const std::vector<Pair> &pairs);

// By scale, from light to dark; of patches of the same inks their mean, spectrum by spectrum.
std::vector<GreyStep> greys_of(const std::vector<ControlPatch> &controls,
                               const std::vector<Pair> &pairs, const JudgedSheet &references,
                               const JudgedSheet &samples, ILLUM_OBS illuminant, int status);

} // namespace vantrel::sheets
