#include "judge/compare_doubts.h"

#include "judge/colour.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <map>

namespace vantrel::sheets {
namespace {

constexpr double kFarOff = 3;   // a colour difference that is no scatter
constexpr double kWideMean = 1; // as for the patches of a paper, in ΔE00
constexpr double kMisfit = 10;  // mean ΔE00
constexpr double kCoarsest = 1; // rounding of reflectances or of colours

bool is_rounded(double value, double unit)
{
    return std::abs(value - unit * std::round(value / unit)) < 1e-6 * unit;
}

} // namespace

void warn_of_conditions(const Measurement &reference, const Measurement &sample,
                        std::vector<std::string> &warnings)
{
    const std::string &first = reference.source.condition, &second = sample.source.condition;
    if (!first.empty() && !second.empty() && first != second)
        warnings.push_back(fmt::format("{} was measured under {}, {} under {}", reference.file,
                                       first, sample.file, second));
}

void warn_of_uneven(const Pairs &pairs, const Measurement &reference, const Measurement &sample,
                    std::vector<std::string> &warnings)
{
    std::map<std::size_t, std::size_t> served, often; // patches of an aim; aims of as many patches
    std::map<std::size_t, std::size_t> stand;         // rows of an aim
    for (const Pair &pair : pairs.matched) {
        served[pair.reference.front()] += pair.sample.size();
        stand[pair.reference.front()] = pair.reference.size();
    }
    for (const auto &[aim, patches] : served)
        ++often[patches];
    // Of counts that are as frequent, the largest.
    const std::size_t most =
        std::max_element(often.rbegin(), often.rend(), [](const auto &first, const auto &second) {
            return first.second < second.second;
        })->first;
    std::size_t fewer = 0, rows = 0; // aims that stand more often than their patches
    for (const auto &[aim, patches] : served)
        if (patches == most && most > 1 && stand[aim] > most) {
            ++fewer;
            rows = stand[aim];
        }
    if (2 * fewer > served.size())
        warnings.push_back(fmt::format("{} holds most patches {} times, {} only {} times",
                                       reference.file, rows, sample.file, most));
    std::string others;
    std::size_t aims = 0;
    for (const auto &[aim, patches] : served)
        if (patches % most != 0 && ++aims <= 3)
            others += fmt::format("{}{} ({})", others.empty() ? "" : ", ",
                                  in_quotes(reference.patches[aim].name), patches);
    if (aims > 0)
        warnings.push_back(fmt::format("{}: most aims have {} patches, {} another number: {}{}",
                                       sample.file, most, aims, others, aims > 3 ? ", …" : ""));
}

void warn_of_wide_means(const std::optional<Means> &means, const std::string &file,
                        std::vector<std::string> &warnings)
{
    if (means && means->spread > kWideMean)
        warnings.push_back(fmt::format("{}: the {} patches of {} are up to ΔE00 {:.2f} from their "
                                       "mean, which is judged",
                                       file, means->repeats, in_quotes(means->widest),
                                       means->spread));
}

void warn_of_same(Comparison &out)
{
    const bool spectra =
        std::all_of(out.pairs.begin(), out.pairs.end(),
                    [](const PairReport &pair) { return pair.reference.refl && pair.sample.refl; });
    const auto values = [spectra](const Side &side) {
        const CIELABCOORD &lab = side.colour.lab;
        return spectra ? std::vector(side.refl->begin(), side.refl->end())
                       : std::vector{lab.L, lab.a, lab.b};
    };
    double apart = 0;
    for (const PairReport &pair : out.pairs) {
        const std::vector<double> reference = values(pair.reference), sample = values(pair.sample);
        for (std::size_t i = 0; i < sample.size(); ++i)
            apart = std::max(apart, std::abs(reference[i] - sample[i]));
        if (!(apart <= kCoarsest / 2 + 1e-9))
            return;
    }
    const auto all_rounded = [&](Side PairReport::*side, double unit) {
        return std::all_of(out.pairs.begin(), out.pairs.end(), [&](const PairReport &pair) {
            const std::vector<double> some = values(pair.*side);
            return std::all_of(some.begin(), some.end(),
                               [unit](double value) { return is_rounded(value, unit); });
        });
    };
    bool rounded = false;
    for (const double unit : {kCoarsest, 0.1, 0.01, 0.001, 0.0001})
        rounded = rounded ||
                  (2 * apart <= unit * (1 + 1e-6) && (all_rounded(&PairReport::reference, unit) ||
                                                      all_rounded(&PairReport::sample, unit)));
    const char *what = spectra ? "spectra" : "colours";
    if (apart == 0)
        out.warnings.push_back(
            fmt::format("{} and {} hold the same {} to the last digit, as one measurement does",
                        out.reference, out.sample, what));
    else if (rounded)
        out.warnings.push_back(fmt::format("{} and {} hold the same {} but for their rounding, as "
                                           "one measurement does",
                                           out.reference, out.sample, what));
}

void warn_of_misfit(Comparison &out)
{
    double sum = 0;
    for (const PairReport &pair : out.pairs)
        sum += delta_e00(pair.reference.colour.lab, pair.sample.colour.lab);
    const double mean = sum / static_cast<double>(out.pairs.size());
    if (mean > kMisfit)
        out.warnings.push_back(fmt::format("{} and {}, paired {}, differ by a mean ΔE00 of {:.1f}: "
                                           "they hardly fit each other",
                                           out.reference, out.sample, phrase_of(out.paired_by),
                                           mean));
}

void warn_of_exchanged(Comparison &out)
{
    const Metric &metric = out.metrics[0];
    std::vector<bool> named(out.worst.size());
    std::vector<std::string> found;
    for (std::size_t i = 0; i < out.worst.size(); ++i)
        for (std::size_t j = i + 1; j < out.worst.size() && !named[i]; ++j) {
            if (named[j])
                continue;
            const PairReport &one = out.pairs[out.worst[i]], &other = out.pairs[out.worst[j]];
            const double own = std::min(one.delta_e[0], other.delta_e[0]);
            const double exchanged =
                std::max(metric(one.reference.colour.lab, other.sample.colour.lab),
                         metric(other.reference.colour.lab, one.sample.colour.lab));
            if (own > kFarOff && exchanged < own / 3) {
                named[i] = named[j] = true;
                found.push_back(fmt::format("{} and {}", in_quotes(one.sample.name),
                                            in_quotes(other.sample.name)));
            }
        }
    if (!found.empty())
        out.warnings.push_back(fmt::format("{}: {} would agree with each other's aim: are their "
                                           "rows{} exchanged?",
                                           out.sample, fmt::join(found, ", "),
                                           found.size() > 1 ? " or columns" : ""));
}

} // namespace vantrel::sheets
