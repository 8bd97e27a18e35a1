// What `vantrel compare` says about a sample beside its reference.
#pragma once

#include "judge/colour.h"
#include "judge/formulas.h"
#include "judge/pairs.h"
#include "judge/statistics.h"
#include "read/measurement.h"

#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

struct CompareRequest {
    Pairing pairing = Pairing::automatic;
    std::vector<Metric> metrics; // at least one; the first decides
    ILLUM_OBS illuminant = D50_2DEG;
    std::optional<ILLUM_OBS>
        second_illuminant; // of the metamerism; the usual one where it is empty
    int status = E_STATUS;
    bool words_of_hue = false; // the difference as chroma and hue, not along a* and b*
    std::optional<double> tolerance;
    std::string paper; // of both sheets, by name or id; the usual one where it is empty
    Tell tell{};
};

// One side of a pair.
struct Side {
    std::string id;
    std::string name;
    Colour colour;
    Spectrum refl{};
    std::optional<double> density; // in the response that reads the reference
};

struct PairReport {
    Side reference, sample;
    std::vector<double> delta_e; // for each metric
    std::string verbal;
    double metamerism = 0; // sum of two ΔE*ab
    double din6172 = 0;
    std::optional<int> response;
};

struct Comparison {
    std::string reference, sample;             // files
    std::string reference_paper, sample_paper; // names; densities are over these
    ILLUM_OBS illuminant, second_illuminant;
    int status;
    Pairing paired_by;
    std::vector<Metric> metrics;
    std::optional<double> tolerance;
    std::vector<PairReport> pairs;
    std::vector<Statistics> statistics; // of the pairs, for each metric
    std::vector<std::size_t> worst;     // ten at most, by the first metric
    std::vector<std::string> only_reference, only_sample;
    std::vector<std::string> warnings;

    // Whether no pair is above the tolerance in the first metric.
    bool passed() const;
};

// Throws RequestError.
Comparison compare(const Measurement &reference, const Measurement &sample,
                   const CompareRequest &request);

} // namespace vantrel::sheets
