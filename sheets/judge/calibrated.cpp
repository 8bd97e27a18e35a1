#include "judge/calibrated.h"

#include "judge/colour.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <numeric>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kMostInks = 4;
constexpr std::array kFactors = {1.0, 1.25, 1.5, 1.8, 2.0, 2.5, 3.0, 3.5, 4.0, 5.0, 6.0, 8.0, 10.0};

constexpr double kDark = 1e-300; // a solid that is no other than the paper

std::vector<std::size_t> inks_of(const Tints &tints)
{
    std::vector<std::size_t> out;
    for (const Tint &tint : tints)
        out.push_back(tint.ink);
    return out;
}

bool all_solid(const Tints &tints)
{
    return std::all_of(tints.begin(), tints.end(),
                       [](const Tint &tint) { return tint.percent == 100; });
}

// Calls `visit` with every combination of one level of each ink, as tints without those at 0.
template <typename Visit>
void for_each_node(const Tints &tints, const std::vector<std::vector<double>> &levels, Visit visit)
{
    std::vector<std::size_t> at(tints.size(), 0);
    for (;;) {
        Tints node;
        for (std::size_t i = 0; i < tints.size(); ++i)
            if (levels[i][at[i]] > 0)
                node.push_back({tints[i].ink, levels[i][at[i]]});
        visit(node, at);
        std::size_t i = 0;
        while (i < at.size() && ++at[i] == levels[i].size())
            at[i++] = 0;
        if (i == at.size())
            return;
    }
}

} // namespace

CalibratedModel::CalibratedModel(const Measurement &sheet, const Inks &inks, const Patch &paper,
                                 ILLUM_OBS illuminant)
    : inks(inks), ramps(inks.names().size())
{
    std::map<Tints, double> patches;
    for (const Patch &patch : sheet.patches) {
        const auto tints = inks.tints_of(patch);
        if (!tints || tints->empty())
            continue;
        const Bands refl = Eigen::Map<const Bands>(patch.refl.data()).max(0);
        const double count = ++patches[*tints];
        Bands &mean = measured.try_emplace(*tints, Bands::Zero()).first->second;
        mean += (refl - mean) / count;
    }
    measured[{}] = Eigen::Map<const Bands>(paper.refl.data()).max(0);
    for (const auto &[tints, refl] : measured)
        if (tints.size() == 1 && measured.contains({{tints[0].ink, 100}}))
            ramps[tints[0].ink].push_back(tints[0].percent);
    for (Levels &ramp : ramps)
        if (!ramp.empty())
            ramp.insert(ramp.begin(), 0);
    fit(illuminant);
}

// The widest grid of tints at which the sheet holds every overprint; solids over solids alone may
// be missing.
std::vector<CalibratedModel::Levels> CalibratedModel::grid_of(const Tints &tints) const
{
    std::vector<Levels> grid;
    for (const Tint &tint : tints)
        grid.push_back(ramps[tint.ink]);
    for (;;) {
        std::vector<std::vector<std::size_t>> overprints, holes; // of each level
        for (const Levels &levels : grid)
            overprints.emplace_back(levels.size(), 0);
        holes = overprints;
        for_each_node(tints, grid, [&](const Tints &node, const std::vector<std::size_t> &at) {
            const bool hole = !all_solid(node) && !measured.contains(node);
            for (std::size_t i = 0; i < at.size(); ++i) {
                overprints[i][at[i]] += node.size() > 1;
                holes[i][at[i]] += hole;
            }
        });
        // Out goes the tint that lacks the largest share; at 0 and 100 stand the primaries.
        std::size_t worst_ink = 0, worst_level = 0;
        double largest = 0;
        for (std::size_t i = 0; i < grid.size(); ++i)
            for (std::size_t level = 1; level + 1 < grid[i].size(); ++level) {
                const double share = static_cast<double>(holes[i][level]) /
                                     static_cast<double>(overprints[i][level]);
                if (share > largest) {
                    worst_ink = i;
                    worst_level = level;
                    largest = share;
                }
            }
        if (largest == 0)
            return grid;
        grid[worst_ink].erase(grid[worst_ink].begin() + static_cast<std::ptrdiff_t>(worst_level));
    }
}

CalibratedModel::Place CalibratedModel::place_without(const Tints &tints) const
{
    const auto known = grids.find(inks_of(tints));
    Place place{.tints = tints, .nodes = known == grids.end() ? grid_of(tints) : known->second};
    if (place.nodes.empty() || !measured.contains(tints))
        return place;
    if (all_solid(tints)) {
        place.films = tints.size() > 1;
        return place;
    }
    // Without this patch the grid lacks one tint of one ink: the one with the nearest neighbours.
    std::size_t ink = 0;
    std::ptrdiff_t left_out = 0;
    double narrowest = std::numeric_limits<double>::infinity();
    for (std::size_t i = 0; i < tints.size(); ++i) {
        const Levels &levels = place.nodes[i];
        const auto level = std::find(levels.begin(), levels.end(), tints[i].percent);
        if (level == levels.end())
            return place; // no node
        if (tints[i].percent < 100 && *(level + 1) - *(level - 1) < narrowest) {
            narrowest = *(level + 1) - *(level - 1);
            ink = i;
            left_out = level - levels.begin();
        }
    }
    Levels &nodes = place.nodes[ink];
    nodes.erase(nodes.begin() + left_out);
    if (tints.size() == 1)
        place.no_tint = tints[0].percent;
    return place;
}

// R^(1/n) of a node of the grid. Solids that were not measured over one another are films.
CalibratedModel::Bands CalibratedModel::primary(const Tints &tints, bool films) const
{
    const auto found = roots.find(tints);
    if (found != roots.end() && !films)
        return found->second;
    const Tints below(tints.begin(), tints.end() - 1);
    const auto over_paper = measured.find(below);
    const Bands first =
        over_paper == measured.end() ? primary(below, false).pow(n).eval() : over_paper->second;
    const Bands &last = measured.at({tints.back()});
    Bands refl;
    CombineInkColors(first.data(), last.data(), refl.data());
    return refl.pow(1 / n);
}

// The area that a tint covers of the cell between two nodes of its ramp. Of a tint between those of
// the ramp the area is interpolated.
double CalibratedModel::area(const Tint &tint, double below, double above,
                             std::optional<double> no_tint) const
{
    const Bands from = primary({}, false);
    const auto node = [&](double percent) {
        return percent > 0 ? roots.at({{tint.ink, percent}}) : from;
    };
    const Bands start = node(below), step = node(above) - start;
    double left = below, area_left = 0;
    for (const double level : ramps[tint.ink]) {
        if (level <= below || level == no_tint)
            continue;
        const double area_right = level < above ? ((node(level) - start) * step).sum() /
                                                      std::fmax(step.square().sum(), kDark)
                                                : 1;
        if (tint.percent <= level)
            return std::clamp(
                std::lerp(area_left, area_right, (tint.percent - left) / (level - left)), 0.0, 1.0);
        left = level;
        area_left = area_right;
    }
    return 1;
}

Spectrum CalibratedModel::estimate(const Place &place) const
{
    const Tints &tints = place.tints;
    std::vector<Levels> cell;
    std::vector<std::array<double, 2>> share; // of the cell's lower and upper node, by Demichel
    for (std::size_t i = 0; i < tints.size(); ++i) {
        const auto above =
            std::lower_bound(place.nodes[i].begin() + 1, place.nodes[i].end(), tints[i].percent);
        const double covered = area(tints[i], *(above - 1), *above, place.no_tint);
        cell.push_back({*(above - 1), *above});
        share.push_back({1 - covered, covered});
    }
    Bands sum = Bands::Zero();
    for_each_node(tints, cell, [&](const Tints &node, const std::vector<std::size_t> &at) {
        double weight = 1;
        for (std::size_t i = 0; i < at.size(); ++i)
            weight *= share[i][at[i]];
        if (weight > 0)
            sum += weight * primary(node, place.films && node.size() == tints.size());
    });
    Spectrum refl;
    Eigen::Map<Bands>(refl.data()) = sum.pow(n);
    return refl;
}

void CalibratedModel::set_factor(double factor)
{
    n = factor;
    for (const auto &[tints, refl] : measured)
        roots.insert_or_assign(tints, refl.pow(1 / n).eval());
}

bool CalibratedModel::knows(const Tints &tints) const
{
    return !tints.empty() && tints.size() <= kMostInks &&
           std::none_of(tints.begin(), tints.end(),
                        [&](const Tint &tint) { return ramps[tint.ink].empty(); });
}

// Takes the n with the least mean ΔE00 over the overprints with tints, or else over the tints, as
// mixtures of paper and solid.
void CalibratedModel::fit(ILLUM_OBS illuminant)
{
    std::vector<Place> overprints, tints_alone;
    for (const auto &[tints, refl] : measured) {
        if (!knows(tints) || all_solid(tints))
            continue;
        if (tints.size() == 1) {
            tints_alone.push_back({.tints = tints, .nodes = {{0, 100}}});
            continue;
        }
        if (const auto own = inks_of(tints); !grids.contains(own))
            grids.emplace(own, grid_of(tints));
        overprints.push_back(place_without(tints));
    }
    const std::vector<Place> &places = overprints.empty() ? tints_alone : overprints;
    if (places.empty())
        throw RequestError{"no tints of an ink whose solid is there"};

    std::vector<CIELABCOORD> labs;
    for (const Place &place : places) {
        Spectrum refl;
        Eigen::Map<Bands>(refl.data()) = measured.at(place.tints);
        labs.push_back(lab_of(refl, illuminant));
    }
    Eigen::ArrayXXd de00(places.size(), kFactors.size());
    for (std::size_t f = 0; f < kFactors.size(); ++f) {
        set_factor(kFactors[f]);
        for (std::size_t i = 0; i < places.size(); ++i)
            de00(i, f) = delta_e00(labs[i], lab_of(estimate(places[i]), illuminant));
    }
    const Eigen::ArrayXd sums = de00.colwise().sum();
    Eigen::Index best = 0;
    sums.minCoeff(&best);
    set_factor(kFactors[best]);
    if (overprints.empty())
        return;

    std::vector<double> errors;
    for (std::size_t i = 0; i < places.size(); ++i) {
        Eigen::Index without = 0; // the best n for the others
        (sums - de00.row(i).transpose()).minCoeff(&without);
        errors.push_back(de00(i, without));
    }
    std::sort(errors.begin(), errors.end());
    const double count = static_cast<double>(errors.size());
    left_out = {errors.size(), std::reduce(errors.begin(), errors.end()) / count,
                errors[static_cast<std::size_t>(std::ceil(0.95 * count)) - 1], errors.back()};
}

std::optional<Spectrum> CalibratedModel::predict(const Tints &tints) const
{
    if (!knows(tints))
        return std::nullopt;
    return estimate(place_without(tints));
}

std::vector<std::string> CalibratedModel::lacking(const Tints &tints) const
{
    std::vector<std::string> out;
    if (tints.size() > kMostInks)
        out.push_back(fmt::format("{} inks; {} are the most", tints.size(), kMostInks));
    for (const Tint &tint : tints)
        if (ramps[tint.ink].empty())
            out.push_back(fmt::format("no solid of {}", inks.names()[tint.ink]));
        else if (ramps[tint.ink].size() == 2 && tint.percent < 100)
            out.push_back(fmt::format("no tints of {}: its dots are as large as asked for",
                                      inks.names()[tint.ink]));
    if (!knows(tints))
        return out;
    for (unsigned set = 1; set < 1U << tints.size(); ++set) {
        Tints solids;
        for (std::size_t i = 0; i < tints.size(); ++i)
            if (set >> i & 1U)
                solids.push_back({tints[i].ink, 100});
        if (!measured.contains(solids))
            out.push_back(fmt::format("no overprint of {}: taken as films", names_of(solids)));
    }
    return out;
}

std::string CalibratedModel::names_of(const Tints &tints) const
{
    std::string out;
    for (const Tint &tint : tints)
        out += (out.empty() ? "" : " + ") + inks.names()[tint.ink];
    return out;
}

} // namespace vantrel::sheets
