#include "judge/predict.h"

#include "judge/inks.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <utility>

namespace vantrel::sheets {
namespace {

struct Layer {
    const Patch *solid;
    int percent;
};

using Model = int(int n, const double *inks, const int *percent, const double *paper, double *refl);

Estimate estimate(Model *model, const std::vector<Layer> &layers, const Spectrum &paper,
                  ILLUM_OBS illuminant, int status, const std::optional<Measured> &measured)
{
    std::vector<double> inks;
    std::vector<int> percent;
    for (const Layer &layer : layers) {
        inks.insert(inks.end(), layer.solid->refl.begin(), layer.solid->refl.end());
        percent.push_back(layer.percent);
    }
    Estimate out;
    model(static_cast<int>(layers.size()), inks.data(), percent.data(), paper.data(),
          out.refl.data());
    out.colour = colour_of(out.refl, illuminant);
    out.reading = Densitometer(paper, status).read(out.refl);
    if (measured)
        out.to_measured = delta_e00(measured->colour.lab, out.colour.lab);
    return out;
}

Prediction prediction_of(const std::vector<Layer> &layers, const Paper &paper, ILLUM_OBS illuminant,
                         int status, const Patch *patch)
{
    Prediction out;
    for (const Layer &layer : layers)
        out.inks.push_back({layer.solid->name, layer.percent});
    if (patch)
        out.measured = {patch->name, colour_of(patch->refl, illuminant),
                        Densitometer(paper.refl, status).read(patch->refl)};
    out.halftone = estimate(EstimateRefls, layers, paper.refl, illuminant, status, out.measured);
    out.film = estimate(EstimateReflsForBestVisualColor, layers, paper.refl, illuminant, status,
                        out.measured);
    return out;
}

// The solid that a name stands for: a patch by name or id, or the ink of a device field.
const Patch &solid_named(const Measurement &sheet, const Inks &inks, std::string_view name)
{
    if (const Patch *patch = find_patch(sheet, name)) {
        if (inks.tints_of(*patch) && !inks.ink_of_solid(*patch))
            throw RequestError{
                fmt::format("{}: {} is no solid of one ink", sheet.file, in_quotes(name))};
        return *patch;
    }
    const auto ink = inks.named(name);
    if (ink && !inks.solid(*ink))
        throw RequestError{fmt::format("{} holds no solid of {}", sheet.file, in_quotes(name))};
    return ink ? *inks.solid(*ink) : patch_named(sheet, name);
}

// The patch that was printed with these layers, null where there is none.
const Patch *measured_of(const std::vector<Layer> &layers, const Inks &inks)
{
    Tints tints;
    for (const Layer &layer : layers) {
        const auto ink = inks.ink_of_solid(*layer.solid);
        if (!ink)
            return nullptr;
        if (layer.percent > 0)
            tints.push_back({*ink, static_cast<double>(layer.percent)});
    }
    std::sort(tints.begin(), tints.end());
    return inks.measured(tints);
}

// The solids of an overprint of two or three inks, nothing where it cannot be predicted.
std::vector<Layer> layers_of(const Tints &tints, const Inks &inks)
{
    std::vector<Layer> layers;
    for (const Tint &tint : tints) {
        const Patch *solid = inks.solid(tint.ink);
        if (!solid || tints.size() > kMostInks || tint.percent != std::floor(tint.percent))
            return {};
        layers.push_back({solid, static_cast<int>(tint.percent)});
    }
    return layers;
}

std::vector<Layer> layers_named(const std::vector<InkTint> &wishes, const Measurement &sheet,
                                const Inks &inks)
{
    if (wishes.size() > kMostInks)
        throw RequestError{fmt::format("{} inks; {} are the most", wishes.size(), kMostInks)};
    std::vector<Layer> layers;
    for (const InkTint &wish : wishes) {
        const Layer layer{&solid_named(sheet, inks, wish.name), wish.percent};
        for (const Layer &other : layers)
            if (other.solid == layer.solid)
                throw RequestError{
                    fmt::format("the ink {} is named twice", in_quotes(layer.solid->name))};
        layers.push_back(layer);
    }
    return layers;
}

// Every measured overprint of two or three inks.
void predict_overprints(Predictions &out, const Measurement &sheet, const Inks &inks,
                        const Paper &paper)
{
    for (const Patch &patch : sheet.patches) {
        const auto tints = inks.tints_of(patch);
        if (!tints || tints->size() < 2)
            continue;
        const std::vector<Layer> layers = layers_of(*tints, inks);
        if (layers.empty())
            ++out.left_out;
        else
            out.all.push_back(prediction_of(layers, paper, out.illuminant, out.status, &patch));
    }
    if (out.all.empty())
        throw RequestError{fmt::format(
            "{} holds no overprint of two or three inks beside their solids; name inks with --ink",
            sheet.file)};
}

} // namespace

Predictions predict(const Measurement &sheet, const PredictRequest &request)
{
    const Inks inks(sheet, request.order);
    std::vector<std::string> warnings = reading_warnings(sheet);
    const IlluminantChoice illuminant = illuminant_for(request.illuminant, {&sheet}, warnings);
    const Paper paper = paper_of(sheet, request.paper, illuminant, warnings);
    require_paper(paper.choice, sheet.file, "a prediction");
    Predictions out{.file = sheet.file,
                    .illuminant = illuminant,
                    .status = request.status,
                    .paper = paper.choice,
                    .all = {},
                    .warnings = std::move(warnings)};
    if (request.inks.empty()) {
        predict_overprints(out, sheet, inks, paper);
    } else {
        const std::vector<Layer> layers = layers_named(request.inks, sheet, inks);
        out.all.push_back(
            prediction_of(layers, paper, illuminant, request.status, measured_of(layers, inks)));
    }
    return out;
}

} // namespace vantrel::sheets
