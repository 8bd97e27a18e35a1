// Whether patches hold the limits of a file of tolerances.
#pragma once

#include "judge/tolerances.h"
#include "judge/verdict.h"

#include <string>
#include <utility>
#include <vector>

namespace vantrel::sheets {

// A patch beside its aim.
struct ControlPatch {
    std::string name;
    bool paper = false; // bare
    bool spot = false;  // of an ink other than cyan, magenta, yellow and black
    // Its inks above 0 %, by device field; empty where they are not known.
    std::vector<std::pair<std::string, double>> inks;
    CIELABCOORD aim{}, lab{};
    // Missing where they make no sense, or one of the two sides has no spectra.
    std::optional<double> aim_density, density; // over the paper
    std::optional<double> aim_gain, gain;       // of a tint, by density
    std::optional<double> aim_sctv, sctv;       // of a tint of a spot ink (ISO 20654)
};

// Of cyan, magenta and yellow, with an aim of hardly any chroma.
bool is_neutral(const ControlPatch &patch);

struct LimitResult {
    Tolerance limit;
    Verdict verdict = Verdict::incomplete;
    std::size_t patches = 0; // of the group; of a spread, nominal values
    std::size_t judged = 0;  // of these, those that could be
    std::optional<double> measured;
    std::string worst; // the patch, or the nominal value
    std::string note;  // how it was judged where that is not plain, or why it could not be

    // How far below the limit, negative above it.
    std::optional<double> margin() const
    {
        return measured ? std::optional(limit.limit - *measured) : std::nullopt;
    }
};

// A limit is held where all patches of its group were judged and none is above it. One that found
// no patch, or could not judge some, is incomplete.
std::vector<LimitResult> judge_limits(const Tolerances &tolerances,
                                      const std::vector<ControlPatch> &patches);

// Failed where one failed, or else incomplete where one is.
Verdict verdict_of(const std::vector<LimitResult> &results);

} // namespace vantrel::sheets
