#include "judge/calibrated.h"

#include "judge/colour.h"

#include <Eigen/Core>
#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

namespace vantrel::sheets {
namespace {

constexpr std::array kFactors = {1.0, 1.25, 1.5, 1.8, 2.0, 2.5, 3.0, 3.5, 4.0, 5.0, 6.0, 8.0, 10.0};

constexpr double kDark = 1e-300; // a solid that is no other than the paper
// Beyond these the fit takes more than seconds.
constexpr std::size_t kMostTints = 200;       // of one ink
constexpr std::size_t kMostOverprints = 2000; // to fit to

using BandArray = Eigen::Array<double, VANTREL_BANDS, 1>;

Eigen::Map<const BandArray> bands_of(const Spectrum &refl)
{
    return Eigen::Map<const BandArray>(refl.data());
}

Spectrum spectrum_of(const BandArray &bands)
{
    Spectrum out;
    Eigen::Map<BandArray>(out.data()) = bands;
    return out;
}

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

CalibratedModel::CalibratedModel(const Measurement &sheet, const Inks &inks, const Spectrum &paper,
                                 ILLUM_OBS illuminant)
    : inks(inks), ramps(inks.names().size())
{
    std::map<Tints, double> patches;
    for (const Patch &patch : sheet.patches) {
        const auto tints = inks.tints_of(patch);
        if (!tints || tints->empty())
            continue;
        const BandArray refl = bands_of(patch.refl).max(0);
        const double count = ++patches[*tints];
        Spectrum &mean = measured[*tints];
        mean = spectrum_of(bands_of(mean) + (refl - bands_of(mean)) / count);
    }
    measured[{}] = spectrum_of(bands_of(paper).max(0));
    for (const auto &[tints, refl] : measured)
        if (tints.size() == 1 && measured.contains({{tints[0].ink, 100}}))
            ramps[tints[0].ink].push_back(tints[0].percent);
    for (std::size_t ink = 0; ink < ramps.size(); ++ink) {
        if (ramps[ink].size() > kMostTints)
            throw RequestError{fmt::format("{} tints of {}; {} are the most", ramps[ink].size(),
                                           inks.names()[ink], kMostTints)};
        if (!ramps[ink].empty())
            ramps[ink].insert(ramps[ink].begin(), 0);
    }
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
        // Out goes the tint that lacks the largest share of its overprints with the other inks'
        // nodes; at 0 and 100 stand the primaries.
        const std::vector<std::vector<std::size_t>> held = overprints_held(tints, grid);
        std::size_t worst_ink = 0, worst_level = 0;
        double largest = 0;
        for (std::size_t i = 0; i < grid.size(); ++i) {
            double overprints = 1;
            for (std::size_t other = 0; other < grid.size(); ++other)
                overprints *= other == i ? 1 : static_cast<double>(grid[other].size());
            for (std::size_t level = 1; level + 1 < grid[i].size(); ++level)
                // One of them is of no other ink.
                if (const double share = 1 - static_cast<double>(held[i][level]) / (overprints - 1);
                    share > largest) {
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

// How many overprints of a grid's nodes the sheet holds, for each level of each ink.
std::vector<std::vector<std::size_t>>
CalibratedModel::overprints_held(const Tints &tints, const std::vector<Levels> &grid) const
{
    std::vector<std::vector<std::size_t>> out;
    for (const Levels &levels : grid)
        out.emplace_back(levels.size(), 0);
    for (const auto &[overprint, refl] : measured) {
        std::vector<std::size_t> at(grid.size(), 0);
        std::size_t inks_found = 0;
        for (std::size_t i = 0; i < grid.size(); ++i)
            for (const Tint &tint : overprint)
                if (tint.ink == tints[i].ink) {
                    const auto level =
                        std::lower_bound(grid[i].begin(), grid[i].end(), tint.percent);
                    at[i] = static_cast<std::size_t>(level - grid[i].begin());
                    inks_found += level != grid[i].end() && *level == tint.percent;
                }
        if (overprint.size() < 2 || inks_found != overprint.size())
            continue;
        for (std::size_t i = 0; i < grid.size(); ++i)
            ++out[i][at[i]];
    }
    return out;
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
Spectrum CalibratedModel::primary(const Tints &tints, bool films) const
{
    const auto found = roots.find(tints);
    if (found != roots.end() && !films)
        return found->second;
    const Tints below(tints.begin(), tints.end() - 1);
    const auto over_paper = measured.find(below);
    const Spectrum first = over_paper == measured.end()
                               ? spectrum_of(bands_of(primary(below, false)).pow(n))
                               : over_paper->second;
    Spectrum refl;
    CombineInkColors(first.data(), measured.at({tints.back()}).data(), refl.data());
    return spectrum_of(bands_of(refl).pow(1 / n));
}

// The area that a tint covers of the cell between two nodes of its ramp. Of a tint between those of
// the ramp the area is interpolated.
double CalibratedModel::area(const Tint &tint, double below, double above,
                             std::optional<double> no_tint) const
{
    const auto node = [&](double percent) {
        return bands_of(percent > 0 ? roots.at({{tint.ink, percent}}) : roots.at({}));
    };
    const BandArray start = node(below), step = node(above) - start;
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
    BandArray sum = BandArray::Zero();
    for_each_node(tints, cell, [&](const Tints &node, const std::vector<std::size_t> &at) {
        double weight = 1;
        for (std::size_t i = 0; i < at.size(); ++i)
            weight *= share[i][at[i]];
        if (weight > 0)
            sum += weight * bands_of(primary(node, place.films && node.size() == tints.size()));
    });
    return spectrum_of(sum.pow(n));
}

void CalibratedModel::set_factor(double factor)
{
    n = factor;
    for (const auto &[tints, refl] : measured)
        roots.insert_or_assign(tints, spectrum_of(bands_of(refl).pow(1 / n)));
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
    std::vector<const Tints *> overprints, tints_alone;
    for (const auto &[tints, refl] : measured)
        if (knows(tints) && !all_solid(tints))
            (tints.size() == 1 ? tints_alone : overprints).push_back(&tints);
    const auto &all = overprints.empty() ? tints_alone : overprints;
    if (all.empty())
        throw RequestError{"no tints of an ink whose solid is there"};
    const std::size_t count = std::min(all.size(), kMostOverprints); // an even choice will do
    std::vector<Place> places;
    for (std::size_t i = 0; i < count; ++i) {
        const Tints &tints = *all[i * all.size() / count];
        if (const auto own = inks_of(tints); tints.size() > 1 && !grids.contains(own))
            grids.emplace(own, grid_of(tints));
        places.push_back(tints.size() > 1 ? place_without(tints)
                                          : Place{.tints = tints, .nodes = {{0, 100}}});
    }

    std::vector<CIELABCOORD> labs;
    for (const Place &place : places)
        labs.push_back(lab_of(measured.at(place.tints), illuminant));
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
    const auto solids =
        std::count_if(measured.begin(), measured.end(), [this](const auto &overprint) {
            const Tints &tints = overprint.first;
            return tints.size() > 1 && knows(tints) && all_solid(tints);
        });
    left_out = {errors.size(), statistics_of(errors), static_cast<std::size_t>(solids),
                all.size() - count};
}

std::optional<Spectrum> CalibratedModel::predict(const Tints &tints) const
{
    if (!knows(tints))
        return std::nullopt;
    return estimate(place_without(tints));
}

bool CalibratedModel::ends_range(double n_factor)
{
    return n_factor == kFactors.front() || n_factor == kFactors.back();
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
        else if (solids == tints && tints.size() > 1)
            out.push_back(fmt::format("no overprint of {} beside the one predicted: taken as films",
                                      names_of(solids)));
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
