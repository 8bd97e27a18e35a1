#include "judge/pairs.h"

#include "judge/colour.h"
#include "judge/device_values.h"
#include "judge/repeats.h"
#include "read/first_alike.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <optional>
#include <string_view>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kNone = static_cast<std::size_t>(-1);

// What a patch is called, by numbers that are equal where the texts are; kNone where there is none.
struct Marks {
    std::size_t id, name, device;
};

// What a pairing rests on.
struct Sheets {
    const Measurement &reference, &sample;
    const DeviceValues &values;
    std::vector<Marks> of_reference, of_sample;
};

// Of the patches of both sheets, one after the other.
std::vector<std::size_t> numbers_of(const std::vector<std::string_view> &texts)
{
    std::vector<std::size_t> out = first_alike(texts);
    for (std::size_t i = 0; i < out.size(); ++i)
        if (texts[i].empty())
            out[i] = kNone;
    return out;
}

Sheets sheets_of(const Measurement &reference, const Measurement &sample,
                 const DeviceValues &values)
{
    std::vector<std::string_view> ids, names;
    std::vector<std::string> keys;
    for (const Measurement *sheet : {&reference, &sample})
        for (const Patch &patch : sheet->patches) {
            ids.emplace_back(patch.id);
            names.emplace_back(patch.name);
            keys.push_back(values.key_of(patch));
        }
    const std::vector<std::size_t> id = numbers_of(ids), name = numbers_of(names),
                                   device = numbers_of({keys.begin(), keys.end()});
    Sheets out{reference, sample, values, {}, {}};
    for (std::size_t i = 0; i < id.size(); ++i)
        (i < reference.patches.size() ? out.of_reference : out.of_sample)
            .push_back({id[i], name[i], device[i]});
    return out;
}

// What tells patches apart under a pairing: first the key, then what follows.
using Key = std::array<std::size_t, 3>;

Key key_of(Pairing by, const Marks &marks, std::size_t place)
{
    switch (by) {
    case Pairing::name:
        return {marks.name, marks.device, kNone};
    case Pairing::id:
        return {marks.id, marks.device, marks.name};
    case Pairing::device:
        return {marks.device, kNone, marks.name};
    case Pairing::order:
    case Pairing::automatic:
        break;
    }
    return {place, marks.device, kNone};
}

// The patches of the reference, sorted by their keys.
class Finder {
public:
    Finder(const Sheets &sheets, Pairing by) : sheets(sheets)
    {
        for (std::size_t i = 0; i < sheets.of_reference.size(); ++i)
            if (const Key key = key_of(by, sheets.of_reference[i], i); key[0] != kNone)
                entries.emplace_back(key, i);
        std::sort(entries.begin(), entries.end());
        firsts.resize(entries.size());
        for (std::size_t begin = 0, end = 0; begin < entries.size(); begin = end) {
            First &first = firsts[begin] = {entries[begin].second, true};
            for (; end < entries.size() && entries[end].first[0] == entries[begin].first[0]; ++end)
                first.place = std::min(first.place, entries[end].second);
            for (std::size_t i = begin; i < end && end - begin > 1; ++i)
                first.alike =
                    first.alike && agree(first, sheets.reference.patches[entries[i].second]);
        }
    }

    // Entries that agree in the first so many parts of their keys.
    struct Aim {
        std::size_t parts, begin, end;
        bool agrees; // in its device values
    };
    // Those that agree in most.
    std::optional<Aim> find(const Patch &patch, const Key &key) const
    {
        for (std::size_t parts = 3; parts > 0; --parts) {
            const auto less = [parts](const Entry &one, const Entry &other) {
                const auto count = static_cast<std::ptrdiff_t>(parts);
                return std::lexicographical_compare(one.first.begin(), one.first.begin() + count,
                                                    other.first.begin(),
                                                    other.first.begin() + count);
            };
            const auto [begin, end] =
                std::equal_range(entries.begin(), entries.end(), Entry{key, 0}, less);
            if (begin == end)
                continue;
            const auto at = static_cast<std::size_t>(begin - entries.begin());
            return Aim{parts, at, static_cast<std::size_t>(end - entries.begin()),
                       parts > 1 || (firsts[at].alike && agree(firsts[at], patch))};
        }
        return std::nullopt;
    }

    // In the reference, in its order.
    std::vector<std::size_t> places(const Aim &aim) const
    {
        std::vector<std::size_t> out;
        for (std::size_t i = aim.begin; i < aim.end; ++i)
            out.push_back(entries[i].second);
        std::sort(out.begin(), out.end());
        return out;
    }

private:
    using Entry = std::pair<Key, std::size_t>; // and the place
    struct First {
        std::size_t place; // of the patches that share a first part
        bool alike;        // whether the device values of all agree
    };

    bool agree(const First &first, const Patch &patch) const
    {
        return sheets.values.agree(sheets.reference.patches[first.place], patch);
    }

    const Sheets &sheets;
    std::vector<Entry> entries;
    std::vector<First> firsts; // where such patches begin
};

struct Outcome {
    Pairs pairs;
    PairingTry result;
    std::optional<double> spread{}; // the largest of the means, where one is of no repeats
    // The first of the pairs that disagree.
    const Patch *reference = nullptr, *sample = nullptr;
};

std::vector<std::size_t> without(const std::vector<bool> &taken)
{
    std::vector<std::size_t> out;
    for (std::size_t i = 0; i < taken.size(); ++i)
        if (!taken[i])
            out.push_back(i);
    return out;
}

Outcome pairs_by(Pairing by, const Sheets &sheets, const PairingRequest &request)
{
    const Finder finder(sheets, by);
    Outcome out;
    out.pairs.by = out.result.by = by;
    struct Hit {
        Key group; // repeats of a patch are in one
        std::size_t place;
        Finder::Aim aim;
    };
    std::vector<Hit> hits;
    for (std::size_t i = 0; i < sheets.sample.patches.size(); ++i) {
        const Patch &patch = sheets.sample.patches[i];
        const Key key = key_of(by, sheets.of_sample[i], i);
        const auto aim = key[0] == kNone ? std::nullopt : finder.find(patch, key);
        if (!aim)
            continue;
        if (!aim->agrees) {
            if (out.result.disagreeing++ == 0) {
                out.reference = &sheets.reference.patches[finder.places(*aim).front()];
                out.sample = &patch;
            }
            if (!request.force)
                continue;
        }
        const Key group = request.each    ? Key{i, 0, 0}
                          : request.zones ? Key{aim->parts, aim->begin, 0}
                                          : key;
        hits.push_back({group, i, *aim});
    }
    std::sort(hits.begin(), hits.end(), [](const Hit &one, const Hit &other) {
        return std::pair(one.group, one.place) < std::pair(other.group, other.place);
    });
    std::vector<Pair> &matched = out.pairs.matched;
    std::vector<bool> reference_taken(sheets.reference.patches.size()),
        sample_taken(sheets.sample.patches.size());
    for (std::size_t i = 0; i < hits.size(); ++i) {
        if (i == 0 || hits[i].group != hits[i - 1].group) {
            matched.push_back({finder.places(hits[i].aim), {}});
            for (const std::size_t place : matched.back().reference)
                reference_taken[place] = true;
        }
        matched.back().sample.push_back(hits[i].place);
        sample_taken[hits[i].place] = true;
    }
    std::sort(matched.begin(), matched.end(), [](const Pair &first, const Pair &second) {
        return std::pair(first.reference.front(), first.sample.front()) <
               std::pair(second.reference.front(), second.sample.front());
    });
    out.pairs.only_reference = without(reference_taken);
    out.pairs.only_sample = without(sample_taken);
    out.result.reference = reference_taken.size() - out.pairs.only_reference.size();
    out.result.sample = sample_taken.size() - out.pairs.only_sample.size();
    return out;
}

std::string row_of(const Measurement &sheet, const Patch &patch)
{
    return fmt::format("{}:{} {} ({})", sheet.file, patch.line, in_quotes(patch.name), told(patch));
}

std::string disagreement_of(const Outcome &outcome, const Sheets &sheets)
{
    return fmt::format("{} of {} patches pair {} with others of other device values, the first "
                       "{} with {}",
                       outcome.result.disagreeing, sheets.sample.patches.size(),
                       phrase_of(outcome.result.by), row_of(sheets.reference, *outcome.reference),
                       row_of(sheets.sample, *outcome.sample));
}

Outcome named_pairs(const Sheets &sheets, const PairingRequest &request,
                    std::vector<std::string> &warnings)
{
    if (request.by == Pairing::device && !sheets.values.comparable())
        throw RequestError{fmt::format("{} and {} have no device values in common",
                                       sheets.reference.file, sheets.sample.file)};
    Outcome out = pairs_by(request.by, sheets, request);
    if (out.result.disagreeing && request.force)
        warnings.push_back(disagreement_of(out, sheets) + "; --force-pairs takes them");
    else if (out.result.disagreeing)
        throw RequestError{disagreement_of(out, sheets) +
                           "; --pair auto finds another key, --force-pairs takes them"};
    return out;
}

// Whether at least half of a sheet finds partners.
bool suffices(const PairingTry &result, const Sheets &sheets)
{
    return result.disagreeing == 0 && (2 * result.reference >= sheets.reference.patches.size() ||
                                       2 * result.sample >= sheets.sample.patches.size());
}

std::vector<Pairing> keys_of(const Sheets &sheets)
{
    std::vector<Pairing> out;
    if (sheets.reference.named && sheets.sample.named)
        out.push_back(Pairing::name);
    if (sheets.reference.has_ids && sheets.sample.has_ids)
        out.push_back(Pairing::id);
    if (sheets.values.comparable())
        out.push_back(Pairing::device);
    return out;
}

// Mean ΔE00 of the patches to their aims, each alone: means would hide what is unlike.
double mean_difference(const Pairs &pairs, const Sheets &sheets)
{
    double sum = 0, count = 0;
    for (const Pair &pair : pairs.matched) {
        const Patch aim = mean_of(sheets.reference, pair.reference, D50_2DEG).patch;
        for (const std::size_t place : pair.sample) {
            sum += delta_e00(lab_of(sheets.reference, aim, D50_2DEG),
                             lab_of(sheets.sample, sheets.sample.patches[place], D50_2DEG));
            ++count;
        }
    }
    return sum / count;
}

// The largest spread of means, where one is of patches that are no repeats.
std::optional<double> spread_of_others(const Pairs &pairs, const Sheets &sheets)
{
    double most = 0;
    for (const Pair &pair : pairs.matched)
        for (const auto &[sheet, places] : {std::pair{&sheets.reference, &pair.reference},
                                            std::pair{&sheets.sample, &pair.sample}})
            if (places->size() > 1)
                most = std::max(most, *mean_of(*sheet, *places, D50_2DEG).spread);
    return is_of_others(most) ? std::optional(most) : std::nullopt;
}

// Whether any patch of the sample has another partner.
bool contradict(const Pairs &first, const Pairs &second, const Sheets &sheets)
{
    std::vector<std::optional<std::size_t>> partners(sheets.sample.patches.size());
    for (const Pair &pair : first.matched)
        for (const std::size_t place : pair.sample)
            partners[place] = pair.reference.front();
    return std::any_of(second.matched.begin(), second.matched.end(), [&](const Pair &pair) {
        return std::any_of(pair.sample.begin(), pair.sample.end(), [&](std::size_t place) {
            return partners[place] && partners[place] != pair.reference.front();
        });
    });
}

// Of two keys between which no device values decide, or one of which has other patches as repeats.
void choose_by_colour(Outcome &best, Outcome &other, const Sheets &sheets, std::string_view hint,
                      std::vector<std::string> &warnings)
{
    const double mean = mean_difference(best.pairs, sheets),
                 of_other = mean_difference(other.pairs, sheets);
    if (of_other < mean)
        std::swap(best, other);
    const Outcome &apart = other.spread ? other : best;
    const std::string reason =
        apart.spread ? fmt::format("patches that are one {} are up to ΔE00 {:.1f} from their mean",
                                   phrase_of(apart.pairs.by), *apart.spread)
                     : "no device values tell which is right";
    warnings.push_back(fmt::format("{} and {} pair otherwise {} (mean ΔE00 {:.2f}) than {} "
                                   "({:.2f}), and {}{}",
                                   sheets.reference.file, sheets.sample.file,
                                   phrase_of(best.pairs.by), std::min(mean, of_other),
                                   phrase_of(other.pairs.by), std::max(mean, of_other), reason,
                                   hint));
}

std::string told(const PairingTry &result, const Sheets &sheets)
{
    return fmt::format(
        "{} {} of {}{}", phrase_of(result.by), result.sample, sheets.sample.patches.size(),
        result.disagreeing ? fmt::format(", {} with other device values", result.disagreeing) : "");
}

Outcome automatic_pairs(const Sheets &sheets, const PairingRequest &request,
                        std::vector<std::string> &warnings)
{
    std::optional<Outcome> best;
    std::vector<PairingTry> passed_over;
    const std::string_view hint = request.zones ? "" : "; --pair chooses";
    for (const Pairing by : keys_of(sheets)) {
        Outcome outcome = pairs_by(by, sheets, request);
        if (!suffices(outcome.result, sheets)) {
            passed_over.push_back(outcome.result);
            continue;
        }
        outcome.spread = spread_of_others(outcome.pairs, sheets);
        if (!best) {
            best = std::move(outcome);
            continue;
        }
        if ((!sheets.values.comparable() || best->spread || outcome.spread) &&
            contradict(best->pairs, outcome.pairs, sheets))
            choose_by_colour(*best, outcome, sheets, hint, warnings);
        else if (outcome.result.reference + outcome.result.sample >
                 best->result.reference + best->result.sample)
            std::swap(*best, outcome);
        passed_over.push_back(outcome.result);
    }
    if ((!best || best->spread) &&
        sheets.reference.patches.size() == sheets.sample.patches.size()) {
        Outcome outcome = pairs_by(Pairing::order, sheets, request);
        if (best && outcome.result.disagreeing == 0)
            choose_by_colour(*best, outcome, sheets, hint, warnings);
        if (best || outcome.result.disagreeing > 0) {
            passed_over.push_back(outcome.result);
        } else {
            if (!passed_over.empty())
                warnings.push_back(fmt::format("{} and {} pair {}, as nothing else pairs them",
                                               sheets.reference.file, sheets.sample.file,
                                               phrase_of(Pairing::order)));
            best = std::move(outcome);
        }
    }
    if (!best) {
        std::string tries;
        for (const PairingTry &result : passed_over)
            tries += (tries.empty() ? "" : "; ") + told(result, sheets);
        throw RequestError{fmt::format(
            "{} and {} have {} and {} patches, and most find no partner: "
            "{}{}",
            sheets.reference.file, sheets.sample.file, sheets.reference.patches.size(),
            sheets.sample.patches.size(), tries.empty() ? "no names, ids or device values" : tries,
            request.zones ? "" : "; choose with --pair")};
    }
    best->pairs.passed_over = std::move(passed_over);
    return std::move(*best);
}

// Patches that are judged each, by as many aims that are no repeats: by one after the other.
void pair_in_turn(std::vector<Pair> &matched, const Sheets &sheets,
                  std::vector<std::string> &warnings)
{
    for (std::size_t begin = 0, end = 0; begin < matched.size(); begin = end) {
        const std::vector<std::size_t> aims = matched[begin].reference;
        while (end < matched.size() && matched[end].reference == aims)
            ++end;
        if (aims.size() == 1 || aims.size() != end - begin)
            continue;
        const auto spread = mean_of(sheets.reference, aims, D50_2DEG).spread;
        if (!is_of_others(spread))
            continue;
        for (std::size_t i = 0; i < aims.size(); ++i)
            matched[begin + i].reference = {aims[i]};
        warnings.push_back(fmt::format(
            "{}: the {} aims {} are up to ΔE00 {:.1f} from their mean, no repeats: each stands for "
            "the patch of {} in its turn, a guess",
            sheets.reference.file, aims.size(),
            in_quotes(sheets.reference.patches[aims.front()].name), *spread, sheets.sample.file));
    }
}

} // namespace

std::string_view name_of(Pairing pairing)
{
    constexpr std::string_view names[] = {"auto", "name", "id", "device", "order"};
    return names[static_cast<std::size_t>(pairing)];
}

std::string phrase_of(Pairing pairing)
{
    return pairing == Pairing::device  ? "by device values"
           : pairing == Pairing::order ? "by their place in the file"
                                       : fmt::format("by {}", name_of(pairing));
}

Pairs pairs_of(const Measurement &reference, const Measurement &sample,
               const PairingRequest &request, std::vector<std::string> &warnings)
{
    const DeviceValues values(reference, sample);
    const Sheets sheets = sheets_of(reference, sample, values);
    Outcome outcome = request.by == Pairing::automatic ? automatic_pairs(sheets, request, warnings)
                                                       : named_pairs(sheets, request, warnings);
    if (outcome.pairs.matched.empty())
        throw RequestError{fmt::format("no patch of {} has a partner in {} {}", reference.file,
                                       sample.file, phrase_of(outcome.pairs.by))};
    if (request.each)
        pair_in_turn(outcome.pairs.matched, sheets, warnings);
    return std::move(outcome.pairs);
}

} // namespace vantrel::sheets
