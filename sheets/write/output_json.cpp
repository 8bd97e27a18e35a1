#include "judge/names.h"
#include "judge/predict.h"
#include "judge/report.h"
#include "write/json_text.h"

namespace vantrel::sheets {
namespace {

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

Json estimate_json(const Estimate &estimate, int status)
{
    Json out = {{"rgb", hex(estimate.colour.rgb)},
                {"lab", lab_json(estimate.colour.lab)},
                {"de00_to_measured", or_null(estimate.to_measured)},
                {"refl", estimate.refl}};
    add_reading(out, estimate.reading, status);
    return out;
}

Json tone_values_json(const Report &report)
{
    Json out = Json::array();
    for (const ToneCurve &curve : report.tone_curves) {
        Json values = Json::array();
        for (const ToneValue &value : curve.values)
            values.push_back({{"nominal", value.nominal},
                              {"dot_area", value.dot_area},
                              {"dot_gain", value.dot_gain},
                              {"patches", value.patches}});
        out.push_back({{"ink", curve.ink}, {"solid", curve.solid}, {"values", values}});
    }
    return out;
}

void write_sheet(const Report &report, const Sink &sink)
{
    const Json head = {
        {"file", report.file},
        {"illuminant", name_of(report.illuminant)},
        {"status", status_name(report.status)},
        {"n_factor", report.n_factor},
        {"inks", report.inks},
        {"source",
         {{"first_nm", report.source.first_nm},
          {"last_nm", report.source.last_nm},
          {"step_nm", report.source.step_nm},
          {"bands", report.source.bands},
          {"averaged", report.source.averaged},
          {"scaled_to_percent", report.source.scaled},
          {"scale_by", report.source.scale_by},
          {"condition", report.source.condition.empty() ? Json() : Json(report.source.condition)}}},
        {"paper", paper_json(report)},
        {"tone_values", tone_values_json(report)},
    };
    write_with_array(
        head, "patches", report.patches.size(),
        [&](std::size_t i) { return patch_json(report.patches[i], report.status); }, sink);
}

Json prediction_json(const Prediction &prediction, int status)
{
    Json inks = Json::array();
    for (const InkTint &ink : prediction.inks)
        inks.push_back({{"name", ink.name}, {"percent", ink.percent}});
    Json measured;
    if (prediction.measured) {
        measured = {{"name", prediction.measured->patch},
                    {"rgb", hex(prediction.measured->colour.rgb)},
                    {"lab", lab_json(prediction.measured->colour.lab)}};
        add_reading(measured, prediction.measured->reading, status);
    }
    return {{"inks", inks},
            {"halftone", estimate_json(prediction.halftone, status)},
            {"film", estimate_json(prediction.film, status)},
            {"measured", measured}};
}

} // namespace

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
            {"trap", or_null(patch.trap)},
            {"refl", patch.refl}};
}

void write_json(const std::vector<Report> &sheets, const Sink &sink)
{
    sink.write("{\n\"command\": \"report\",\n\"sheets\": [\n");
    for (const Report &report : sheets) {
        sink.write(&report == sheets.data() ? "" : ",\n");
        write_sheet(report, sink);
    }
    sink.write("\n]\n}\n");
}

void write_json(const Predictions &predictions, const Sink &sink)
{
    const Json head = {
        {"command", "predict"},
        {"file", predictions.file},
        {"illuminant", name_of(predictions.illuminant)},
        {"status", status_name(predictions.status)},
        {"paper", predictions.paper},
        {"left_out", predictions.left_out},
    };
    write_with_array(
        head, "predictions", predictions.all.size(),
        [&](std::size_t i) { return prediction_json(predictions.all[i], predictions.status); },
        sink);
    sink.write("\n");
}

} // namespace vantrel::sheets
