#include "judge/limits.h"

#include "judge/statistics.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <map>

namespace vantrel::sheets {
namespace {

constexpr double kNeutralChroma = 10; // C*ab of an aim that passes for neutral

bool is_in(Group group, const ControlPatch &patch)
{
    const auto &inks = patch.inks;
    const bool all_solid =
        std::all_of(inks.begin(), inks.end(), [](const auto &ink) { return ink.second == 100; });
    switch (group) {
    case Group::all:
        return true;
    case Group::paper:
        return patch.paper;
    case Group::solids:
        return inks.size() == 1 && all_solid;
    case Group::overprints:
        return inks.size() > 1 && all_solid;
    case Group::tints:
        return inks.size() == 1 && !all_solid;
    case Group::neutrals:
        return is_neutral(patch);
    case Group::spots:
        return patch.spot;
    }
    return false;
}

bool concerns(const Tolerance &limit, const ControlPatch &patch)
{
    if (!is_in(limit.group, patch))
        return false;
    if (!limit.ink.empty() && (patch.inks.size() != 1 || patch.inks[0].first != limit.ink))
        return false;
    return !limit.nominal || patch.inks[0].second == *limit.nominal;
}

// What a patch adds to a statistic; nothing where it cannot be told.
using Deviation = std::optional<double>;

Deviation deviation(const std::optional<double> &aim, const std::optional<double> &value)
{
    return aim && value ? Deviation(std::abs(*value - *aim)) : std::nullopt;
}

// CIE 15, of a* and b* as they are: LabToDH() takes them with two decimals, which among close
// colours is all the difference.
double hue_difference(const CIELABCOORD &aim, const CIELABCOORD &sample)
{
    const double a = sample.a - aim.a, b = sample.b - aim.b;
    const double chroma = std::hypot(sample.a, sample.b) - std::hypot(aim.a, aim.b);
    return std::sqrt(std::max(0.0, a * a + b * b - chroma * chroma));
}

// Of spot inks by their tone values of ISO 20654.
Deviation gain_deviation(const Tolerance &limit, const ControlPatch &patch)
{
    if (!patch.sctv)
        return deviation(limit.aim ? limit.aim : patch.aim_gain, patch.gain);
    return deviation(limit.aim ? patch.inks[0].second + *limit.aim : patch.aim_sctv, patch.sctv);
}

Deviation deviation_of(const Tolerance &limit, const ControlPatch &patch)
{
    switch (limit.quantity) {
    case Quantity::colour_difference:
        return limit.metric(patch.aim, patch.lab);
    case Quantity::lightness:
        return std::abs(patch.lab.L - patch.aim.L);
    case Quantity::hue:
        return hue_difference(patch.aim, patch.lab);
    case Quantity::neutral_chroma:
        return std::hypot(patch.lab.a - patch.aim.a, patch.lab.b - patch.aim.b);
    case Quantity::density:
        return deviation(limit.aim ? limit.aim : patch.aim_density, patch.density);
    case Quantity::gain:
        return gain_deviation(limit, patch);
    case Quantity::spread:
        break;
    }
    return std::nullopt;
}

struct Named {
    std::string name;
    Deviation value;
};

std::vector<Named> deviations_of(const Tolerance &limit, const std::vector<ControlPatch> &patches)
{
    std::vector<Named> out;
    for (const ControlPatch &patch : patches)
        if (concerns(limit, patch))
            out.push_back({patch.name, deviation_of(limit, patch)});
    return out;
}

struct Mean {
    double sum = 0;
    std::size_t count = 0;

    double value() const { return sum / static_cast<double>(count); }
};

// At each nominal value that two of the chromatic inks have, how far apart their gains are from
// their aims (ISO 12647-2, mid-tone spread); from 0 where the reference has no gains.
std::vector<Named> spreads_of(const Tolerance &limit, const std::vector<ControlPatch> &patches,
                              bool against_aims)
{
    std::map<double, std::map<std::string_view, Mean>> gains; // by nominal value and ink
    for (const ControlPatch &patch : patches) {
        if (!concerns(limit, patch) || !patch.gain)
            continue;
        const auto &[ink, nominal] = patch.inks[0];
        if (ink != "CMYK_C" && ink != "CMYK_M" && ink != "CMYK_Y")
            continue;
        Mean &mean = gains[nominal][ink];
        mean.sum += *patch.gain - (against_aims ? *patch.aim_gain : 0);
        ++mean.count;
    }
    std::vector<Named> out;
    for (const auto &[nominal, inks] : gains) {
        if (inks.size() < 2)
            continue;
        double least = INFINITY, most = -INFINITY;
        for (const auto &[ink, mean] : inks) {
            least = std::min(least, mean.value());
            most = std::max(most, mean.value());
        }
        out.push_back({fmt::format("{:g} %", nominal), most - least});
    }
    return out;
}

// Whether every tint of a spread has a gain to aim at.
bool has_gain_aims(const Tolerance &limit, const std::vector<ControlPatch> &patches)
{
    return std::all_of(patches.begin(), patches.end(), [&](const ControlPatch &patch) {
        return !concerns(limit, patch) || !patch.gain || patch.aim_gain;
    });
}

double value_of(const Statistics &statistics, Statistic statistic)
{
    switch (statistic) {
    case Statistic::maximum:
        return statistics.max;
    case Statistic::mean:
        return statistics.mean;
    case Statistic::p95:
        break;
    }
    return statistics.p95;
}

LimitResult judge(const Tolerance &limit, const std::vector<ControlPatch> &patches)
{
    LimitResult out;
    out.limit = limit;
    const bool of_spread = limit.quantity == Quantity::spread;
    const bool against_aims = of_spread && has_gain_aims(limit, patches);
    const std::vector<Named> all =
        of_spread ? spreads_of(limit, patches, against_aims) : deviations_of(limit, patches);
    std::vector<const Named *> judged;
    std::vector<double> values;
    for (const Named &named : all)
        if (named.value) {
            judged.push_back(&named);
            values.push_back(*named.value);
        }
    out.patches = all.size();
    out.judged = values.size();
    if (of_spread && !against_aims)
        out.note = "of the gains themselves: the reference has none";
    if (limit.quantity == Quantity::gain &&
        std::any_of(patches.begin(), patches.end(),
                    [&](auto &p) { return p.sctv && concerns(limit, p); }))
        out.note = "spot colours by SCTV (ISO 20654)";
    if (values.empty()) {
        out.note = of_spread     ? "no nominal value of which two inks have a gain"
                   : all.empty() ? "no such patch"
                                 : "no " + key_of(limit) + " on both sides";
        return out;
    }
    const Statistics statistics = statistics_of(values);
    out.measured = value_of(statistics, limit.statistic);
    out.worst = judged[statistics.max_at]->name;
    if (!(*out.measured <= limit.limit))
        out.verdict = Verdict::failed;
    else if (out.judged == out.patches)
        out.verdict = Verdict::passed;
    return out;
}

} // namespace

bool is_neutral(const ControlPatch &patch)
{
    if (patch.inks.size() != 3 || !(std::hypot(patch.aim.a, patch.aim.b) <= kNeutralChroma))
        return false;
    bool solid = true;
    for (const auto &[field, percent] : patch.inks) {
        if (field != "CMYK_C" && field != "CMYK_M" && field != "CMYK_Y")
            return false;
        solid = solid && percent == 100;
    }
    return !solid;
}

std::vector<LimitResult> judge_limits(const Tolerances &tolerances,
                                      const std::vector<ControlPatch> &patches)
{
    std::vector<LimitResult> out;
    for (const Tolerance &limit : tolerances.limits)
        out.push_back(judge(limit, patches));
    return out;
}

Verdict verdict_of(const std::vector<LimitResult> &results)
{
    Verdict out = Verdict::passed;
    for (const LimitResult &result : results)
        out = worse(out, result.verdict);
    return out;
}

} // namespace vantrel::sheets
