#include "judge/control.h"

#include "judge/densitometer.h"
#include "judge/inks.h"
#include "judge/tone_value.h"
#include "judge/zones.h"

#include <algorithm>

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

// Reads the tints of one sheet, each beside the solid of its zone.
class Tones {
public:
    Tones(const JudgedSheet &sheet, std::vector<std::size_t> Pair::*side, ILLUM_OBS illuminant,
          int status)
        : sheet(sheet), side(side), illuminant(illuminant), densitometer(sheet.paper.refl, status)
    {
    }

    void set_solids(const std::vector<ControlPatch> &controls, const std::vector<Pair> &pairs)
    {
        for (const auto &[ink, pair] : solids_of(controls, pairs))
            solids.emplace(ink, by_zone(sheet.measurement, pair.*side, sheet.zones, illuminant));
    }

    // By density, less the nominal value: negative where a tint prints too light.
    std::optional<double> gain(const ControlPatch &tint, const Pair &pair)
    {
        const auto area = read(tint, pair, [&](const Patch &solid, const Patch &patch) {
            return sheet.has_spectra() ? densitometer.dot_area(solid.refl, patch.refl, 1)
                                       : std::nullopt;
        });
        return area ? std::optional(*area - tint.inks[0].second) : std::nullopt;
    }

    std::optional<double> sctv(const ControlPatch &tint, const Pair &pair)
    {
        return read(tint, pair, [&](const Patch &solid, const Patch &patch) {
            return spot_colour_tone_value(lab_of(sheet.paper, illuminant),
                                          lab_of(sheet.measurement, solid, illuminant),
                                          lab_of(sheet.measurement, patch, illuminant));
        });
    }

    void warn(std::vector<std::string> &warnings) const
    {
        warn_of_solids(sheet.measurement.file, lacking, warnings);
    }

private:
    // The mean over the zones.
    template <typename Read>
    std::optional<double> read(const ControlPatch &tint, const Pair &pair, Read read)
    {
        const std::string &ink = tint.inks[0].first;
        const auto found = solids.find(ink);
        if (found == solids.end() || !sheet.paper.choice.exists())
            return std::nullopt;
        Zones tints = by_zone(sheet.measurement, pair.*side, sheet.zones, illuminant);
        if (tints.each.empty())
            tints.each.emplace(0, tints.all.patch);
        double sum = 0, count = 0;
        for (const auto &[zone, patch] : tints.each) {
            const Patch *solid = found->second.in(zone);
            if (!solid)
                lacking[ink].insert(zone);
            else if (const std::optional<double> value = read(*solid, patch)) {
                sum += *value;
                ++count;
            }
        }
        return count > 0 ? std::optional(sum / count) : std::nullopt;
    }

    const JudgedSheet &sheet;
    std::vector<std::size_t> Pair::*side;
    ILLUM_OBS illuminant;
    Densitometer densitometer;
    std::map<std::string, Zones> solids; // of each ink
    LackingSolids lacking;
};

} // namespace

std::map<std::string, Pair> solids_of(const std::vector<ControlPatch> &controls,
                                      const std::vector<Pair> &pairs)
{
    std::map<std::string, JoinedPairs> solids;
    for (std::size_t i = 0; i < pairs.size(); ++i)
        if (is_solid(controls[i]))
            solids[controls[i].inks[0].first].add(pairs[i]);
    std::map<std::string, Pair> out;
    for (const auto &[ink, joined] : solids)
        out.emplace(ink, joined.pair());
    return out;
}

std::vector<ControlPatch> control_patches(const std::vector<PairReport> &reports,
                                          const std::vector<Pair> &pairs,
                                          const JudgedSheet &references, const JudgedSheet &samples,
                                          ILLUM_OBS illuminant, int status,
                                          std::vector<std::string> &warnings)
{
    std::vector<ControlPatch> out;
    for (const PairReport &pair : reports)
        out.push_back(control_patch(pair, references.paper, references.measurement.collection));
    Tones aims(references, &Pair::reference, illuminant, status),
        tones(samples, &Pair::sample, illuminant, status);
    aims.set_solids(out, pairs);
    tones.set_solids(out, pairs);
    for (std::size_t i = 0; i < pairs.size(); ++i) {
        ControlPatch &tint = out[i];
        if (!is_tint(tint))
            continue;
        tint.aim_gain = aims.gain(tint, pairs[i]);
        tint.gain = tones.gain(tint, pairs[i]);
        if (is_process_ink(ink_title(tint.inks[0].first)))
            continue;
        tint.aim_sctv = aims.sctv(tint, pairs[i]);
        tint.sctv = tones.sctv(tint, pairs[i]);
    }
    aims.warn(warnings);
    tones.warn(warnings);
    return out;
}

} // namespace vantrel::sheets
