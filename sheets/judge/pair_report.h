// What is said of a pair of patches.
#pragma once

#include "judge/colour.h"

#include <cstddef>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace vantrel::sheets {

// One side of a pair.
struct Side {
    std::string id;
    std::string name;
    Colour colour;
    std::optional<Spectrum> refl;  // missing where the file holds colours alone
    std::optional<double> density; // in the response that reads the pair
    std::size_t repeats = 1;       // of which this is the mean
    std::optional<double> spread;  // of several: the largest ΔE00 from their mean
};

struct PairReport {
    Side reference, sample;
    std::vector<double> delta_e;                        // for each metric
    std::vector<std::pair<std::string, double>> device; // as in Patch, of either side
    // Missing where a side has no spectra.
    std::optional<std::string> verbal;
    std::optional<double> metamerism; // sum of two ΔE*ab
    std::optional<double> din6172;
    std::optional<int> response; // the one that reads the reference, or else the sample
    std::optional<double> density_difference; // from the reference to the sample
    // Against the aim as it is on the sample's paper.
    std::optional<CIELABCOORD> corrected_aim;
    std::vector<double> corrected_delta_e; // for each metric

    // That of the patch which is judged.
    const std::string &name() const { return sample.name; }
};

} // namespace vantrel::sheets
