#include "judge/compare.h"

#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <numeric>
#include <unordered_map>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kMostWorst = 10;

constexpr struct {
    Formula formula;
    std::string_view name;
    std::string_view title;
} formulas[] = {
    {Formula::de2000, "de2000", "ΔE00"},
    {Formula::cmc, "cmc", "ΔE CMC"},
    {Formula::de94, "de94", "ΔE94"},
    {Formula::de76, "de76", "ΔE*ab"},
};

Pairs pairs_by(const Measurement &reference, const Measurement &sample, Pairing by,
               std::string Patch::*key)
{
    std::unordered_map<std::string_view, std::vector<std::size_t>> places; // the first one last
    for (std::size_t i = sample.patches.size(); i-- > 0;)
        places[sample.patches[i].*key].push_back(i);
    Pairs out{by, {}, {}, {}};
    std::vector<bool> taken(sample.patches.size());
    for (std::size_t i = 0; i < reference.patches.size(); ++i) {
        const auto found = places.find(reference.patches[i].*key);
        if (found == places.end() || found->second.empty()) {
            out.only_reference.push_back(i);
            continue;
        }
        out.matched.emplace_back(i, found->second.back());
        taken[found->second.back()] = true;
        found->second.pop_back();
    }
    for (std::size_t i = 0; i < taken.size(); ++i)
        if (!taken[i])
            out.only_sample.push_back(i);
    return out;
}

Pairs pairs_in_order(std::size_t reference, std::size_t sample)
{
    Pairs out{Pairing::order, {}, {}, {}};
    for (std::size_t i = 0; i < std::max(reference, sample); ++i)
        if (i < reference && i < sample)
            out.matched.emplace_back(i, i);
        else
            (i < reference ? out.only_reference : out.only_sample).push_back(i);
    return out;
}

Pairs automatic_pairs(const Measurement &reference, const Measurement &sample)
{
    const std::size_t shorter = std::min(reference.patches.size(), sample.patches.size());
    if (reference.named && sample.named)
        for (const auto &[by, key] :
             {std::pair{Pairing::name, &Patch::name}, std::pair{Pairing::id, &Patch::id}})
            if (Pairs pairs = pairs_by(reference, sample, by, key);
                2 * pairs.matched.size() >= shorter)
                return pairs;
    if (reference.patches.size() != sample.patches.size())
        throw RequestError{fmt::format(
            "{} has {} patches and {} has {}, most without a common name or id; choose with --pair",
            reference.file, reference.patches.size(), sample.file, sample.patches.size())};
    return pairs_in_order(shorter, shorter);
}

// The parts that are off target.
std::string verbal_difference(const Spectrum &reference, const Spectrum &sample,
                              const CompareRequest &request)
{
    wchar_t words[3][16] = {};
    VerbalColorDifference(reference.data(), sample.data(), request.illuminant,
                          request.words_of_hue ? 1 : 0, words[0], words[1], words[2]);
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

Side side_of(const Patch &patch, const Patch &paper, const CompareRequest &request,
             const std::optional<int> &response)
{
    Side side{patch.id, patch.name, colour_of(patch.refl, request.illuminant), patch.refl, {}};
    if (response)
        side.density = Densitometer(paper.refl, request.status).density(patch.refl, *response);
    return side;
}

PairReport pair_report(const Patch &reference, const Patch &sample, const CompareRequest &request)
{
    PairReport out;
    out.response =
        Densitometer(request.reference_paper->refl, request.status).response(reference.refl);
    out.reference = side_of(reference, *request.reference_paper, request, out.response);
    out.sample = side_of(sample, *request.sample_paper, request, out.response);
    for (const Metric &metric : request.metrics)
        out.delta_e.push_back(metric(out.reference.colour.lab, out.sample.colour.lab));
    out.verbal = verbal_difference(reference.refl, sample.refl, request);
    Metamerism(reference.refl.data(), sample.refl.data(), request.illuminant,
               request.second_illuminant, &out.metamerism);
    ReflToDIN6172(reference.refl.data(), sample.refl.data(), request.illuminant,
                  request.second_illuminant, &out.din6172);
    return out;
}

// What cannot be measured (not a number) is worse than anything.
double badness(double delta_e) { return std::isnan(delta_e) ? INFINITY : delta_e; }

// The pairs from the worst on, by one metric.
std::vector<std::size_t> worst_first(const std::vector<PairReport> &pairs, std::size_t metric)
{
    std::vector<std::size_t> order(pairs.size());
    std::iota(order.begin(), order.end(), 0u);
    std::stable_sort(order.begin(), order.end(), [&](std::size_t first, std::size_t second) {
        return badness(pairs[first].delta_e[metric]) > badness(pairs[second].delta_e[metric]);
    });
    return order;
}

Statistics statistics_of(const std::vector<PairReport> &pairs, std::size_t metric)
{
    const std::vector<std::size_t> order = worst_first(pairs, metric);
    const std::size_t count = pairs.size();
    const std::size_t rank = (95 * count + 99) / 100; // counted from the smallest
    Statistics out;
    for (const PairReport &pair : pairs)
        out.mean += pair.delta_e[metric];
    out.mean /= static_cast<double>(count);
    out.p95 = pairs[order[count - rank]].delta_e[metric];
    out.max_pair = order.front();
    out.max = pairs[out.max_pair].delta_e[metric];
    return out;
}

std::vector<std::string> names_of(const Measurement &sheet, const std::vector<std::size_t> &places)
{
    std::vector<std::string> out;
    for (const std::size_t place : places)
        out.push_back(sheet.patches[place].name);
    return out;
}

} // namespace

std::string_view name_of(Pairing pairing)
{
    constexpr std::string_view names[] = {"auto", "name", "id", "order"};
    return names[static_cast<std::size_t>(pairing)];
}

Pairs pairs_of(const Measurement &reference, const Measurement &sample, Pairing wish)
{
    Pairs pairs = wish == Pairing::automatic ? automatic_pairs(reference, sample)
                  : wish == Pairing::name    ? pairs_by(reference, sample, wish, &Patch::name)
                  : wish == Pairing::id
                      ? pairs_by(reference, sample, wish, &Patch::id)
                      : pairs_in_order(reference.patches.size(), sample.patches.size());
    if (pairs.matched.empty())
        throw RequestError{fmt::format("no patch of {} has a partner in {} by {}", reference.file,
                                       sample.file, name_of(pairs.by))};
    return pairs;
}

std::optional<Formula> formula_named(std::string_view name)
{
    for (const auto &row : formulas)
        if (equal_ignoring_case(row.name, name))
            return row.formula;
    return std::nullopt;
}

std::string_view name_of(Formula formula)
{
    return formulas[static_cast<std::size_t>(formula)].name;
}

std::string_view title_of(Formula formula)
{
    return formulas[static_cast<std::size_t>(formula)].title;
}

double Metric::operator()(const CIELABCOORD &reference, const CIELABCOORD &sample) const
{
    double delta_e = 0;
    switch (formula) {
    case Formula::de2000:
        LabToDE2000(&reference, &sample, lightness, chroma, &delta_e);
        break;
    case Formula::cmc:
        LabToDEcmc(&sample, &reference, lightness, chroma, &delta_e);
        break;
    case Formula::de94:
        LabToDE94(&sample, &reference, lightness, chroma, &delta_e);
        break;
    case Formula::de76:
        LabToDElab(&reference, &sample, &delta_e);
        break;
    }
    return delta_e;
}

Metric usual_metric(Formula formula) { return {formula, formula == Formula::cmc ? 2.0 : 1.0, 1}; }

bool Comparison::passed() const
{
    return std::all_of(pairs.begin(), pairs.end(), [&](const PairReport &pair) {
        return !tolerance || pair.delta_e[0] <= *tolerance;
    });
}

Comparison compare(const Measurement &reference, const Measurement &sample,
                   const CompareRequest &request)
{
    const Pairs pairs = pairs_of(reference, sample, request.pairing);
    Comparison out{.reference = reference.file,
                   .sample = sample.file,
                   .reference_paper = request.reference_paper->name,
                   .sample_paper = request.sample_paper->name,
                   .illuminant = request.illuminant,
                   .second_illuminant = request.second_illuminant,
                   .status = request.status,
                   .paired_by = pairs.by,
                   .metrics = request.metrics,
                   .tolerance = request.tolerance,
                   .pairs = {},
                   .statistics = {},
                   .worst = {},
                   .only_reference = names_of(reference, pairs.only_reference),
                   .only_sample = names_of(sample, pairs.only_sample)};
    const Work work{request.tell, "Comparing", pairs.matched.size()};
    for (const auto &[first, second] : pairs.matched) {
        out.pairs.push_back(pair_report(reference.patches[first], sample.patches[second], request));
        work.done(out.pairs.size());
    }
    for (std::size_t metric = 0; metric < request.metrics.size(); ++metric)
        out.statistics.push_back(statistics_of(out.pairs, metric));
    out.worst = worst_first(out.pairs, 0);
    out.worst.resize(std::min(out.worst.size(), kMostWorst));
    return out;
}

} // namespace vantrel::sheets
