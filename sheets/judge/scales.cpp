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
    return Densitometer(paper.refl, status).neutral_density(*side.refl);
}

} // namespace

std::optional<GreyPlace> grey_place_of(const ControlPatch &patch)
{
    const auto &inks = patch.inks;
    if (inks.size() == 1 && inks[0].first == "CMYK_K")
        return GreyPlace{"K", inks[0].second};
    if (!is_neutral(patch))
        return std::nullopt;
    const bool equal = inks[0].second == inks[1].second && inks[1].second == inks[2].second;
    const auto cyan = std::find_if(inks.begin(), inks.end(),
                                   [](const auto &ink) { return ink.first == "CMYK_C"; });
    return GreyPlace{equal ? "CMY" : "CMY grey", cyan->second};
}

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
        const auto step = grey_place_of(control);
        if (!step)
            continue;
        const CIELABCOORD &aim = control.aim, &lab = control.lab;
        steps.try_emplace({step->scale, step->nominal, control.inks},
                          GreyStep{*step, control.name, std::hypot(lab.a - aim.a, lab.b - aim.b),
                                   lab.L - aim.L,
                                   neutral_density(reference_paper, pairs[i].reference, status),
                                   neutral_density(paper, pairs[i].sample, status)});
    }
    std::vector<GreyStep> out;
    for (auto &[key, step] : steps)
        out.push_back(std::move(step));
    return out;
}

} // namespace vantrel::sheets
