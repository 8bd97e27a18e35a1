#include <nlohmann/json.hpp>

#include "names.h"
#include "predict.h"
#include "report.h"

namespace {

using Json = nlohmann::ordered_json;

template <typename Value> Json or_null(const std::optional<Value> &value)
{
    return value ? Json(*value) : Json();
}

Json lab_json(const CIELABCOORD &lab) { return {lab.L, lab.a, lab.b}; }

Json paper_json(const Report &report)
{
    const PaperReport &paper = report.paper;
    Json out = {
        {"name", paper.name},
        {"lab", lab_json(paper.lab)},
        {"brightness", paper.brightness},
        {"whiteness", or_null(paper.whiteness)},
    };
    if (!paper.whiteness)
        out["no_whiteness"] = paper.no_whiteness;
    if (const auto &metamerism = report.metamerism)
        out["metamerism"] = {{"paper", metamerism->paper},
                             {"illuminant", name_of(metamerism->illuminant)},
                             {"sum", metamerism->sum},
                             {"din6172", metamerism->din6172}};
    return out;
}

Json patch_json(const PatchReport &patch, int status)
{
    Json device = Json::object();
    for (const auto &[field, value] : patch.device)
        device[field] = value;
    return {{"id", patch.id},
            {"name", patch.name},
            {"device", device},
            {"rgb", hex(patch.colour.rgb)},
            {"lab", lab_json(patch.colour.lab)},
            {"lch", {patch.lch.L, patch.lch.C, patch.lch.h}},
            {"de00_to_paper", patch.to_paper},
            {"response", patch.response ? Json(response_name(status, *patch.response)) : Json()},
            {"response_id", or_null(patch.response)},
            {"density", or_null(patch.density)},
            {"dot_area", or_null(patch.dot_area)},
            {"dot_gain", or_null(patch.dot_gain)},
            {"print_contrast", or_null(patch.print_contrast)},
            {"hue_error", or_null(patch.hue_error)},
            {"grayness", or_null(patch.grayness)},
            {"trap", or_null(patch.trap)}};
}

Json estimate_json(const Estimate &estimate)
{
    return {{"rgb", hex(estimate.colour.rgb)},
            {"lab", lab_json(estimate.colour.lab)},
            {"de00_to_measured", or_null(estimate.to_measured)},
            {"refl", estimate.refl}};
}

} // namespace

std::string as_json(const Report &report)
{
    Json patches = Json::array();
    for (const PatchReport &patch : report.patches)
        patches.push_back(patch_json(patch, report.status));
    const Json sheet = {
        {"file", report.file},
        {"illuminant", name_of(report.illuminant)},
        {"status", status_name(report.status)},
        {"n_factor", report.n_factor},
        {"inks", report.inks},
        {"source",
         {{"first_nm", report.source.first_nm},
          {"last_nm", report.source.last_nm},
          {"bands", report.source.bands},
          {"scaled_to_percent", report.source.scaled}}},
        {"paper", paper_json(report)},
        {"patches", patches},
    };
    return sheet.dump(2) + '\n';
}

std::string as_json(const Predictions &predictions)
{
    Json all = Json::array();
    for (const Prediction &prediction : predictions.all) {
        Json inks = Json::array();
        for (const InkTint &ink : prediction.inks)
            inks.push_back({{"name", ink.name}, {"percent", ink.percent}});
        const auto &measured = prediction.measured;
        all.push_back({{"inks", inks},
                       {"halftone", estimate_json(prediction.halftone)},
                       {"film", estimate_json(prediction.film)},
                       {"measured", measured ? Json{{"name", measured->patch},
                                                    {"rgb", hex(measured->colour.rgb)},
                                                    {"lab", lab_json(measured->colour.lab)}}
                                             : Json()}});
    }
    const Json out = {
        {"file", predictions.file},   {"illuminant", name_of(predictions.illuminant)},
        {"paper", predictions.paper}, {"left_out", predictions.left_out},
        {"predictions", all},
    };
    return out.dump(2) + '\n';
}
