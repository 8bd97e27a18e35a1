#include "judge/control.h"

#include "judge/densitometer.h"

#include <algorithm>
#include <map>

namespace vantrel::sheets {
namespace {

bool is_solid(const ControlPatch &patch)
{
    return patch.inks.size() == 1 && patch.inks[0].second == 100;
}

bool is_tint(const ControlPatch &patch)
{
    return patch.inks.size() == 1 && patch.inks[0].second < 100;
}

ControlPatch control_patch(const PairReport &pair, const Paper &reference_paper, bool collection)
{
    ControlPatch out;
    out.name = pair.name();
    out.aim = pair.reference.colour.lab;
    out.lab = pair.sample.colour.lab;
    out.aim_density = pair.reference.density;
    out.density = pair.sample.density;
    bool known = false;
    for (const auto &[field, percent] : pair.device)
        if (is_ink(field)) {
            known = true;
            if (percent != 0)
                out.inks.emplace_back(field, percent);
        }
    out.paper = known ? out.inks.empty() : pair.reference.name == reference_paper.choice.name;
    out.spot = collection || std::any_of(out.inks.begin(), out.inks.end(), [](const auto &ink) {
                   return !ink.first.starts_with("CMYK_");
               });
    return out;
}

// Negative where a tint prints too light.
std::optional<double> gain_of(const Side &solid, const Side &tint, double nominal,
                              const Paper &paper, int status)
{
    if (!solid.refl || !tint.refl || !paper.choice.exists())
        return std::nullopt;
    const auto area = Densitometer(paper.refl, status).dot_area(*solid.refl, *tint.refl, 1);
    return area ? std::optional(*area - nominal) : std::nullopt;
}

} // namespace

std::vector<ControlPatch> control_patches(const std::vector<PairReport> &pairs,
                                          const Paper &reference_paper, const Paper &sample_paper,
                                          int status, bool collection)
{
    std::vector<ControlPatch> out;
    std::map<std::string, const PairReport *> solids; // the first of each ink
    for (const PairReport &pair : pairs) {
        out.push_back(control_patch(pair, reference_paper, collection));
        if (is_solid(out.back()))
            solids.try_emplace(out.back().inks[0].first, &pair);
    }
    for (std::size_t i = 0; i < pairs.size(); ++i) {
        if (!is_tint(out[i]))
            continue;
        const auto &[ink, nominal] = out[i].inks[0];
        const auto solid = solids.find(ink);
        if (solid == solids.end())
            continue;
        out[i].aim_gain =
            gain_of(solid->second->reference, pairs[i].reference, nominal, reference_paper, status);
        out[i].gain =
            gain_of(solid->second->sample, pairs[i].sample, nominal, sample_paper, status);
    }
    return out;
}

} // namespace vantrel::sheets
