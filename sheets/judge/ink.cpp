#include "judge/ink.h"

#include "judge/densitometer.h"
#include "judge/inks.h"
#include "judge/names.h"
#include "judge/repeats.h"
#include "read/text.h"

#include <fmt/format.h>

#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kMostIds = 8;

StatusReading under_status(const Spectrum &refl, const Spectrum &paper, int status)
{
    StatusReading out;
    out.reading = Densitometer(paper, status).read(refl);
    DENSITYSTRUCT set{};
    if (ReflToDensities(refl.data(), paper.data(), status, &set))
        for (int response = 0; response < NUM_RESPONSES; ++response)
            if (has_response(status, response))
                out.densities[response] = set.density[response];
    return out;
}

IlluminantReading under_illuminant(const Spectrum &refl, const Spectrum *other, ILLUM_OBS chosen,
                                   ILLUM_OBS illuminant)
{
    IlluminantReading out;
    out.colour = colour_of(refl, illuminant);
    out.lch = lch_of(out.colour.lab);
    if (other) {
        out.other = colour_of(*other, illuminant);
        out.de00 = delta_e00(out.other->lab, out.colour.lab);
        double metamerism = 0, din6172 = 0;
        Metamerism(other->data(), refl.data(), chosen, illuminant, &metamerism);
        ReflToDIN6172(other->data(), refl.data(), chosen, illuminant, &din6172);
        out.metamerism = metamerism;
        out.din6172 = din6172;
    }
    return out;
}

// The mean of the patches of this name, with a warning where there are several.
std::shared_ptr<const Patch> patch_of(const Measurement &sheet, const std::string &name,
                                      ILLUM_OBS illuminant, std::vector<std::string> &warnings)
{
    const std::vector<std::size_t> places = places_named(sheet, name);
    Repeats mean = mean_of(sheet, places, illuminant);
    if (places.size() > 1) {
        std::vector<std::string_view> ids;
        for (std::size_t i = 0; i < places.size() && i < kMostIds; ++i)
            ids.emplace_back(sheet.patches[places[i]].id);
        warnings.push_back(fmt::format(
            "{}: the mean of the {} patches {} is taken (ids {}{}), up to ΔE00 {:.2f} from each",
            sheet.file, places.size(), in_quotes(name), fmt::join(ids, ", "),
            places.size() > kMostIds ? ", …" : "", *mean.spread));
    }
    return std::make_shared<const Patch>(std::move(mean.patch));
}

} // namespace

PatchStudy study_of(Measurement measurement, const InkRequest &request)
{
    const auto kept = std::make_shared<const Measurement>(std::move(measurement));
    const Measurement &sheet = *kept;
    std::vector<std::string> warnings = reading_warnings(sheet);
    const IlluminantChoice illuminant = illuminant_for(request.illuminant, {&sheet}, warnings);
    const Paper paper = paper_of(sheet, request.paper, illuminant, warnings);
    const auto kept_patch = patch_of(sheet, request.patch, illuminant, warnings);
    const Patch &patch = *kept_patch;
    const auto other =
        request.against.empty() ? nullptr : patch_of(sheet, request.against, illuminant, warnings);
    const Inks inks(sheet, request.order);
    const Conditions conditions{sheet, inks, paper, illuminant, request.status};
    PatchStudy out{.sheet = kept,
                   .illuminant = illuminant,
                   .status = request.status,
                   .paper = paper.choice,
                   .kept = kept_patch,
                   .kept_against = other,
                   .patch = patch_report(patch, conditions),
                   .as_paper = paper_report({{patch.name, "by name"}, patch.refl, {}}, illuminant),
                   .statuses = {},
                   .illuminants = {},
                   .against = {},
                   .warnings = std::move(warnings)};
    for (int status = 0; status < NUM_STATUSES; ++status)
        out.statuses[status] = under_status(patch.refl, paper.refl, status);
    for (int i = 0; i < NUM_ILLUM_OBS; ++i)
        out.illuminants[i] = under_illuminant(patch.refl, other ? &other->refl : nullptr,
                                              illuminant, static_cast<ILLUM_OBS>(i));
    if (other) {
        out.against.emplace();
        out.against->patch = patch_report(*other, conditions);
        out.against->de00 = delta_e00(out.against->patch.colour.lab, out.patch.colour.lab);
        ReflToABErrorWeights(other->refl.data(), patch.refl.data(), illuminant,
                             out.against->a.data(), out.against->b.data());
    }
    return out;
}

} // namespace vantrel::sheets
