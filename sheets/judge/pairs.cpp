#include "judge/pairs.h"

#include "judge/colour.h"
#include "judge/device_values.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <optional>
#include <unordered_map>
#include <utility>

namespace vantrel::sheets {
namespace {

// What a pairing rests on.
struct Sheets {
    const Measurement &reference, &sample;
    const DeviceValues &values;
};

// Texts that are numbered in the order in which they come; those of patches hold no end of line.
class Numbers {
public:
    // Its number, and whether it is new.
    std::pair<std::size_t, bool> add(std::string text)
    {
        const auto [found, is_new] = numbers.try_emplace(std::move(text), numbers.size());
        return {found->second, is_new};
    }
    std::optional<std::size_t> find(const std::string &text) const
    {
        const auto found = numbers.find(text);
        return found == numbers.end() ? std::nullopt : std::optional(found->second);
    }

private:
    std::unordered_map<std::string, std::size_t> numbers;
};

// What tells patches apart: the key, then the device values, then the name.
struct Marks {
    std::string key, device, name;

    std::string with_device() const { return key + '\n' + device; }
    std::string all() const { return with_device() + '\n' + name; }
};

class Finder {
public:
    Finder(const Sheets &sheets, Pairing by) : sheets(sheets), by(by)
    {
        for (std::size_t i = 0; i < sheets.reference.patches.size(); ++i) {
            const Marks marks = marks_of(sheets.reference, i);
            if (marks.key.empty())
                continue;
            for (const std::string &text : {marks.key, marks.with_device(), marks.all()})
                add(text, i);
        }
    }

    Marks marks_of(const Measurement &sheet, std::size_t place) const
    {
        const Patch &patch = sheet.patches[place];
        std::string device = sheets.values.key_of(patch);
        switch (by) {
        case Pairing::name:
            return {patch.name, device, {}};
        case Pairing::id:
            return {patch.id, device, patch.name};
        case Pairing::device:
            return {device, {}, patch.name};
        case Pairing::order:
        case Pairing::automatic:
            break;
        }
        return {std::to_string(place), device, {}};
    }

    struct Found {
        std::size_t aim;
        bool agrees;
    };
    std::optional<Found> find(const Patch &patch, const Marks &marks) const
    {
        for (const std::string &text : {marks.all(), marks.with_device()})
            if (const auto aim = numbers.find(text))
                return Found{*aim, true};
        const auto aim = numbers.find(marks.key);
        if (!aim)
            return std::nullopt;
        const Patch &first = sheets.reference.patches[aims[*aim].front()];
        return Found{*aim, alike[*aim] && sheets.values.agree(first, patch)};
    }

    const std::vector<std::size_t> &places(std::size_t aim) const { return aims[aim]; }

private:
    void add(const std::string &text, std::size_t place)
    {
        const auto [aim, is_new] = numbers.add(text);
        if (is_new) {
            aims.emplace_back();
            alike.push_back(true);
        } else if (alike[aim]) {
            alike[aim] = sheets.values.agree(sheets.reference.patches[aims[aim].front()],
                                             sheets.reference.patches[place]);
        }
        aims[aim].push_back(place);
    }

    const Sheets &sheets;
    Pairing by;
    Numbers numbers;
    std::vector<std::vector<std::size_t>> aims; // places in the reference
    std::vector<bool> alike;                    // whether their device values agree
};

struct Outcome {
    Pairs pairs;
    PairingTry result;
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
    std::vector<Pair> &matched = out.pairs.matched;
    std::vector<bool> reference_taken(sheets.reference.patches.size()),
        sample_taken(sheets.sample.patches.size());
    Numbers patches; // of the sample: repeats of a patch have one number
    for (std::size_t i = 0; i < sheets.sample.patches.size(); ++i) {
        const Patch &patch = sheets.sample.patches[i];
        const Marks marks = finder.marks_of(sheets.sample, i);
        const auto found = marks.key.empty() ? std::nullopt : finder.find(patch, marks);
        if (!found)
            continue;
        const std::vector<std::size_t> &aim = finder.places(found->aim);
        if (!found->agrees) {
            if (out.result.disagreeing++ == 0) {
                out.reference = &sheets.reference.patches[aim.front()];
                out.sample = &patch;
            }
            if (!request.force)
                continue;
        }
        const auto [number, is_new] =
            patches.add(request.each    ? std::to_string(i)
                        : request.zones ? std::to_string(found->aim)
                                        : fmt::format("{}\n{}", found->aim, marks.all()));
        if (is_new) {
            matched.push_back({aim, {}});
            for (const std::size_t place : aim)
                reference_taken[place] = true;
        }
        matched[number].sample.push_back(i);
        sample_taken[i] = true;
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

double mean_difference(const Pairs &pairs, const Sheets &sheets)
{
    double sum = 0;
    for (const Pair &pair : pairs.matched)
        sum += delta_e00(
            lab_of(sheets.reference, sheets.reference.patches[pair.reference[0]], D50_2DEG),
            lab_of(sheets.sample, sheets.sample.patches[pair.sample[0]], D50_2DEG));
    return sum / static_cast<double>(pairs.matched.size());
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

// Of two keys between which no device values decide.
void choose_by_colour(Outcome &best, Outcome &other, const Sheets &sheets,
                      std::vector<std::string> &warnings)
{
    const double mean = mean_difference(best.pairs, sheets),
                 of_other = mean_difference(other.pairs, sheets);
    if (of_other < mean)
        std::swap(best, other);
    warnings.push_back(fmt::format("{} and {} pair otherwise {} (mean ΔE00 {:.2f}) than {} "
                                   "({:.2f}), and no device values tell "
                                   "which is right; --pair chooses",
                                   sheets.reference.file, sheets.sample.file,
                                   phrase_of(best.pairs.by), std::min(mean, of_other),
                                   phrase_of(other.pairs.by), std::max(mean, of_other)));
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
    for (const Pairing by : keys_of(sheets)) {
        Outcome outcome = pairs_by(by, sheets, request);
        if (!suffices(outcome.result, sheets)) {
            passed_over.push_back(outcome.result);
            continue;
        }
        if (!best) {
            best = std::move(outcome);
            continue;
        }
        if (!sheets.values.comparable() && contradict(best->pairs, outcome.pairs, sheets))
            choose_by_colour(*best, outcome, sheets, warnings);
        else if (outcome.result.reference + outcome.result.sample >
                 best->result.reference + best->result.sample)
            std::swap(*best, outcome);
        passed_over.push_back(outcome.result);
    }
    if (!best && sheets.reference.patches.size() == sheets.sample.patches.size()) {
        Outcome outcome = pairs_by(Pairing::order, sheets, request);
        if (outcome.result.disagreeing == 0) {
            if (!passed_over.empty())
                warnings.push_back(fmt::format("{} and {} pair {}, as nothing else pairs them",
                                               sheets.reference.file, sheets.sample.file,
                                               phrase_of(Pairing::order)));
            best = std::move(outcome);
        } else
            passed_over.push_back(outcome.result);
    }
    if (!best) {
        std::string tries;
        for (const PairingTry &result : passed_over)
            tries += (tries.empty() ? "" : "; ") + told(result, sheets);
        throw RequestError{
            fmt::format("{} and {} have {} and {} patches, and most find no partner: "
                        "{}; choose with --pair",
                        sheets.reference.file, sheets.sample.file, sheets.reference.patches.size(),
                        sheets.sample.patches.size(),
                        tries.empty() ? "no names, ids or device values" : tries)};
    }
    best->pairs.passed_over = std::move(passed_over);
    return std::move(*best);
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
    const Sheets sheets{reference, sample, values};
    Outcome outcome = request.by == Pairing::automatic ? automatic_pairs(sheets, request, warnings)
                                                       : named_pairs(sheets, request, warnings);
    if (outcome.pairs.matched.empty())
        throw RequestError{fmt::format("no patch of {} has a partner in {} {}", reference.file,
                                       sample.file, phrase_of(outcome.pairs.by))};
    return std::move(outcome.pairs);
}

} // namespace vantrel::sheets
