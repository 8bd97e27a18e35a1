#include "judge/scales.h"

#include "judge/densitometer.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <tuple>
#include <utility>

namespace vantrel::sheets {
namespace {

std::optional<double> plus(double nominal, const std::optional<double> &gain)
{
    return gain ? std::optional(nominal + *gain) : std::nullopt;
}

std::optional<double> neutral_density(const Paper &paper, const Side &side, int status)
{
    if (!side.refl || !paper.choice.exists())
        return std::nullopt;
    // The statuses of wavelengths have no visual filter.
    const bool filters = status != SPECTRAL_STATUS && status != SPECTRALX_STATUS;
    return Densitometer(paper.refl, filters ? status : E_STATUS)
        .density(*side.refl, VISUAL_RESPONSE);
}

struct Step {
    std::string scale;
    double nominal;
};

// Nothing of a patch that is on no scale of greys.
std::optional<Step> step_of(const ControlPatch &control)
{
    const auto &inks = control.inks;
    if (inks.size() == 1 && inks[0].first == "CMYK_K")
        return Step{"K", inks[0].second};
    if (!is_neutral(control))
        return std::nullopt;
    const bool equal = inks[0].second == inks[1].second && inks[1].second == inks[2].second;
    const auto cyan = std::find_if(inks.begin(), inks.end(),
                                   [](const auto &ink) { return ink.first == "CMYK_C"; });
    return Step{equal ? "CMY" : "CMY grey", cyan->second};
}

} // namespace

std::vector<ToneStep> tones_of(const std::vector<ControlPatch> &controls)
{
    std::map<std::pair<std::string, double>, ToneStep> steps;
    for (const ControlPatch &control : controls)
        if (control.inks.size() == 1 && (control.gain || control.sctv)) {
            const auto &[ink, nominal] = control.inks[0];
            steps.try_emplace({ink, nominal},
                              ToneStep{ink, nominal, plus(nominal, control.aim_gain),
                                       plus(nominal, control.gain), control.aim_sctv,
                                       control.sctv});
        }
    std::vector<ToneStep> out;
    for (auto &[key, step] : steps)
        out.push_back(std::move(step));
    return out;
}

std::vector<GreyStep> greys_of(const std::vector<PairReport> &pairs,
                               const std::vector<ControlPatch> &controls,
                               const Paper &reference_paper, const Paper &paper, int status)
{
    std::map<std::tuple<std::string, double, decltype(ControlPatch::inks)>, GreyStep> steps;
    for (std::size_t i = 0; i < pairs.size(); ++i) {
        const ControlPatch &control = controls[i];
        const auto step = step_of(control);
        if (!step)
            continue;
        const CIELABCOORD &aim = control.aim, &lab = control.lab;
        steps.try_emplace({step->scale, step->nominal, control.inks},
                          GreyStep{step->scale, step->nominal, control.name,
                                   std::hypot(lab.a - aim.a, lab.b - aim.b), lab.L - aim.L,
                                   neutral_density(reference_paper, pairs[i].reference, status),
                                   neutral_density(paper, pairs[i].sample, status)});
    }
    std::vector<GreyStep> out;
    for (auto &[key, step] : steps)
        out.push_back(std::move(step));
    return out;
}

} // namespace vantrel::sheets
