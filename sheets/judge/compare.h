// What `vantrel compare` says about a sample beside its reference.
#pragma once

#include "judge/colour.h"
#include "judge/formulas.h"
#include "judge/limits.h"
#include "judge/pairs.h"
#include "judge/stated.h"
#include "judge/statistics.h"
#include "read/measurement.h"

#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace vantrel::sheets {

struct CompareRequest {
    Pairing pairing = Pairing::automatic;
    std::vector<Metric> metrics;         // at least one; the first decides
    std::optional<ILLUM_OBS> illuminant; // as the files state where it is empty, or else D50
    std::optional<ILLUM_OBS>
        second_illuminant; // of the metamerism; the usual one where it is empty
    int status = E_STATUS;
    bool words_of_hue = false; // the difference as chroma and hue, not along a* and b*
    std::optional<double> tolerance;
    Tolerances tolerances; // none where it has no limits
    bool substrate_corrected = false;
    std::string paper; // of both sheets, by name or id; the usual one where it is empty
    Tell tell{};
};

// One side of a pair.
struct Side {
    std::string id;
    std::string name;
    Colour colour;
    std::optional<Spectrum> refl;  // missing where the file holds colours alone
    std::optional<double> density; // in the response that reads the pair
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
    // Against the aim as it is on the sample's paper.
    std::optional<CIELABCOORD> corrected_aim;
    std::vector<double> corrected_delta_e; // for each metric
};

// The same judgement against aims that were moved to the sample's paper.
struct SubstrateCorrected {
    CIELABCOORD aim_paper{}, paper{};
    std::string darkest; // aim, which stays
    std::vector<Statistics> statistics;
    std::vector<LimitResult> limits;
    std::optional<Verdict> verdict;
};

struct Comparison {
    std::string reference, sample;             // files
    std::string reference_paper, sample_paper; // names; densities are over these
    IlluminantChoice illuminant;
    ILLUM_OBS second_illuminant;
    int status;
    Pairing paired_by;
    std::vector<Metric> metrics;
    std::optional<double> tolerance;
    std::vector<PairReport> pairs;
    std::vector<Statistics> statistics; // of the pairs, for each metric
    std::vector<std::size_t> worst;     // ten at most, by the first metric
    std::vector<std::string> only_reference, only_sample;
    std::string tolerances; // their name
    std::vector<LimitResult> limits;
    std::optional<SubstrateCorrected> corrected;
    std::vector<std::string> warnings;
    std::optional<Verdict> verdict; // nothing where there is neither a tolerance nor a limit
};

// Throws RequestError.
Comparison compare(const Measurement &reference, const Measurement &sample,
                   const CompareRequest &request);

} // namespace vantrel::sheets
