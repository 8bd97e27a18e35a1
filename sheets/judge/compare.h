// What `vantrel compare` says about a sample beside its reference.
#pragma once

#include "judge/advice.h"
#include "judge/formulas.h"
#include "judge/left_out.h"
#include "judge/limits.h"
#include "judge/pair_report.h"
#include "judge/pairs.h"
#include "judge/paper.h"
#include "judge/scales.h"
#include "judge/stated.h"
#include "judge/statistics.h"
#include "read/measurement.h"

#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

struct CompareRequest {
    PairingRequest pairing;
    bool allow_missing = false;          // the verdict stands where patches or aims have no partner
    std::vector<Metric> metrics;         // at least one; the first decides
    std::optional<ILLUM_OBS> illuminant; // as the files state where it is empty, or else D50
    std::optional<ILLUM_OBS>
        second_illuminant; // of the metamerism; the usual one where it is empty
    int status = E_STATUS;
    bool words_of_hue = false; // the difference as chroma and hue, not along a* and b*
    std::optional<double> tolerance;
    Tolerances tolerances; // none where it has no limits
    bool substrate_corrected = false;
    bool advice = false;             // for the solids of the sample
    std::string paper;               // of both sheets, as paper_of() takes it
    std::vector<int> sample_zones{}; // of the sample's patches; by their names where it is empty
    Tell tell{};
};

// The same judgement against aims that were moved to the sample's paper.
struct SubstrateCorrected {
    CIELABCOORD aim_paper{}, paper{};
    std::string darkest; // aim, which stays
    std::vector<Statistics> statistics;
    std::size_t above = 0;
    std::vector<LimitResult> limits;
    std::optional<Verdict> verdict;
};

// Patches of one side that are means of several measurements.
struct Means {
    std::size_t patches = 0;
    std::string widest; // the patch of the largest spread
    std::size_t repeats = 0;
    double spread = 0;
};

// From the paper of the reference to that of the sample.
struct PaperDifference {
    double de00 = 0;
    std::optional<double> metamerism; // missing where a side has no spectra
};

struct Unpaired {
    std::string id, name;
};

// How much was judged.
struct Coverage {
    std::size_t aims = 0, of_aims = 0;       // of the reference
    std::size_t patches = 0, of_patches = 0; // of the sample
    std::size_t no_repeats = 0; // pairs that rest on a mean of other patches than repeats of one
    bool allow_missing = false; // as asked for

    // The sample is a strip of the chart: it has at most half of its patches.
    bool is_strip() const { return patches == of_patches && 2 * aims <= of_aims; }
    bool complete() const
    {
        return no_repeats == 0 &&
               (allow_missing || is_strip() || (patches == of_patches && aims == of_aims));
    }
};

struct Comparison {
    std::string reference, sample;             // files
    PaperChoice reference_paper, sample_paper; // densities are over these
    std::optional<PaperDifference> papers;     // where both have one
    IlluminantChoice illuminant;
    ILLUM_OBS second_illuminant;
    int status;
    Pairing paired_by;
    std::vector<PairingTry> passed_over; // by automatic pairing
    std::vector<Metric> metrics;
    std::optional<double> tolerance;
    std::vector<PairReport> pairs;
    LeftOut left_out;                   // by choose_for_page()
    std::vector<Statistics> statistics; // of the pairs, for each metric
    std::size_t above = 0;              // so many pairs exceed the tolerance in the first metric
    std::optional<Means> reference_means, sample_means;
    std::vector<std::size_t> worst; // ten at most, by the first metric
    Coverage coverage;
    std::vector<Unpaired> only_reference, only_sample;
    std::string tolerances; // their name
    std::vector<LimitResult> limits;
    std::optional<SubstrateCorrected> corrected;
    std::vector<ToneStep> tones;
    std::vector<GreyStep> greys;
    std::vector<SolidAdvice> advice;
    std::vector<std::string> warnings;
    // Of neither a tolerance nor a limit nothing, or incomplete where patches or aims lack a
    // partner, or are no repeats of what they are taken for.
    std::optional<Verdict> verdict;
};

// Throws RequestError.
Comparison compare(const Measurement &reference, const Measurement &sample,
                   const CompareRequest &request);

} // namespace vantrel::sheets
