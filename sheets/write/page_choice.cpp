#include "write/page_choice.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <functional>
#include <iterator>
#include <numeric>
#include <optional>
#include <string_view>
#include <utility>

namespace vantrel::sheets {
namespace {

struct Choice {
    std::vector<std::size_t> places; // in order
    std::size_t ranked = 0;          // how many are out of the ordinary,
    std::size_t ranked_kept = 0;     // and how many of these were chosen
};

// At most `most` places: those of a rank above 0, the highest first, for which half of the room is
// kept, and of the others an even choice.
Choice chosen(const std::vector<double> &rank, std::size_t most)
{
    std::vector<std::size_t> rest(rank.size());
    std::iota(rest.begin(), rest.end(), 0);
    Choice out;
    std::copy_if(rest.begin(), rest.end(), std::back_inserter(out.places),
                 [&](std::size_t i) { return rank[i] > 0; });
    out.ranked = out.places.size();
    out.ranked_kept = std::min(out.ranked, (most + 1) / 2);
    std::stable_sort(out.places.begin(), out.places.end(),
                     [&](std::size_t a, std::size_t b) { return rank[a] > rank[b]; });
    out.places.resize(out.ranked_kept);
    std::vector<bool> taken(rank.size(), false);
    for (const std::size_t i : out.places)
        taken[i] = true;
    std::erase_if(rest, [&](std::size_t i) { return taken[i]; });
    const std::size_t others = std::min(most - out.ranked_kept, rest.size());
    for (std::size_t i = 0; i < others; ++i)
        out.places.push_back(rest[i * rest.size() / others]);
    std::sort(out.places.begin(), out.places.end());
    return out;
}

// What the page says of it.
LeftOut left_out(const Choice &choice, std::size_t count, std::string_view ranked)
{
    const bool all = choice.ranked_kept == choice.ranked;
    return {count - choice.places.size(),
            all ? fmt::format("all {} {}", choice.ranked, ranked)
                : fmt::format("{} of the {} {}, the farthest out first", choice.ranked_kept,
                              choice.ranked, ranked)};
}

template <typename Item> void keep(std::vector<Item> &items, const std::vector<std::size_t> &places)
{
    for (std::size_t i = 0; i < places.size(); ++i)
        if (places[i] != i)
            items[i] = std::move(items[places[i]]);
    items.erase(items.begin() + static_cast<std::ptrdiff_t>(places.size()), items.end());
}

// 3 for the paper, solids and overprints of solids, 2 for what is largest or smallest in a figure.
std::vector<double> ranks(const Report &report)
{
    using Figure = std::function<std::optional<double>(const PatchReport &)>;
    static const Figure figures[] = {
        [](const PatchReport &patch) { return patch.colour.lab.L; },
        [](const PatchReport &patch) { return patch.lch.C; },
        [](const PatchReport &patch) { return patch.to_paper; },
        [](const PatchReport &patch) { return patch.density; },
        [](const PatchReport &patch) { return patch.dot_gain; },
        [](const PatchReport &patch) { return patch.print_contrast; },
        [](const PatchReport &patch) { return patch.trap; },
    };
    constexpr std::size_t kEachEnd = 50;
    const std::vector<PatchReport> &patches = report.patches;
    std::vector<double> rank(patches.size(), 0);
    for (const Figure &figure : figures) {
        std::vector<std::pair<double, std::size_t>> values;
        for (std::size_t i = 0; i < patches.size(); ++i)
            if (const auto value = figure(patches[i]); value && std::isfinite(*value))
                values.emplace_back(*value, i);
        const std::size_t end = std::min(kEachEnd, values.size());
        std::sort(values.begin(), values.end());
        for (std::size_t i = 0; i < end; ++i)
            rank[values[i].second] = rank[values[values.size() - 1 - i].second] = 2;
    }
    for (std::size_t i = 0; i < patches.size(); ++i)
        if (patches[i].hue_error || patches[i].trap ||
            (report.paper.choice.exists() && patches[i].patch->name == report.paper.choice.name))
            rank[i] = 3;
    return rank;
}

} // namespace

void choose_for_page(std::vector<Report> &sheets, std::size_t most)
{
    std::size_t all = 0;
    for (const Report &report : sheets)
        all += report.patches.size();
    if (all <= most)
        return;
    for (Report &report : sheets) {
        const std::size_t count = report.patches.size();
        const double share = static_cast<double>(count) / static_cast<double>(all);
        const auto room = static_cast<std::size_t>(share * static_cast<double>(most));
        const Choice choice = chosen(ranks(report), std::max<std::size_t>(room, 1));
        report.left_out = left_out(choice, count,
                                   "that are the paper, a solid, an overprint of solids or among "
                                   "the largest and smallest of a figure");
        keep(report.patches, choice.places);
    }
}

void choose_for_page(Comparison &comparison, std::size_t most)
{
    std::vector<PairReport> &pairs = comparison.pairs;
    const std::size_t count = pairs.size();
    if (count <= most)
        return;
    const double limit = comparison.tolerance.value_or(comparison.statistics.front().p95);
    std::vector<double> rank(count, 0);
    for (std::size_t i = 0; i < count; ++i) {
        if (pairs[i].delta_e.front() > limit)
            rank[i] = pairs[i].delta_e.front();
        if (comparison.sample_paper.exists() &&
            pairs[i].sample.name == comparison.sample_paper.name)
            rank[i] = HUGE_VAL;
    }
    std::vector<std::vector<Statistics> *> tables = {&comparison.statistics};
    if (comparison.corrected)
        tables.push_back(&comparison.corrected->statistics);
    for (const std::vector<Statistics> *all : tables)
        for (const Statistics &statistics : *all)
            rank[statistics.max_at] = HUGE_VAL;
    for (const std::size_t i : comparison.worst)
        rank[i] = HUGE_VAL;
    const Choice choice = chosen(rank, most);
    const auto moved = [&](std::size_t place) {
        const auto found = std::lower_bound(choice.places.begin(), choice.places.end(), place);
        return static_cast<std::size_t>(found - choice.places.begin());
    };
    for (std::vector<Statistics> *all : tables)
        for (Statistics &statistics : *all)
            statistics.max_at = moved(statistics.max_at);
    for (std::size_t &i : comparison.worst)
        i = moved(i);
    comparison.left_out =
        left_out(choice, count,
                 fmt::format("that are the paper, the largest of a formula or above {} {:.4g}",
                             title_of(comparison.metrics.front()), limit));
    keep(pairs, choice.places);
}

} // namespace vantrel::sheets
