// What `vantrel compare` says about a sample beside its reference.
#pragma once

#include "judge/colour.h"
#include "judge/densitometer.h"
#include "read/measurement.h"
#include "write/flat.h"

#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace vantrel::sheets {

enum class Pairing { automatic, name, id, order };
std::string_view name_of(Pairing pairing); // auto, name, id, order

struct Pairs {
    Pairing by;                                               // not automatic
    std::vector<std::pair<std::size_t, std::size_t>> matched; // in the order of the reference
    std::vector<std::size_t> only_reference, only_sample;
};

// Patches of the same name or id, the first with the first where there are several, or those at the
// same place. Automatic pairing goes by name, or else by id, where at least half of the shorter
// sheet's patches find a partner, or else by order where the sheets are equally long. Throws
// RequestError where no patch finds one.
Pairs pairs_of(const Measurement &reference, const Measurement &sample, Pairing wish);

enum class Formula { de2000, cmc, de94, de76 };
std::optional<Formula> formula_named(std::string_view name);
std::string_view name_of(Formula formula);  // de2000, …
std::string_view title_of(Formula formula); // ΔE00, …

// A formula with its parametric factors: kL and kC, for CMC l and c; CIE 1976 has none.
struct Metric {
    Formula formula = Formula::de2000;
    double lightness = 1;
    double chroma = 1;

    double operator()(const CIELABCOORD &reference, const CIELABCOORD &sample) const;
};

// The factors that are usual: CMC(2:1), 1 otherwise.
Metric usual_metric(Formula formula);

struct CompareRequest {
    Pairing pairing = Pairing::automatic;
    std::vector<Metric> metrics; // at least one; the first decides
    ILLUM_OBS illuminant = D50_2DEG;
    ILLUM_OBS second_illuminant = A_2DEG;
    int status = E_STATUS;
    bool words_of_hue = false; // the difference as chroma and hue, not along a* and b*
    std::optional<double> tolerance;
    const Patch *reference_paper = nullptr; // densities are over these
    const Patch *sample_paper = nullptr;
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

struct Statistics {
    double mean = 0;
    double p95 = 0; // the smallest value that at least 95 % of the pairs do not exceed
    double max = 0;
    std::size_t max_pair = 0;
};

struct Comparison {
    std::string reference, sample;             // files
    std::string reference_paper, sample_paper; // names
    ILLUM_OBS illuminant, second_illuminant;
    int status;
    Pairing paired_by;
    std::vector<Metric> metrics;
    std::optional<double> tolerance;
    std::vector<PairReport> pairs;
    std::vector<Statistics> statistics; // for each metric
    std::vector<std::size_t> worst;     // ten at most, by the first metric
    std::vector<std::string> only_reference, only_sample;
    bool list_all = false; // in a table

    // Whether no pair is above the tolerance in the first metric.
    bool passed() const;
};

Comparison compare(const Measurement &reference, const Measurement &sample,
                   const CompareRequest &request);

// The output formats.
void write_table(const Comparison &comparison, const Sink &sink, bool colour);
void write_json(const Comparison &comparison, const Sink &sink);
std::vector<Flat> flat_of(const Comparison &comparison);

} // namespace vantrel::sheets
