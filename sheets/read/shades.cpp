#include "read/shades.h"

#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <functional>
#include <map>
#include <optional>
#include <string_view>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kMostNamed = 5;
constexpr double kThinnest = -0.4; // a density of what nothing reflects
constexpr std::size_t kMostInks = 20;
constexpr std::size_t kMostShades = 2000; // that are compared each with each

// How deep a patch is: densities through the filters of cyan, magenta and yellow, or the visual one
// of L*a*b*.
struct Depth {
    std::array<double, 3> density{};
    std::size_t filters = 0;
};

Depth depth_of(const Patch &patch, Kind kind)
{
    Depth out;
    if (kind == Kind::colours) {
        const double f = (std::max(patch.lab->L, 1.0) + 16) / 116;
        out.density[out.filters++] = -3 * std::log10(f);
        return out;
    }
    for (const int response : {RED_RESPONSE, GREEN_RESPONSE, BLUE_RESPONSE})
        ReflToDensity(patch.refl.data(), nullptr, E_STATUS, response, &out.density[out.filters++]);
    return out;
}

// Patches of the same tints.
struct Shade {
    std::vector<double> tints; // by ink
    std::size_t inks = 0;
    bool spot = false; // other than process inks, which may cover what is below or shine
    struct Extreme {
        const Patch *patch;
        double density;
    };
    std::array<Extreme, 3> least{}, most{}; // through each filter there is
};

std::size_t deepest_filter(const Shade &shade, std::size_t filters)
{
    std::size_t out = 0;
    for (std::size_t filter = 1; filter < filters; ++filter)
        if (shade.most[filter].density > shade.most[out].density)
            out = filter;
    return out;
}

// In the order of their tints.
std::vector<Shade> shades_of(const std::vector<Patch> &patches, Kind kind, const Named &named)
{
    std::map<std::string_view, std::size_t> fields;
    for (const Patch &patch : patches)
        for (const auto &[field, percent] : patch.device)
            if (is_ink(field))
                fields.emplace(field, fields.size());
    if (fields.size() > kMostInks)
        return {};
    std::map<std::vector<double>, Shade> shades;
    for (const Patch &patch : patches) {
        Shade shade;
        bool solids = true;
        for (const auto &[field, percent] : patch.device) {
            if (!is_ink(field) || !(percent > 0))
                continue;
            ++shade.inks;
            shade.spot = shade.spot || !field.starts_with("CMYK_");
            solids = solids && percent == 100;
        }
        const bool wanted = shade.inks == 1 || (!shade.spot && shade.inks > 1);
        const bool few = patches.size() <= kMostShades || shade.inks == 1 || solids;
        if (!wanted || !few || named.contains(&patch) || (kind == Kind::colours && !patch.lab))
            continue;
        shade.tints.resize(fields.size());
        for (const auto &[field, percent] : patch.device)
            if (is_ink(field) && percent > 0)
                shade.tints[fields.find(field)->second] = percent;
        const Depth depth = depth_of(patch, kind);
        if (*std::min_element(depth.density.begin(), depth.density.end()) < kThinnest)
            continue;
        const auto [found, is_new] = shades.try_emplace(shade.tints, shade);
        if (is_new && shades.size() > kMostShades) {
            shades.erase(found);
            continue;
        }
        for (std::size_t filter = 0; filter < depth.filters; ++filter) {
            const Shade::Extreme own{&patch, depth.density[filter]};
            Shade::Extreme &least = found->second.least[filter], &most = found->second.most[filter];
            if (!least.patch || own.density < least.density)
                least = own;
            if (!most.patch || own.density > most.density)
                most = own;
        }
    }
    std::vector<Shade> out;
    for (auto &[tints, shade] : shades)
        out.push_back(std::move(shade));
    return out;
}

// A patch that is denser than one which has no less of any ink.
struct Contradiction {
    const Patch *less, *more; // of ink
    std::size_t filter;
    double density, of_more;
};

constexpr double kLeastNoise = 0.05; // of a density

// Whether a patch of the first is denser than one of the other through any filter.
bool is_denser(const Shade &less, const Shade &more)
{
    for (std::size_t filter = 0; filter < less.most.size(); ++filter)
        if (less.most[filter].density - more.least[filter].density > kLeastNoise)
            return true;
    return false;
}

bool has_no_less(const Shade &more, const Shade &less)
{
    return more.spot == less.spot && std::equal(less.tints.begin(), less.tints.end(),
                                                more.tints.begin(), std::less_equal<>());
}

// Inks that trap badly lose up to a third of their density, and so does a zone of a bad sheet.
std::optional<Contradiction> contradiction_of(const Shade &less, const Shade &more,
                                              std::size_t filters)
{
    const bool same_inks =
        &less != &more && std::equal(less.tints.begin(), less.tints.end(), more.tints.begin(),
                                     [](double a, double b) { return (a > 0) == (b > 0); });
    const std::size_t deepest = deepest_filter(less, filters); // an ink shines through others
    std::optional<Contradiction> worst;
    for (std::size_t filter = 0; filter < filters; ++filter) {
        const auto [patch, density] = less.most[filter];
        const auto [other, of_more] = more.least[filter];
        const double share = std::max(density, 0.0);
        const double noise = same_inks ? kLeastNoise + 0.07 * share : 0.1 + 0.3 * share;
        if ((!less.spot || filter == deepest) && density - of_more > noise &&
            (!worst || density - of_more > worst->density - worst->of_more))
            worst = {patch, other, filter, density, of_more};
    }
    return worst;
}

// Of shades in the order of their tints: those before one have less of some ink.
std::vector<Contradiction> contradictions_of(const std::vector<Shade> &shades, std::size_t filters)
{
    std::vector<Contradiction> out;
    for (auto less = shades.begin(); less != shades.end(); ++less)
        for (auto more = less; more != shades.end(); ++more)
            if (is_denser(*less, *more) && has_no_less(*more, *less))
                if (const auto found = contradiction_of(*less, *more, filters))
                    out.push_back(*found);
    return out;
}

using Patches = std::vector<const Patch *>;

// The patches that contradict most others, one after the other until no contradiction is left.
Patches suspects_of(std::vector<Contradiction> open)
{
    using Counts = std::map<const Patch *, std::size_t>;
    const auto count_of = [](const std::vector<Contradiction> &some) {
        Counts out;
        for (const Contradiction &one : some) {
            ++out[one.less];
            ++out[one.more];
        }
        return out;
    };
    Counts all = count_of(open);
    Patches out;
    while (!open.empty() && out.size() <= kMostNamed) {
        Counts often = count_of(open);
        const Patch *suspect = open.front().more;
        for (const auto &[patch, times] : often)
            if (std::pair(times, all[patch]) > std::pair(often[suspect], all[suspect]))
                suspect = patch;
        out.push_back(suspect);
        std::erase_if(open, [&](const Contradiction &one) {
            return one.less == suspect || one.more == suspect;
        });
    }
    return out;
}

} // namespace

void doubt_order(const std::vector<Patch> &patches, Kind kind, const Named &named,
                 std::vector<Doubt> &out)
{
    constexpr std::array filters = {"red", "green", "blue"};
    const bool colours = kind == Kind::colours;
    const std::vector<Contradiction> contradictions =
        contradictions_of(shades_of(patches, kind, named), colours ? 1 : filters.size());
    const Patches suspects = suspects_of(contradictions);
    if (suspects.empty())
        return;
    const auto is_suspect = [&](const Patch *patch) {
        return std::find(suspects.begin(), suspects.end(), patch) != suspects.end();
    };
    // The worst, at best between two of them.
    const Contradiction &worst = *std::max_element(
        contradictions.begin(), contradictions.end(), [&](const auto &first, const auto &second) {
            const auto weight = [&](const Contradiction &one) {
                return std::pair(is_suspect(one.less) + is_suspect(one.more),
                                 one.density - one.of_more);
            };
            return weight(first) < weight(second);
        });
    std::vector<std::string> others;
    for (const Patch *patch : suspects)
        if (patch != worst.less && patch != worst.more)
            others.push_back(in_quotes(patch->name));
    if (others.size() > kMostNamed - 2)
        others.back() = "others";
    out.push_back(
        {is_suspect(worst.more) ? worst.more->line : worst.less->line,
         fmt::format("{} has a {} density of {:.2f}, and {}, with as much or more of "
                     "every ink, {:.2f}{}: are rows exchanged?",
                     in_quotes(worst.less->name), colours ? "visual" : filters[worst.filter],
                     worst.density, in_quotes(worst.more->name), worst.of_more,
                     others.empty()
                         ? ""
                         : fmt::format("; it is likewise with {}", fmt::join(others, ", ")))});
}

} // namespace vantrel::sheets
