#include "judge/report.h"

#include "judge/compare.h"
#include "judge/densitometer.h"
#include "judge/names.h"
#include "judge/tone_value.h"
#include "judge/zones.h"
#include "read/labels.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>
#include <tuple>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kMostRepeated = 2000; // kinds of patches in a zone

// A gain is never negative: a tint that prints too light has none.
double gain_of(double dot_area, double nominal)
{
    return dot_area >= nominal ? dot_area - nominal : 0;
}

void measure_tint(PatchReport &row, const Patch &patch, const Patch &solid, double nominal,
                  const Conditions &conditions, const Densitometer &densitometer)
{
    const ILLUM_OBS illuminant = conditions.illuminant;
    row.sctv = spot_colour_tone_value(lab_of(conditions.paper, illuminant),
                                      lab_of(solid.refl, illuminant), row.colour.lab);
    row.dot_area = densitometer.dot_area(solid.refl, patch.refl, conditions.n_factor);
    if (row.dot_area)
        row.dot_gain = gain_of(*row.dot_area, nominal);
    if (nominal >= 75 && nominal <= 80)
        row.print_contrast = densitometer.print_contrast(solid.refl, patch.refl);
}

// The attributes that need to know with which inks the patch was printed.
void measure_inks(PatchReport &row, const Patch &patch, const Conditions &conditions,
                  const Densitometer &densitometer)
{
    const Inks &inks = conditions.inks;
    const auto tints = inks.tints_of(patch);
    if (!tints)
        return;
    if (Inks::ink_of_solid(*tints)) {
        if (const auto measured = densitometer.hue_gray(patch.refl)) {
            row.hue_error = measured->hue_error;
            row.grayness = measured->grayness;
        }
        return;
    }
    const bool overprint =
        tints->size() == 2 && (*tints)[0].percent == 100 && (*tints)[1].percent == 100;
    if (tints->size() != 1 && !overprint)
        return;
    std::vector<const Patch *> beside; // the solids in the zone of the patch
    for (const Tint &tint : *tints) {
        const auto &solids = inks.solids_of(tint.ink);
        if (!solids)
            return;
        if (const Patch *solid = solids->in(zoned_name(patch.name).zone))
            beside.push_back(solid);
        else
            row.lacking.push_back(tint.ink);
    }
    if (!row.lacking.empty())
        return;
    if (overprint)
        row.trap = densitometer.trap(beside[0]->refl, beside[1]->refl, patch.refl);
    else
        measure_tint(row, patch, *beside[0], (*tints)[0].percent, conditions, densitometer);
}

MetamerismReport metamerism_of(const Measurement &sheet, const Paper &paper, ILLUM_OBS illuminant,
                               const ReportRequest &request, std::vector<std::string> &warnings)
{
    const Measurement &other = request.second_sheet ? *request.second_sheet : sheet;
    require_paper(paper.choice, sheet.file, "--second-paper");
    if (request.second_sheet) {
        for (const std::string &warning : reading_warnings(other))
            warnings.push_back(warning);
        if (other.kind == Kind::colours)
            illuminant_for(illuminant, {&other}, warnings);
    }
    const Paper second = paper_of(other, request.second_paper, illuminant, warnings);
    require_paper(second.choice, other.file, "--second-paper");
    MetamerismReport out{.file = request.second_sheet ? other.file : "",
                         .paper = second.choice,
                         .illuminant = request.second_illuminant.value_or(usual_second(illuminant)),
                         .de00 = delta_e00(lab_of(paper, illuminant), lab_of(second, illuminant)),
                         .sum = {},
                         .din6172 = {}};
    for (const Measurement *one : {&sheet, &other})
        if (one->kind == Kind::colours) {
            warnings.push_back(fmt::format(
                "{} holds colours alone: there is no metamerism, which takes spectra", one->file));
            return out;
        }
    double sum = 0, din6172 = 0;
    Metamerism(paper.refl.data(), second.refl.data(), illuminant, out.illuminant, &sum);
    ReflToDIN6172(paper.refl.data(), second.refl.data(), illuminant, out.illuminant, &din6172);
    out.sum = sum;
    out.din6172 = din6172;
    return out;
}

std::vector<ToneCurve> tone_curves(const Inks &inks, const std::vector<PatchReport> &rows)
{
    std::vector<std::map<double, ToneValue>> sums(inks.names().size());
    for (const PatchReport &row : rows) {
        if (!row.dot_area || !row.sctv)
            continue;
        const Tint tint = inks.tints_of(*row.patch)->front(); // the only one
        ToneValue &sum = sums[tint.ink].try_emplace(tint.percent).first->second;
        sum.nominal = tint.percent;
        sum.dot_area += *row.dot_area;
        sum.dot_gain += *row.dot_gain;
        sum.sctv += *row.sctv;
        ++sum.patches;
    }
    std::vector<ToneCurve> curves;
    for (std::size_t ink = 0; ink < sums.size(); ++ink) {
        if (sums[ink].empty())
            continue;
        ToneCurve &curve = curves.emplace_back();
        curve.ink = inks.names()[ink];
        curve.solid = inks.solid(ink)->name;
        const Zones &solids = *inks.solids_of(ink);
        curve.solid = solids.each.empty()
                          ? name_of_mean(curve.solid, solids.all.count)
                          : fmt::format("{} (of each zone its own)", zoned_name(curve.solid).name);
        curve.spot = !is_process_ink(ink_title(curve.ink));
        for (auto &[nominal, sum] : sums[ink]) {
            sum.dot_area /= static_cast<double>(sum.patches);
            sum.dot_gain /= static_cast<double>(sum.patches);
            sum.sctv /= static_cast<double>(sum.patches);
            curve.values.push_back(sum);
        }
    }
    return curves;
}

} // namespace

PatchReport patch_report(const Patch &patch, const Conditions &conditions)
{
    PatchReport row;
    row.patch = &patch;
    row.colour = colour_of(conditions.sheet, patch, conditions.illuminant);
    const Paper &paper = conditions.paper;
    if (paper.choice.exists())
        row.to_paper = delta_e00(lab_of(paper, conditions.illuminant), row.colour.lab);
    row.lch = lch_of(row.colour.lab);
    if (conditions.sheet.kind == Kind::colours)
        return row;
    row.refl = &patch.refl;

    const Densitometer densitometer(paper.refl, conditions.status);
    const DensityReading reading = densitometer.read(patch.refl);
    row.response = reading.response;
    row.density = reading.density;
    if (paper.choice.exists())
        measure_inks(row, patch, conditions, densitometer);
    return row;
}

PaperReport paper_report(const Paper &paper, ILLUM_OBS illuminant)
{
    PaperReport out{
        .choice = paper.choice, .lab = {}, .brightness = {}, .whiteness = {}, .no_whiteness = {}};
    if (!paper.choice.exists()) {
        out.no_whiteness = "there is no paper";
        return out;
    }
    out.lab = lab_of(paper, illuminant);
    if (paper.lab) {
        out.no_whiteness = "there are no spectra";
        return out;
    }
    double brightness = 0;
    ReflToBrightness(paper.refl.data(), &brightness);
    out.brightness = brightness;
    double whiteness = 0;
    if (ReflToWhiteE313_98(paper.refl.data(), illuminant, &whiteness))
        out.whiteness = whiteness;
    else if (illuminant < C_2DEG || illuminant > D65_10DEG)
        out.no_whiteness =
            fmt::format("under {}: ASTM E313 has C, D50 and D65 alone", name_of(illuminant));
    else
        out.no_whiteness = "outside its limits, 40 < W < 5 Y - 280";
    return out;
}

namespace {

// Patches of the same device values that stand several times, one in each zone, say, and some of
// them once less.
void warn_of_lost_repeats(const Measurement &sheet, const Inks &inks,
                          std::vector<std::string> &warnings)
{
    struct Repeated {
        const Patch *first;
        std::size_t count;
    };
    std::map<Tints, Repeated> patches;
    for (const Patch &patch : sheet.patches)
        if (const auto tints = inks.tints_of(patch))
            if (++patches.try_emplace(*tints, Repeated{&patch, 0}).first->second.count == 1 &&
                patches.size() > kMostRepeated)
                return;
    std::map<std::size_t, std::vector<const Patch *>> often; // the first of each, by their count
    for (const auto &[tints, repeated] : patches)
        often[repeated.count].push_back(repeated.first);
    for (const auto &[count, whole] : often) {
        const auto less = often.find(count - 1);
        if (count < 3 || less == often.end() || 3 * whole.size() < patches.size() ||
            10 * (whole.size() + less->second.size()) < 8 * patches.size())
            continue;
        std::string names;
        for (std::size_t i = 0; i < less->second.size() && i < 3; ++i)
            names += (i ? ", " : "") + in_quotes(less->second[i]->name);
        warnings.push_back(fmt::format("{}: {} patches stand {} times, and {} once less: {}{}",
                                       sheet.file, whole.size(), count, less->second.size(), names,
                                       less->second.size() > 3 ? ", …" : ""));
    }
}

// A patch is near-neutral by its own colour.
std::vector<NeutralStep> neutral_steps(const std::vector<PatchReport> &rows, const Paper &paper,
                                       int status)
{
    std::vector<NeutralStep> out;
    for (std::size_t i = 0; i < rows.size(); ++i) {
        ControlPatch patch;
        patch.aim = rows[i].colour.lab;
        for (const auto &[field, percent] : rows[i].patch->device)
            if (is_ink(field) && percent > 0)
                patch.inks.emplace_back(field, percent);
        if (const auto place = grey_place_of(patch); place && rows[i].refl)
            out.push_back({*place, i, rows[i].patch->name,
                           Densitometer(paper.refl, status).neutral_density(*rows[i].refl)});
    }
    std::stable_sort(out.begin(), out.end(), [](const NeutralStep &a, const NeutralStep &b) {
        return std::tie(a.scale, a.nominal) < std::tie(b.scale, b.nominal);
    });
    return out;
}

// For the solids, by the mean of the patches of each, as compare() gives it.
void add_advice(Report &report, const ReportRequest &request)
{
    CompareRequest beside;
    beside.pairing.zones = true;
    beside.metrics = {usual_metric(Formula::de2000)};
    beside.illuminant = report.illuminant.illuminant;
    beside.status = request.status;
    beside.paper = request.paper;
    beside.advice = true;
    Comparison comparison = compare(*request.aims, *report.sheet, beside);
    report.advice = std::move(comparison.advice);
    for (std::string &warning : comparison.warnings)
        if (std::find(report.warnings.begin(), report.warnings.end(), warning) ==
            report.warnings.end())
            report.warnings.push_back(std::move(warning));
}

} // namespace

Report report_of(Measurement measurement, const ReportRequest &request)
{
    const auto kept = std::make_shared<const Measurement>(std::move(measurement));
    const Measurement &sheet = *kept;
    std::vector<std::string> warnings = reading_warnings(sheet);
    const IlluminantChoice illuminant = illuminant_for(request.illuminant, {&sheet}, warnings);
    const Paper paper = paper_of(sheet, request.paper, illuminant, warnings);
    std::optional<MetamerismReport> metamerism;
    if (request.second_sheet || !request.second_paper.empty())
        metamerism = metamerism_of(sheet, paper, illuminant, request, warnings);
    const Inks inks(sheet, request.order);
    Report report{.sheet = kept,
                  .illuminant = illuminant,
                  .status = request.status,
                  .n_factor = request.n_factor,
                  .inks = inks.names(),
                  .paper = paper_report(paper, illuminant),
                  .metamerism = std::move(metamerism),
                  .patches = {},
                  .left_out = {},
                  .tone_curves = {},
                  .greys = {},
                  .advice = {},
                  .warnings = std::move(warnings)};
    const Conditions conditions{sheet, inks, paper, illuminant, request.status, request.n_factor};
    const Work work{request.tell, "Measuring", sheet.patches.size()};
    report.patches.reserve(sheet.patches.size());
    for (const Patch &patch : sheet.patches) {
        report.patches.push_back(patch_report(patch, conditions));
        work.done(report.patches.size());
    }
    std::vector<std::optional<double>> densities;
    for (const PatchReport &patch : report.patches)
        densities.push_back(patch.density);
    warn_of_paper(sheet.file, paper.choice, densities, report.warnings);
    warn_of_lost_repeats(sheet, inks, report.warnings);
    LackingSolids lacking;
    for (const PatchReport &patch : report.patches)
        for (const std::size_t ink : patch.lacking)
            lacking[inks.names()[ink]].insert(zoned_name(patch.patch->name).zone);
    warn_of_solids(sheet.file, lacking, report.warnings);
    report.tone_curves = tone_curves(inks, report.patches);
    if (paper.choice.exists())
        report.greys = neutral_steps(report.patches, paper, request.status);
    if (inks.is_ramp())
        report.warnings.push_back(fmt::format(
            "{}: the names of the patches are taken for the percentages of one ink", sheet.file));
    if (request.aims)
        add_advice(report, request);
    return report;
}

} // namespace vantrel::sheets
