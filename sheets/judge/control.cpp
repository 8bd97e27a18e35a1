#include "judge/control.h"

#include "judge/densitometer.h"
#include "judge/inks.h"
#include "judge/tone_value.h"

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

using InkPairs = std::vector<const PairReport *>;

// The mean of the spectra of one side; nothing where one has none.
std::optional<Spectrum> mean_of(const InkPairs &pairs, Side PairReport::*side)
{
    Spectrum mean{};
    for (const PairReport *pair : pairs) {
        const std::optional<Spectrum> &refl = (pair->*side).refl;
        if (!refl)
            return std::nullopt;
        for (int band = 0; band < VANTREL_BANDS; ++band)
            mean[band] += (*refl)[band] / static_cast<double>(pairs.size());
    }
    return mean;
}

// Of the mean spectrum, or of one of the patches where there are no spectra.
CIELABCOORD solid_lab(const std::optional<Spectrum> &mean, const InkPairs &pairs,
                      Side PairReport::*side, ILLUM_OBS illuminant)
{
    return mean ? lab_of(*mean, illuminant) : (pairs.front()->*side).colour.lab;
}

// Negative where a tint prints too light.
std::optional<double> gain_of(const std::optional<Spectrum> &solid, const Side &tint,
                              double nominal, const Paper &paper, int status)
{
    if (!solid || !tint.refl || !paper.choice.exists())
        return std::nullopt;
    const auto area = Densitometer(paper.refl, status).dot_area(*solid, *tint.refl, 1);
    return area ? std::optional(*area - nominal) : std::nullopt;
}

} // namespace

std::vector<ControlPatch> control_patches(const std::vector<PairReport> &pairs,
                                          const Paper &reference_paper, const Paper &sample_paper,
                                          ILLUM_OBS illuminant, int status, bool collection)
{
    std::vector<ControlPatch> out;
    std::map<std::string, InkPairs> solids; // of each ink
    for (const PairReport &pair : pairs) {
        out.push_back(control_patch(pair, reference_paper, collection));
        if (is_solid(out.back()))
            solids[out.back().inks[0].first].push_back(&pair);
    }
    struct Solid {
        std::optional<Spectrum> aim, sample;
        CIELABCOORD aim_lab, lab;
    };
    std::map<std::string, Solid> means;
    for (const auto &[ink, all] : solids) {
        const auto aim = mean_of(all, &PairReport::reference),
                   sample = mean_of(all, &PairReport::sample);
        means[ink] = {aim, sample, solid_lab(aim, all, &PairReport::reference, illuminant),
                      solid_lab(sample, all, &PairReport::sample, illuminant)};
    }
    for (std::size_t i = 0; i < pairs.size(); ++i) {
        ControlPatch &tint = out[i];
        if (!is_tint(tint))
            continue;
        const auto &[ink, nominal] = tint.inks[0];
        const auto found = means.find(ink);
        if (found == means.end())
            continue;
        const Solid &solid = found->second;
        tint.aim_gain = gain_of(solid.aim, pairs[i].reference, nominal, reference_paper, status);
        tint.gain = gain_of(solid.sample, pairs[i].sample, nominal, sample_paper, status);
        if (is_process_ink(ink_title(ink)))
            continue;
        if (reference_paper.choice.exists())
            tint.aim_sctv = spot_colour_tone_value(lab_of(reference_paper, illuminant),
                                                   solid.aim_lab, tint.aim);
        if (sample_paper.choice.exists())
            tint.sctv =
                spot_colour_tone_value(lab_of(sample_paper, illuminant), solid.lab, tint.lab);
    }
    return out;
}

} // namespace vantrel::sheets
