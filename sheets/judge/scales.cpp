#include "judge/scales.h"

#include "judge/densitometer.h"
#include "judge/zones.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <tuple>
#include <utility>

namespace vantrel::sheets {
namespace {

// The mean of values that may be missing.
struct Mean {
    double sum = 0, count = 0;

    void add(const std::optional<double> &value)
    {
        sum += value.value_or(0);
        count += value ? 1 : 0;
    }
    std::optional<double> plus(double nominal) const
    {
        return count > 0 ? std::optional(nominal + sum / count) : std::nullopt;
    }
};

std::optional<double> neutral_density(const JudgedSheet &sheet, const Patch &patch, int status)
{
    if (!sheet.has_spectra() || !sheet.paper.choice.exists())
        return std::nullopt;
    return Densitometer(sheet.paper.refl, status).neutral_density(patch.refl);
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

std::vector<ToneStep> tones_of(const std::vector<ControlPatch> &controls,
                               const std::vector<Pair> &pairs)
{
    struct Means {
        Mean aim_gain, gain, aim_sctv, sctv;
        std::size_t patches = 0;
    };
    std::map<std::pair<std::string, double>, Means> steps; // by ink and nominal value
    for (std::size_t i = 0; i < controls.size(); ++i) {
        const ControlPatch &control = controls[i];
        if (control.inks.size() != 1 || !(control.gain || control.sctv))
            continue;
        Means &means = steps[control.inks[0]];
        means.aim_gain.add(control.aim_gain);
        means.gain.add(control.gain);
        means.aim_sctv.add(control.aim_sctv);
        means.sctv.add(control.sctv);
        means.patches += pairs[i].sample.size();
    }
    std::vector<ToneStep> out;
    for (const auto &[step, means] : steps) {
        const auto &[ink, nominal] = step;
        out.push_back({ink, nominal, means.aim_gain.plus(nominal), means.gain.plus(nominal),
                       means.aim_sctv.plus(0), means.sctv.plus(0), means.patches});
    }
    return out;
}

std::vector<GreyStep> greys_of(const std::vector<ControlPatch> &controls,
                               const std::vector<Pair> &pairs, const JudgedSheet &references,
                               const JudgedSheet &samples, ILLUM_OBS illuminant, int status)
{
    std::map<std::tuple<std::string, double, decltype(ControlPatch::inks)>, JoinedPairs> steps;
    for (std::size_t i = 0; i < pairs.size(); ++i)
        if (const auto step = grey_place_of(controls[i]))
            steps[{step->scale, step->nominal, controls[i].inks}].add(pairs[i]);
    std::vector<GreyStep> out;
    for (const auto &[step, joined] : steps) {
        const Pair places = joined.pair();
        const Measurement &reference = references.measurement, &sample = samples.measurement;
        const Patch aim = mean_of(reference, places.reference, illuminant).patch,
                    patch = mean_of(sample, places.sample, illuminant).patch;
        const CIELABCOORD of_aim = lab_of(reference, aim, illuminant),
                          lab = lab_of(sample, patch, illuminant);
        out.push_back({{std::get<0>(step), std::get<1>(step)},
                       name_of_mean(patch.name, places.sample.size()),
                       std::hypot(lab.a - of_aim.a, lab.b - of_aim.b),
                       lab.L - of_aim.L,
                       neutral_density(references, aim, status),
                       neutral_density(samples, patch, status)});
    }
    return out;
}

} // namespace vantrel::sheets
