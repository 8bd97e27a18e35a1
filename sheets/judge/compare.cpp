#include "judge/compare.h"

#include "judge/compare_doubts.h"
#include "judge/control.h"
#include "judge/densitometer.h"
#include "judge/inks.h"
#include "judge/repeats.h"
#include "judge/substrate.h"
#include "judge/zones.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <map>
#include <tuple>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kMostWorst = 10;

// What all pairs are judged by.
struct Terms {
    const CompareRequest &request;
    ILLUM_OBS illuminant, second_illuminant;
};

// The parts that are off target.
std::string verbal_difference(const Spectrum &reference, const Spectrum &sample, const Terms &terms)
{
    wchar_t words[3][16] = {};
    VerbalColorDifference(reference.data(), sample.data(), terms.illuminant,
                          terms.request.words_of_hue ? 1 : 0, words[0], words[1], words[2]);
    std::string out;
    for (const wchar_t *part : words) {
        std::string narrow; // ASCII throughout
        for (; *part; ++part)
            narrow += static_cast<char>(*part);
        if (narrow != "On Target")
            out += (out.empty() ? "" : ", ") + narrow;
    }
    return out.empty() ? "On Target" : out;
}

std::optional<int> response_of(const JudgedSheet &sheet, const Patch &patch, int status)
{
    if (!sheet.has_spectra())
        return std::nullopt;
    return Densitometer(sheet.paper.refl, status).response(patch.refl);
}

Side side_of(const JudgedSheet &sheet, const Repeats &repeats, const Terms &terms,
             const std::optional<int> &response)
{
    const Patch &patch = repeats.patch;
    Side side{.id = patch.id,
              .name = patch.name,
              .colour = colour_of(sheet.measurement, patch, terms.illuminant),
              .refl = {},
              .density = {},
              .repeats = repeats.count,
              .spread = repeats.spread};
    if (!sheet.has_spectra())
        return side;
    side.refl = patch.refl;
    if (response)
        side.density =
            Densitometer(sheet.paper.refl, terms.request.status).density(patch.refl, *response);
    return side;
}

void compare_spectra(PairReport &pair, const Spectrum &reference, const Spectrum &sample,
                     const Terms &terms)
{
    pair.verbal = verbal_difference(reference, sample, terms);
    double sum = 0, din6172 = 0;
    Metamerism(reference.data(), sample.data(), terms.illuminant, terms.second_illuminant, &sum);
    ReflToDIN6172(reference.data(), sample.data(), terms.illuminant, terms.second_illuminant,
                  &din6172);
    pair.metamerism = sum;
    pair.din6172 = din6172;
}

PairReport pair_report(const JudgedSheet &references, const JudgedSheet &samples, const Pair &pair,
                       const Terms &terms)
{
    const Repeats reference = mean_of(references.measurement, pair.reference, terms.illuminant),
                  sample = mean_of(samples.measurement, pair.sample, terms.illuminant);
    PairReport out;
    const int status = terms.request.status;
    out.response = references.has_spectra() ? response_of(references, reference.patch, status)
                                            : response_of(samples, sample.patch, status);
    out.reference = side_of(references, reference, terms, out.response);
    out.sample = side_of(samples, sample, terms, out.response);
    if (out.reference.density && out.sample.density)
        out.density_difference = *out.sample.density - *out.reference.density;
    out.device = reference.patch.device.empty() ? sample.patch.device : reference.patch.device;
    for (const Metric &metric : terms.request.metrics)
        out.delta_e.push_back(metric(out.reference.colour.lab, out.sample.colour.lab));
    if (out.reference.refl && out.sample.refl)
        compare_spectra(out, *out.reference.refl, *out.sample.refl, terms);
    return out;
}

using Differences = std::vector<double> PairReport::*; // for each metric

std::vector<double> values_of(const std::vector<PairReport> &pairs, Differences differences,
                              std::size_t metric)
{
    std::vector<double> out;
    for (const PairReport &pair : pairs)
        out.push_back((pair.*differences)[metric]);
    return out;
}

std::vector<Statistics> all_statistics(const std::vector<PairReport> &pairs,
                                       Differences differences)
{
    std::vector<Statistics> out;
    for (std::size_t metric = 0; metric < (pairs.front().*differences).size(); ++metric)
        out.push_back(statistics_of(values_of(pairs, differences, metric)));
    return out;
}

// How many pairs exceed the tolerance in the first metric; what is not a number does.
std::size_t count_above(const std::vector<PairReport> &pairs, Differences differences,
                        const std::optional<double> &tolerance)
{
    return static_cast<std::size_t>(
        std::count_if(pairs.begin(), pairs.end(), [&](const PairReport &pair) {
            return tolerance && !((pair.*differences)[0] <= *tolerance);
        }));
}

// By the pairs above the tolerance, by the limits, and by what found no partner, which makes it
// incomplete where there is neither.
std::optional<Verdict> verdict_of(const CompareRequest &request, const Coverage &coverage,
                                  std::size_t above, const std::vector<LimitResult> &limits)
{
    if (!request.tolerance && request.tolerances.limits.empty())
        return coverage.complete() ? std::nullopt : std::optional(Verdict::incomplete);
    return worse(above > 0             ? Verdict::failed
                 : coverage.complete() ? Verdict::passed
                                       : Verdict::incomplete,
                 verdict_of(limits));
}

std::optional<Means> means_of(const std::vector<PairReport> &pairs, Side PairReport::*side)
{
    std::optional<Means> out;
    for (const PairReport &pair : pairs) {
        const Side &one = pair.*side;
        if (!one.spread)
            continue;
        const std::size_t patches = out ? out->patches + 1 : 1;
        if (!out || *one.spread > out->spread)
            out = {patches, one.name, one.repeats, *one.spread};
        out->patches = patches;
    }
    return out;
}

// The aim of the least L* among all of the reference.
const Patch &darkest_of(const Measurement &reference, ILLUM_OBS illuminant)
{
    return *std::min_element(reference.patches.begin(), reference.patches.end(),
                             [&](const Patch &first, const Patch &second) {
                                 return lab_of(reference, first, illuminant).L <
                                        lab_of(reference, second, illuminant).L;
                             });
}

SubstrateCorrected substrate_corrected(std::vector<PairReport> &pairs,
                                       std::vector<ControlPatch> controls,
                                       const JudgedSheet &reference, const JudgedSheet &sample,
                                       const Terms &terms, const Coverage &coverage)
{
    for (const JudgedSheet *sheet : {&reference, &sample})
        require_paper(sheet->paper.choice, sheet->measurement.file, "--substrate-corrected");
    const Patch &darkest = darkest_of(reference.measurement, terms.illuminant);
    const CIELABCOORD black = lab_of(reference.measurement, darkest, terms.illuminant);
    SubstrateCorrected out;
    out.aim_paper = lab_of(reference.paper, terms.illuminant);
    out.paper = lab_of(sample.paper, terms.illuminant);
    out.darkest = darkest.name;
    if (!(black.L < out.aim_paper.L))
        throw RequestError{fmt::format("{} holds no aim that is darker than its paper",
                                       reference.measurement.file)};
    const SubstrateCorrection correction(out.aim_paper, black, out.paper, terms.illuminant);
    for (std::size_t i = 0; i < pairs.size(); ++i) {
        pairs[i].corrected_aim = correction(pairs[i].reference.colour.lab);
        for (const Metric &metric : terms.request.metrics)
            pairs[i].corrected_delta_e.push_back(
                metric(*pairs[i].corrected_aim, pairs[i].sample.colour.lab));
        controls[i].aim = *pairs[i].corrected_aim;
    }
    out.statistics = all_statistics(pairs, &PairReport::corrected_delta_e);
    out.above = count_above(pairs, &PairReport::corrected_delta_e, terms.request.tolerance);
    out.limits = judge_limits(terms.request.tolerances, controls);
    out.verdict = verdict_of(terms.request, coverage, out.above, out.limits);
    return out;
}

std::optional<PaperDifference> papers_of(const JudgedSheet &references, const JudgedSheet &samples,
                                         const Terms &terms)
{
    const Paper &reference = references.paper, &sample = samples.paper;
    if (!reference.choice.exists() || !sample.choice.exists())
        return std::nullopt;
    PaperDifference out{
        delta_e00(lab_of(reference, terms.illuminant), lab_of(sample, terms.illuminant)), {}};
    if (references.has_spectra() && samples.has_spectra()) {
        double sum = 0;
        Metamerism(reference.refl.data(), sample.refl.data(), terms.illuminant,
                   terms.second_illuminant, &sum);
        out.metamerism = sum;
    }
    return out;
}

// Of densities on both sides, from those of the pairs.
void warn_of_papers(Comparison &comparison)
{
    for (const auto &[file, paper, side] :
         {std::tuple{&comparison.reference, &comparison.reference_paper, &PairReport::reference},
          std::tuple{&comparison.sample, &comparison.sample_paper, &PairReport::sample}}) {
        std::vector<std::optional<double>> densities;
        for (const PairReport &pair : comparison.pairs)
            densities.push_back((pair.*side).density);
        warn_of_paper(*file, *paper, densities, comparison.warnings);
    }
}

std::vector<Unpaired> unpaired_of(const Measurement &sheet, const std::vector<std::size_t> &places)
{
    std::vector<Unpaired> out;
    for (const std::size_t place : places)
        out.push_back({sheet.patches[place].id, sheet.patches[place].name});
    return out;
}

// For the mean of the solids of each ink, in the order of the reference.
std::vector<SolidAdvice> advice_of(const std::vector<ControlPatch> &controls,
                                   const std::vector<Pair> &pairs, const JudgedSheet &references,
                                   const JudgedSheet &samples, const Terms &terms)
{
    require_paper(samples.paper.choice, samples.measurement.file, "--advice");
    std::map<Pair, SolidAdvice> in_order;
    for (const auto &[ink, places] : solids_of(controls, pairs)) {
        const Patch aim = mean_of(references.measurement, places.reference, terms.illuminant).patch,
                    solid = mean_of(samples.measurement, places.sample, terms.illuminant).patch;
        if (!samples.has_spectra())
            continue;
        if (const auto advice = advise(solid.refl, samples.paper.refl,
                                       lab_of(references.measurement, aim, terms.illuminant),
                                       terms.illuminant, terms.request.status))
            in_order[places] = {ink_title(ink), *advice, solid.name, places.sample.size()};
    }
    std::vector<SolidAdvice> out;
    for (auto &[places, advice] : in_order)
        out.push_back(std::move(advice));
    return out;
}

Coverage coverage_of(const Pairs &pairs, const Measurement &reference, const Measurement &sample,
                     bool allow_missing)
{
    return {.aims = reference.patches.size() - pairs.only_reference.size(),
            .of_aims = reference.patches.size(),
            .patches = sample.patches.size() - pairs.only_sample.size(),
            .of_patches = sample.patches.size(),
            .no_repeats = 0,
            .allow_missing = allow_missing};
}

} // namespace

Comparison compare(const Measurement &reference, const Measurement &sample,
                   const CompareRequest &request)
{
    std::vector<std::string> warnings = reading_warnings(reference);
    for (const std::string &warning : reading_warnings(sample))
        warnings.push_back(warning);
    const IlluminantChoice illuminant =
        illuminant_for(request.illuminant, {&reference, &sample}, warnings);
    warn_of_conditions(reference, sample, warnings);
    const JudgedSheet references{
        reference, paper_of(reference, request.paper, illuminant, warnings), zones_of(reference)};
    const JudgedSheet samples{sample, paper_of(sample, request.paper, illuminant, warnings),
                              request.sample_zones.empty() ? zones_of(sample)
                                                           : request.sample_zones};
    const Terms terms{request, illuminant.illuminant,
                      request.second_illuminant.value_or(usual_second(illuminant.illuminant))};
    const Pairs pairs = pairs_of(reference, sample, request.pairing, warnings);
    Comparison out{.reference = reference.file,
                   .sample = sample.file,
                   .reference_paper = references.paper.choice,
                   .sample_paper = samples.paper.choice,
                   .papers = papers_of(references, samples, terms),
                   .illuminant = illuminant,
                   .second_illuminant = terms.second_illuminant,
                   .status = request.status,
                   .paired_by = pairs.by,
                   .passed_over = pairs.passed_over,
                   .metrics = request.metrics,
                   .tolerance = request.tolerance,
                   .pairs = {},
                   .left_out = {},
                   .statistics = {},
                   .reference_means = {},
                   .sample_means = {},
                   .worst = {},
                   .coverage = coverage_of(pairs, reference, sample, request.allow_missing),
                   .only_reference = unpaired_of(reference, pairs.only_reference),
                   .only_sample = unpaired_of(sample, pairs.only_sample),
                   .tolerances = request.tolerances.name,
                   .limits = {},
                   .corrected = {},
                   .tones = {},
                   .greys = {},
                   .advice = {},
                   .warnings = std::move(warnings),
                   .verdict = {}};
    for (const auto &[sheet, other, alone] : {std::tuple{&reference, &sample, &out.only_reference},
                                              std::tuple{&sample, &reference, &out.only_sample}})
        if (!alone->empty())
            out.warnings.push_back(fmt::format("{}: {} of {} patches have no partner in {}",
                                               sheet->file, alone->size(), sheet->patches.size(),
                                               other->file));
    warn_of_uneven(pairs, reference, sample, out.warnings);
    const Work work{request.tell, "Comparing", pairs.matched.size()};
    out.pairs.reserve(pairs.matched.size());
    for (const Pair &pair : pairs.matched) {
        out.pairs.push_back(pair_report(references, samples, pair, terms));
        work.done(out.pairs.size());
    }
    out.coverage.no_repeats = static_cast<std::size_t>(
        std::count_if(out.pairs.begin(), out.pairs.end(), [](const PairReport &pair) {
            return is_of_others(pair.reference.spread) || is_of_others(pair.sample.spread);
        }));
    warn_of_papers(out);
    const std::vector<ControlPatch> controls =
        control_patches(out.pairs, pairs.matched, references, samples, illuminant.illuminant,
                        request.status, out.warnings);
    out.tones = tones_of(controls, pairs.matched);
    out.greys = greys_of(controls, pairs.matched, references, samples, illuminant.illuminant,
                         request.status);
    if (request.advice)
        out.advice = advice_of(controls, pairs.matched, references, samples, terms);
    if (request.advice && out.advice.empty())
        out.warnings.push_back(
            fmt::format("{}: no solid of one ink has a spectrum and an aim, so there is no advice",
                        sample.file));
    out.statistics = all_statistics(out.pairs, &PairReport::delta_e);
    out.above = count_above(out.pairs, &PairReport::delta_e, request.tolerance);
    out.reference_means = means_of(out.pairs, &PairReport::reference);
    out.sample_means = means_of(out.pairs, &PairReport::sample);
    out.limits = judge_limits(request.tolerances, controls);
    out.verdict = verdict_of(request, out.coverage, out.above, out.limits);
    if (request.substrate_corrected)
        out.corrected =
            substrate_corrected(out.pairs, controls, references, samples, terms, out.coverage);
    out.worst = largest_first(values_of(out.pairs, &PairReport::delta_e, 0));
    out.worst.resize(std::min(out.worst.size(), kMostWorst));
    warn_of_wide_means(out.reference_means, false, reference.file, out.warnings);
    warn_of_wide_means(out.sample_means, request.pairing.zones, sample.file, out.warnings);
    warn_of_same(out);
    warn_of_misfit(out);
    if (!warn_of_better_fit(out) && references.has_spectra() && samples.has_spectra() && out.papers)
        warn_of_brightener(out, references.paper.refl, samples.paper.refl);
    warn_of_exchanged(out);
    return out;
}

} // namespace vantrel::sheets
