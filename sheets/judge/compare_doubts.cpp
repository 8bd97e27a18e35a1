#include "judge/compare_doubts.h"

#include "judge/colour.h"
#include "judge/repeats.h"
#include "read/illuminant.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <map>

namespace vantrel::sheets {
namespace {

constexpr double kFarOff = 3;   // a colour difference that is no scatter
constexpr double kWideMean = 1; // as for the patches of a paper, in ΔE00
constexpr double kLeastMisfit = 0.5;
constexpr double kLeastOffset = 0.3; // of Y
constexpr std::size_t kMostTried = 200, kFewestTried = 5;
constexpr double kSamePaper = 0.015, kOtherBlue = 0.05, kOtherPaper = 0.3; // of reflectances
constexpr double kMisfit = 10;                                             // mean ΔE00
constexpr double kCoarsest = 1; // rounding of reflectances or of colours

bool is_rounded(double value, double unit)
{
    return std::abs(value - unit * std::round(value / unit)) < 1e-6 * unit;
}

// Pairs that are tried, an even choice.
std::vector<const PairReport *> some_of(const std::vector<PairReport> &pairs)
{
    std::vector<const PairReport *> out;
    for (std::size_t i = 0; i < pairs.size(); i += pairs.size() / kMostTried + 1)
        if (pairs[i].sample.refl)
            out.push_back(&pairs[i]);
    return out;
}

// The mean ΔE00 where the spectra of the sample are changed.
template <typename Change>
double mean_if(const std::vector<const PairReport *> &pairs, ILLUM_OBS illuminant, Change change)
{
    double sum = 0;
    for (const PairReport *pair : pairs)
        sum +=
            delta_e00(pair->reference.colour.lab, lab_of(change(*pair->sample.refl), illuminant));
    return sum / static_cast<double>(pairs.size());
}

// Its values some bands further, the last one held.
Spectrum moved(const Spectrum &refl, int bands)
{
    Spectrum out{};
    for (int band = 0; band < VANTREL_BANDS; ++band)
        out[band] = refl[std::clamp(band - bands, 0, VANTREL_BANDS - 1)];
    return out;
}

double luminance(const CIELABCOORD &lab)
{
    const double f = (lab.L + 16) / 116;
    return 100 * (lab.L > 8 ? f * f * f : lab.L / 903.3);
}

// Y of the sample as a line over that of the reference.
struct Line {
    double factor = 1, offset = 0;
};

Line line_of(const std::vector<const PairReport *> &pairs)
{
    double x = 0, y = 0, xx = 0, xy = 0;
    const auto n = static_cast<double>(pairs.size());
    for (const PairReport *pair : pairs) {
        const double aim = luminance(pair->reference.colour.lab),
                     own = luminance(pair->sample.colour.lab);
        x += aim / n;
        y += own / n;
        xx += aim * aim / n;
        xy += aim * own / n;
    }
    const double spread = xx - x * x;
    if (!(spread > 1))
        return {};
    const double factor = (xy - x * y) / spread;
    return {factor, y - factor * x};
}

std::string_view backing_in(const std::string &setup)
{
    return contains(setup, "BLACK") ? "black" : contains(setup, "WHITE") ? "white" : "";
}

std::string_view geometry_in(const std::string &setup)
{
    const auto names = [&](auto... words) { return (contains(setup, words) || ...); };
    return names("SPHER", "DIFFUSE", "D/8", "D:8", "DE:8", "DI:8", "8/D", "8:D") ? "sphere"
           : names("45", "SINGLEANGLE")                                          ? "45:0"
                                                                                 : "";
}

} // namespace

void warn_of_conditions(const Measurement &reference, const Measurement &sample,
                        std::vector<std::string> &warnings)
{
    const std::string &first = reference.source.condition, &second = sample.source.condition;
    if (!first.empty() && !second.empty() && first != second)
        warnings.push_back(fmt::format("{} was measured under {}, {} under {}", reference.file,
                                       first, sample.file, second));
    const auto doubt = [&](std::string_view what, auto name_in) {
        const std::string_view aim = name_in(upper(reference.source.setup)),
                               own = name_in(upper(sample.source.setup));
        if (!aim.empty() && !own.empty() && aim != own)
            warnings.push_back(
                fmt::format("{}: {} {}, {}: {}", reference.file, what, aim, sample.file, own));
    };
    doubt("backing", backing_in);
    doubt("geometry", geometry_in);
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

void warn_of_wide_means(const std::optional<Means> &means, bool of_zones, const std::string &file,
                        std::vector<std::string> &warnings)
{
    if (!means || !(means->spread > kWideMean))
        return;
    const bool of_others = is_of_others(means->spread);
    if (of_others || !of_zones)
        warnings.push_back(fmt::format(
            "{}{}: the {} patches of {} are up to ΔE00 {:.2f} from their mean, {}",
            of_others ? "not judged: " : "", file, means->repeats, in_quotes(means->widest),
            means->spread, of_others ? "as no repeats of one are" : "which is judged"));
}

void warn_of_same(Comparison &out)
{
    std::size_t copied = 0;
    const PairReport *copy = nullptr; // the first
    for (const PairReport &pair : out.pairs)
        if (pair.sample.refl && pair.reference.refl == pair.sample.refl && copied++ == 0)
            copy = &pair;
    if (copy && copied < out.pairs.size()) {
        out.warnings.push_back(fmt::format("{}: {} of {} pairs have the spectrum of their aim to "
                                           "the last digit, the first {}: were they measured?",
                                           out.sample, copied, out.pairs.size(),
                                           in_quotes(copy->sample.name)));
        return;
    }
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

bool warn_of_better_fit(Comparison &out)
{
    const std::vector<const PairReport *> pairs = some_of(out.pairs);
    if (pairs.size() < kFewestTried)
        return false;
    const ILLUM_OBS illuminant = out.illuminant;
    const auto same = [](const Spectrum &refl) { return refl; };
    const double own = mean_if(pairs, illuminant, same);
    if (!(own > kLeastMisfit))
        return false;
    double least = own;
    std::string how;
    const auto consider = [&](double mean, auto words) {
        if (mean < least) {
            least = mean;
            how = words();
        }
    };
    for (const int bands : {-2, -1, 1, 2})
        consider(mean_if(pairs, illuminant,
                         [bands](const Spectrum &refl) { return moved(refl, bands); }),
                 [bands] {
                     return fmt::format("with its spectra moved by {} nm: are wavelengths wrong?",
                                        10 * bands);
                 });
    const Line line = line_of(pairs);
    if (line.factor > 0.2)
        consider(mean_if(pairs, illuminant,
                         [&line](Spectrum refl) {
                             for (double &value : refl)
                                 value = (value - line.offset) / line.factor;
                             return refl;
                         }),
                 [&line] {
                     return fmt::format(
                         "were it {:.3f} times as light{}: is the white, the backing "
                         "or the filter another one?",
                         1 / line.factor,
                         std::abs(line.offset) > kLeastOffset
                             ? fmt::format(" after {:.1f} % are {}", std::abs(line.offset),
                                           line.offset > 0 ? "taken off" : "added")
                             : "");
                 });
    const bool colours = !out.pairs.front().reference.refl;
    for (int i = 0; i < NUM_ILLUM_OBS && colours; ++i) {
        const auto other = static_cast<ILLUM_OBS>(i);
        consider(mean_if(pairs, other, same),
                 [other] { return fmt::format("under {}: are the aims for it?", name_of(other)); });
    }
    if (!(least < own / 3))
        return false;
    out.warnings.push_back(fmt::format("{} would agree with {} to a mean ΔE00 of {:.2f}, not "
                                       "{:.2f}, {}",
                                       out.sample, out.reference, least, own, how));
    return true;
}

void warn_of_brightener(Comparison &out, const Spectrum &reference, const Spectrum &sample)
{
    const auto ratio = [&](std::size_t begin, std::size_t end) { // of bands, both inclusive
        double of_sample = 0, of_reference = 0;
        for (std::size_t band = begin; band <= end; ++band) {
            of_sample += sample[band];
            of_reference += reference[band];
        }
        return of_sample / of_reference;
    };
    const double blue = ratio(2, 6), rest = ratio(12, 30); // 420 to 460, 520 to 700 nm
    if (std::abs(rest - 1) < kSamePaper && std::abs(blue / rest - 1) > kOtherBlue &&
        std::abs(blue / rest - 1) < kOtherPaper)
        out.warnings.push_back(fmt::format(
            "the paper of {} reflects {:.1f} % {} from 420 to 460 nm than that of {}, and "
            "the same above 520 nm: another condition (M0 to M3), or brightener?",
            out.sample, 100 * std::abs(blue - 1), blue < 1 ? "less" : "more", out.reference));
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
