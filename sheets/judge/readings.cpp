#include "judge/readings.h"

#include "judge/control.h"
#include "judge/densitometer.h"
#include "judge/inks.h"
#include "judge/repeats.h"
#include "judge/tone_value.h"
#include "judge/zones.h"
#include "read/labels.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

namespace vantrel::sheets {
namespace {

struct Row {
    Attribute attribute;
    std::string_view key, title;
    int decimals;
    double apart;
};
constexpr std::array<Row, 11> kAttributes = {{
    {Attribute::density, "density", "density", 3, 0.02},
    {Attribute::tone_value, "tone_value", "tone value", 2, 1},
    {Attribute::contrast, "contrast", "contrast", 2, 1},
    {Attribute::trap, "trap", "trap", 2, 1},
    {Attribute::paper, "paper", "paper ΔE00", 2, 0.5},
    {Attribute::solid, "solid", "solid ΔE00", 2, 0.5},
    {Attribute::delta_ch, "delta_ch", "ΔCh", 2, 0.5},
    {Attribute::delta_l, "delta_l", "ΔL*", 2, 0.5},
    {Attribute::neutral, "neutral", "neutral density", 3, 0.02},
    {Attribute::mean_de00, "mean_de00", "mean ΔE00", 2, 0.5},
    {Attribute::max_de00, "max_de00", "largest ΔE00", 2, 0.5},
}};

const Row &row_of(Attribute attribute) { return kAttributes[static_cast<std::size_t>(attribute)]; }

// The patches of one combination of inks.
struct Printed {
    std::vector<std::size_t> places;
    Zones zones{};
    const ControlPatch *control = nullptr; // the mean beside its aim
    std::optional<int> response;           // that reads it
};

// A sheet whose patches are told apart by their inks and their zones.
class Zoned {
public:
    Zoned(const Measurement &aims, Measurement measured, const CompareRequest &request)
        : sheet(std::move(measured))
    {
        for (Patch &patch : sheet.patches)
            zones.push_back(take_zone(patch));
        std::vector<std::string> warnings; // which compare() gives too
        pairs = pairs_of(aims, sheet, request.pairing, warnings);
        for (const Pair &pair : pairs.matched)
            for (const std::size_t place : pair.sample)
                if (sheet.patches[place].device.empty())
                    sheet.patches[place].device = aims.patches[pair.reference.front()].device;
        if (std::all_of(zones.begin(), zones.end(), [](int zone) { return zone == 0; }))
            number_by_place();
    }

    Measurement sheet;
    Pairs pairs;
    std::vector<int> zones; // of the patches; 0 for none
    bool by_place = false;  // the zones

private:
    // Where most aims serve the same number of patches.
    void number_by_place()
    {
        std::map<std::size_t, std::size_t> often;
        for (const Pair &pair : pairs.matched)
            ++often[pair.sample.size()];
        const auto most = std::max_element(often.begin(), often.end(), [](auto &a, auto &b) {
                              return a.second < b.second;
                          })->first;
        by_place = most >= 2;
        if (!by_place)
            return;
        for (const Pair &pair : pairs.matched)
            for (std::size_t i = 0; i < pair.sample.size() && pair.sample.size() == most; ++i)
                zones[pair.sample[i]] = static_cast<int>(i) + 1;
    }
};

using AllPrinted = std::map<Tints, Printed>;

AllPrinted printed_on(const Zoned &zoned, const Inks &inks, const Comparison &comparison,
                      const std::vector<ControlPatch> &controls, const Densitometer &densitometer)
{
    const Measurement &sheet = zoned.sheet;
    AllPrinted out;
    for (std::size_t i = 0; i < sheet.patches.size(); ++i)
        if (const auto tints = inks.tints_of(sheet.patches[i]))
            out[*tints].places.push_back(i);
    for (auto &[tints, printed] : out) {
        printed.zones = by_zone(sheet, printed.places, zoned.zones, comparison.illuminant);
        printed.response = densitometer.response(printed.zones.all.patch.refl);
    }
    for (std::size_t i = 0; i < controls.size(); ++i) {
        const auto tints = inks.tints_of(sheet.patches[zoned.pairs.matched[i].sample.front()]);
        if (!tints || out[*tints].control) // several aims of the same inks: the first
            continue;
        Printed &printed = out[*tints];
        printed.control = &controls[i];
        printed.zones.all.patch.refl = comparison.pairs[i].sample.refl.value();
        if (comparison.pairs[i].response)
            printed.response = comparison.pairs[i].response;
    }
    return out;
}

// Reads what was printed on one sheet, beside other patches of the same sheet or zone.
class Reader {
public:
    Reader(const Paper &paper, const Inks &inks, const AllPrinted &all, ILLUM_OBS illuminant,
           int status)
        : paper(paper), inks(inks), all(all), illuminant(illuminant),
          densitometer(paper.refl, status)
    {
    }

    void read(const Tints &tints, const Printed &printed)
    {
        if (tints.size() == 1 && tints[0].percent == 100)
            add_solid(tints, printed);
        else if (tints.size() == 1)
            add_tint(tints, printed);
        else if (tints.size() == 2 && tints[0].percent == 100 && tints[1].percent == 100)
            add_trap(tints, printed);
        if (printed.control)
            add_distances(tints, printed);
        const bool black = tints.size() == 1 && inks.names()[tints[0].ink] == "CMYK_K" &&
                           tints[0].percent < 100 && is_shown(tints[0]);
        if (black || (printed.control && is_neutral(*printed.control)))
            add({Attribute::neutral, short_title_of(tints)}, printed, {},
                [&](const Spectrum &refl, int) {
                    return std::optional(densitometer.neutral_density(refl));
                });
    }

    std::vector<ZoneReading> readings;

private:
    // Null where the sheet has no such patch, or the zone lacks the one that others have.
    const Spectrum *find(const Tints &tints, int zone) const
    {
        const auto found = all.find(tints);
        const Patch *patch = found == all.end() ? nullptr : found->second.zones.in(zone);
        return patch ? &patch->refl : nullptr;
    }

    // `read` gives what a spectrum reads in a zone, 0 for the mean of all, which is the value.
    template <typename Read>
    void add(const Measurand &measurand, const Printed &printed, std::optional<double> aim,
             Read read)
    {
        const std::optional<double> value = read(printed.zones.all.patch.refl, 0);
        if (!value || !std::isfinite(*value))
            return;
        ZoneReading reading{.measurand = measurand, .value = *value, .aim = aim};
        for (const auto &[zone, patch] : printed.zones.each)
            if (const std::optional<double> own = read(patch.refl, zone);
                own && std::isfinite(*own))
                reading.zones[zone] = *own;
        readings.push_back(std::move(reading));
    }

    using Beside = std::vector<const Spectrum *>;

    // The same of what is read beside the solid of the zone: the value is the mean over the zones.
    // `read` takes the solids of these inks, and gives nothing where one is null.
    template <typename Read>
    void add_beside(const std::vector<Tints> &solids, const Measurand &measurand,
                    const Printed &printed, std::optional<double> aim, Read read)
    {
        const std::size_t before = readings.size();
        add(measurand, printed, aim, [&](const Spectrum &refl, int zone) -> std::optional<double> {
            Beside beside;
            for (const Tints &solid : solids)
                if (const Spectrum *found = find(solid, zone))
                    beside.push_back(found);
            return beside.size() == solids.size() ? read(refl, beside) : std::nullopt;
        });
        if (readings.size() == before || printed.zones.each.empty())
            return;
        ZoneReading &reading = readings.back();
        if (reading.zones.empty()) { // no zone has a solid
            readings.pop_back();
            return;
        }
        double sum = 0;
        for (const auto &[zone, value] : reading.zones)
            sum += value;
        reading.value = sum / static_cast<double>(reading.zones.size());
    }

    void add_solid(const Tints &tints, const Printed &printed)
    {
        if (printed.response)
            add({Attribute::density, title_of(tints[0])}, printed,
                printed.control ? printed.control->aim_density : std::nullopt,
                [&](const Spectrum &refl, int) {
                    return std::optional(densitometer.density(refl, *printed.response));
                });
    }

    void add_tint(const Tints &tints, const Printed &printed)
    {
        const std::vector<Tints> solid = {{{tints[0].ink, 100}}};
        if (!is_shown(tints[0]))
            return;
        const std::string ink = title_of(tints[0]);
        const double nominal = tints[0].percent;
        if (is_process_ink(ink)) {
            std::optional<double> aim;
            if (printed.control && printed.control->aim_gain)
                aim = nominal + *printed.control->aim_gain;
            add_beside(solid, {Attribute::tone_value, ink, nominal}, printed, aim,
                       [&](const Spectrum &refl, const Beside &beside) {
                           return densitometer.dot_area(*beside[0], refl, 1);
                       });
        } else {
            add_beside(solid, {Attribute::tone_value, ink, nominal, true}, printed,
                       printed.control ? printed.control->aim_sctv : std::nullopt,
                       [&](const Spectrum &refl, const Beside &beside) {
                           return spot_colour_tone_value(lab_of(paper, illuminant),
                                                         lab_of(*beside[0], illuminant),
                                                         lab_of(refl, illuminant));
                       });
        }
        if (nominal >= 75 && nominal <= 80)
            add_beside(solid, {Attribute::contrast, ink, nominal}, printed, {},
                       [&](const Spectrum &refl, const Beside &beside) {
                           return densitometer.print_contrast(*beside[0], refl);
                       });
    }

    // Of a ramp with 25, 50 and 75 % these.
    bool is_shown(const Tint &tint) const
    {
        const bool quarters =
            find({{tint.ink, 25}}, 0) && find({{tint.ink, 50}}, 0) && find({{tint.ink, 75}}, 0);
        return !quarters || std::fmod(tint.percent, 25) == 0;
    }

    void add_trap(const Tints &tints, const Printed &printed)
    {
        add_beside({{tints[0]}, {tints[1]}},
                   {Attribute::trap, title_of(tints[0]) + " + " + title_of(tints[1])}, printed, {},
                   [&](const Spectrum &refl, const Beside &beside) {
                       return densitometer.trap(*beside[0], *beside[1], refl);
                   });
    }

    void add_distances(const Tints &tints, const Printed &printed)
    {
        const ControlPatch &control = *printed.control;
        const auto de00 = [&](const Spectrum &refl, int) {
            return std::optional(delta_e00(control.aim, lab_of(refl, illuminant)));
        };
        if (tints.empty())
            add({Attribute::paper, ""}, printed, {}, de00);
        else if (tints.size() == 1 && tints[0].percent == 100)
            add({Attribute::solid, title_of(tints[0])}, printed, {}, de00);
        if (!is_neutral(control))
            return;
        add({Attribute::delta_ch, short_title_of(tints)}, printed, {},
            [&](const Spectrum &refl, int) {
                const CIELABCOORD lab = lab_of(refl, illuminant);
                return std::optional(std::hypot(lab.a - control.aim.a, lab.b - control.aim.b));
            });
        add({Attribute::delta_l, short_title_of(tints)}, printed, {},
            [&](const Spectrum &refl, int) {
                return std::optional(lab_of(refl, illuminant).L - control.aim.L);
            });
    }

    std::string title_of(const Tint &tint) const { return ink_title(inks.names()[tint.ink]); }

    // "C 50 M 40 Y 40"
    std::string short_title_of(const Tints &tints) const
    {
        std::string out;
        for (const Tint &tint : tints)
            out += fmt::format("{}{} {:g}", out.empty() ? "" : " ",
                               inks.names()[tint.ink].substr(5), tint.percent);
        return out;
    }

    const Paper &paper;
    const Inks &inks;
    const AllPrinted &all;
    ILLUM_OBS illuminant;
    Densitometer densitometer;
};

// Over all patches that have an aim.
void add_statistics(std::vector<ZoneReading> &readings, const AllPrinted &all,
                    const Comparison &comparison)
{
    std::map<int, std::vector<double>> zones;
    for (const auto &[tints, printed] : all)
        if (printed.control)
            for (const auto &[zone, patch] : printed.zones.each)
                zones[zone].push_back(
                    delta_e00(printed.control->aim, lab_of(patch.refl, comparison.illuminant)));
    ZoneReading mean{.measurand = {.attribute = Attribute::mean_de00, .subject = {}},
                     .value = comparison.statistics[0].mean},
        largest{.measurand = {.attribute = Attribute::max_de00, .subject = {}},
                .value = comparison.statistics[0].max};
    for (const auto &[zone, values] : zones) {
        const Statistics statistics = statistics_of(values);
        mean.zones[zone] = statistics.mean;
        largest.zones[zone] = statistics.max;
    }
    readings.push_back(std::move(mean));
    readings.push_back(std::move(largest));
}

} // namespace

std::string_view key_of(Attribute attribute) { return row_of(attribute).key; }

int decimals_of(Attribute attribute) { return row_of(attribute).decimals; }

double apart_by(Attribute attribute) { return row_of(attribute).apart; }

std::string Measurand::title() const
{
    std::string out = subject;
    if (nominal < 100)
        out += fmt::format(" {:g} %", nominal);
    return fmt::format("{}{}{}{}", out, out.empty() ? "" : " ", row_of(attribute).title,
                       sctv ? " (SCTV)" : "");
}

int take_zone(Patch &patch)
{
    const ZonedName zoned = zoned_name(patch.name);
    patch.name.resize(zoned.name.size());
    return zoned.zone;
}

SheetReadings readings_of(const Measurement &aims, Measurement measured, CompareRequest request,
                          const std::vector<std::string> &order)
{
    request.pairing.zones = true;
    const Zoned zoned(aims, std::move(measured), request);
    const Measurement &sheet = zoned.sheet;
    std::vector<std::string> told; // by compare() too
    const ILLUM_OBS illuminant = request.illuminant.value();
    const JudgedSheet references{aims, paper_of(aims, request.paper, illuminant, told),
                                 zones_of(aims)},
        samples{sheet, paper_of(sheet, request.paper, illuminant, told), zoned.zones};
    const Paper &paper = samples.paper;
    require_paper(paper.choice, sheet.file, "a press run");
    request.sample_zones = zoned.zones;
    Comparison comparison = compare(aims, sheet, request);
    const std::vector<ControlPatch> controls =
        control_patches(comparison.pairs, zoned.pairs.matched, references, samples, illuminant,
                        request.status, told);
    const Inks inks(sheet, order);
    const AllPrinted all =
        printed_on(zoned, inks, comparison, controls, Densitometer(paper.refl, request.status));
    Reader reader(paper, inks, all, comparison.illuminant, request.status);
    SheetReadings out;
    for (const auto &[tints, printed] : all)
        reader.read(tints, printed);
    add_statistics(reader.readings, all, comparison);
    out.readings = std::move(reader.readings);
    out.coverage = comparison.coverage;
    for (const Unpaired &aim : comparison.only_reference)
        out.unserved.push_back(aim.name);
    out.limits = std::move(comparison.limits);
    out.verdict = comparison.verdict;
    out.advice = std::move(comparison.advice);
    out.warnings = std::move(comparison.warnings);
    if (zoned.by_place)
        out.warnings.push_back(sheet.file + ": no names tell the zones; their order in the file is "
                                            "taken for it, a guess");
    return out;
}

} // namespace vantrel::sheets
