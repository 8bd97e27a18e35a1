#include "judge/pairs.h"

#include <fmt/format.h>

#include <algorithm>
#include <string>
#include <unordered_map>

namespace vantrel::sheets {
namespace {

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

} // namespace vantrel::sheets
