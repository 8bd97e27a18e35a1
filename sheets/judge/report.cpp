#include "judge/report.h"

#include "judge/densitometer.h"
#include "judge/names.h"

#include <fmt/format.h>

#include <map>

namespace vantrel::sheets {
namespace {

// A gain is never negative: a tint that prints too light has none.
double gain_of(double dot_area, double nominal)
{
    return dot_area >= nominal ? dot_area - nominal : 0;
}

void measure_tint(PatchReport &row, const Patch &patch, const Patch &solid, double nominal,
                  const Densitometer &densitometer, double n_factor)
{
    row.dot_area = densitometer.dot_area(solid.refl, patch.refl, n_factor);
    if (row.dot_area)
        row.dot_gain = gain_of(*row.dot_area, nominal);
    if (nominal >= 75 && nominal <= 80)
        row.print_contrast = densitometer.print_contrast(solid.refl, patch.refl);
}

// The attributes that need to know with which inks the patch was printed.
void measure_inks(PatchReport &row, const Patch &patch, const Inks &inks,
                  const Densitometer &densitometer, double n_factor)
{
    const auto tints = inks.tints_of(patch);
    if (inks.ink_of_solid(patch)) {
        if (const auto measured = densitometer.hue_gray(patch.refl)) {
            row.hue_error = measured->hue_error;
            row.grayness = measured->grayness;
        }
    } else if (tints && tints->size() == 1) {
        if (const Patch *solid = inks.solid((*tints)[0].ink))
            measure_tint(row, patch, *solid, (*tints)[0].percent, densitometer, n_factor);
    } else if (tints && tints->size() == 2 && (*tints)[0].percent == 100 &&
               (*tints)[1].percent == 100) {
        const Patch *first = inks.solid((*tints)[0].ink);
        const Patch *second = inks.solid((*tints)[1].ink);
        if (first && second)
            row.trap = densitometer.trap(first->refl, second->refl, patch.refl);
    }
}

} // namespace

PatchReport patch_report(const Patch &patch, const Inks &inks, const Request &request,
                         const CIELABCOORD &paper)
{
    PatchReport row;
    row.id = patch.id;
    row.name = patch.name;
    row.device = patch.device;
    row.refl = patch.refl;
    row.colour = colour_of(patch.refl, request.illuminant);
    row.to_paper = delta_e00(paper, row.colour.lab);
    row.lch = lch_of(row.colour.lab);

    const Densitometer densitometer(request.paper->refl, request.status);
    const DensityReading reading = densitometer.read(patch.refl);
    row.response = reading.response;
    row.density = reading.density;
    measure_inks(row, patch, inks, densitometer, request.n_factor);
    return row;
}

PaperReport paper_report(const Patch &paper, ILLUM_OBS illuminant)
{
    PaperReport out{.name = paper.name,
                    .lab = lab_of(paper.refl, illuminant),
                    .brightness = 0,
                    .whiteness = {},
                    .no_whiteness = {}};
    ReflToBrightness(paper.refl.data(), &out.brightness);
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

MetamerismReport metamerism_of(const Request &request)
{
    MetamerismReport out{.paper = request.second_paper->name,
                         .illuminant = request.second_illuminant,
                         .sum = 0,
                         .din6172 = 0};
    const double *first = request.paper->refl.data();
    const double *second = request.second_paper->refl.data();
    Metamerism(first, second, request.illuminant, out.illuminant, &out.sum);
    ReflToDIN6172(first, second, request.illuminant, out.illuminant, &out.din6172);
    return out;
}

} // namespace

namespace {

std::vector<ToneCurve> tone_curves(const Measurement &sheet, const Inks &inks,
                                   const std::vector<PatchReport> &rows)
{
    std::vector<std::map<double, ToneValue>> sums(inks.names().size());
    for (std::size_t i = 0; i < rows.size(); ++i) {
        if (!rows[i].dot_area)
            continue;
        const Tint tint = inks.tints_of(sheet.patches[i])->front(); // the only one
        ToneValue &sum = sums[tint.ink].try_emplace(tint.percent).first->second;
        sum.nominal = tint.percent;
        sum.dot_area += *rows[i].dot_area;
        sum.dot_gain += *rows[i].dot_gain;
        ++sum.patches;
    }
    std::vector<ToneCurve> curves;
    for (std::size_t ink = 0; ink < sums.size(); ++ink) {
        if (sums[ink].empty())
            continue;
        ToneCurve &curve = curves.emplace_back();
        curve.ink = inks.names()[ink];
        curve.solid = inks.solid(ink)->name;
        for (auto &[nominal, sum] : sums[ink]) {
            sum.dot_area /= static_cast<double>(sum.patches);
            sum.dot_gain /= static_cast<double>(sum.patches);
            curve.values.push_back(sum);
        }
    }
    return curves;
}

} // namespace

Report report_of(const Measurement &sheet, const Inks &inks, const Request &request)
{
    Report report{.file = sheet.file,
                  .illuminant = request.illuminant,
                  .status = request.status,
                  .n_factor = request.n_factor,
                  .inks = inks.names(),
                  .source = sheet.source,
                  .paper = paper_report(*request.paper, request.illuminant),
                  .metamerism = {},
                  .patches = {},
                  .tone_curves = {}};
    if (request.second_paper)
        report.metamerism = metamerism_of(request);
    const Work work{request.tell, "Measuring", sheet.patches.size()};
    for (const Patch &patch : sheet.patches) {
        report.patches.push_back(patch_report(patch, inks, request, report.paper.lab));
        work.done(report.patches.size());
    }
    report.tone_curves = tone_curves(sheet, inks, report.patches);
    return report;
}

} // namespace vantrel::sheets
