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

constexpr std::size_t kMostSolids = 3; // that these models take

Spectrum estimate(Model *model, const std::vector<Layer> &layers, const Spectrum &paper)
{
    std::vector<double> inks;
    std::vector<int> percent;
    for (const Layer &layer : layers) {
        inks.insert(inks.end(), layer.solid->refl.begin(), layer.solid->refl.end());
        percent.push_back(layer.percent);
    }
    Spectrum refl;
    model(static_cast<int>(layers.size()), inks.data(), percent.data(), paper.data(), refl.data());
    return refl;
}

// What the layers are as device values; nothing where a solid is no ink of the file.
std::optional<Tints> tints_of(const std::vector<Layer> &layers, const Inks &inks)
{
    Tints tints;
    for (const Layer &layer : layers) {
        const auto ink = inks.ink_of_solid(*layer.solid);
        if (!ink)
            return std::nullopt;
        if (layer.percent > 0)
            tints.push_back({*ink, static_cast<double>(layer.percent)});
    }
    std::sort(tints.begin(), tints.end());
    return tints;
}

// Predicts combinations of one sheet's inks on one paper.
class Predictor {
public:
    Predictor(const Measurement &sheet, const Inks &inks, const Paper &paper, Predictions &out)
        : paper(paper), out(out)
    {
        try {
            calibrated.emplace(sheet, inks, paper.refl, out.illuminant);
            out.n_factor = calibrated->n_factor();
            out.error = calibrated->error();
        } catch (const RequestError &error) {
            out.not_calibrated = error.message;
        }
    }

    // `patch` is the one that was printed with these layers, or null. Throws RequestError where no
    // model can predict them.
    void add(const std::vector<Layer> &layers, const std::optional<Tints> &tints,
             const Patch *patch) const
    {
        Prediction prediction;
        for (const Layer &layer : layers)
            prediction.inks.push_back({layer.solid->name, layer.percent});
        if (patch)
            prediction.measured = {patch->name, colour_of(patch->refl, out.illuminant),
                                   Densitometer(paper.refl, out.status).read(patch->refl)};
        std::array<std::optional<Spectrum>, kModels.size()> refl;
        if (layers.size() <= kMostSolids)
            refl = {estimate(EstimateRefls, layers, paper.refl),
                    estimate(EstimateReflsForBestVisualColor, layers, paper.refl)};
        if (calibrated && tints) {
            refl[2] = calibrated->predict(*tints);
            prediction.lacking = calibrated->lacking(*tints);
        }
        for (std::size_t model = 0; model < refl.size(); ++model)
            if (refl[model])
                prediction.estimates[model] = measure(*refl[model], prediction.measured);
        if (layers.size() > kMostSolids && !prediction.estimates[2])
            throw RequestError{fmt::format(
                "{}: {} inks take the calibrated model, but the sheet holds {}", out.file,
                layers.size(),
                prediction.lacking.empty() ? out.not_calibrated : prediction.lacking[0])};
        out.all.push_back(std::move(prediction));
    }

private:
    Estimate measure(const Spectrum &refl, const std::optional<Measured> &measured) const
    {
        Estimate estimate{.refl = refl,
                          .colour = colour_of(refl, out.illuminant),
                          .to_measured = {},
                          .reading = Densitometer(paper.refl, out.status).read(refl)};
        if (measured)
            estimate.to_measured = delta_e00(measured->colour.lab, estimate.colour.lab);
        return estimate;
    }

    const Paper &paper;
    Predictions &out;
    std::optional<CalibratedModel> calibrated;
};

// The solid that a name stands for: a patch by name or id, or the ink of a device field.
const Patch &solid_named(const Measurement &sheet, const Inks &inks, std::string_view name)
{
    if (const Patch *patch = find_patch(sheet, name)) {
        if (const auto ink = inks.ink_of_solid(*patch))
            return *inks.solid(*ink);
        if (inks.tints_of(*patch))
            throw RequestError{
                fmt::format("{}: {} is no solid of one ink", sheet.file, in_quotes(name))};
        return *patch;
    }
    const auto ink = inks.named(name);
    if (ink && !inks.solid(*ink))
        throw RequestError{fmt::format("{} holds no solid of {}", sheet.file, in_quotes(name))};
    return ink ? *inks.solid(*ink) : patch_named(sheet, name);
}

// The solids of an overprint, nothing where it cannot be predicted.
std::vector<Layer> layers_of(const Tints &tints, const Inks &inks, std::size_t most)
{
    std::vector<Layer> layers;
    for (const Tint &tint : tints) {
        const Patch *solid = inks.solid(tint.ink);
        if (!solid || tints.size() > most || tint.percent != std::floor(tint.percent))
            return {};
        layers.push_back({solid, static_cast<int>(tint.percent)});
    }
    return layers;
}

std::vector<Layer> layers_named(const std::vector<InkTint> &wishes, const Measurement &sheet,
                                const Inks &inks)
{
    if (wishes.size() > CalibratedModel::kMostInks)
        throw RequestError{
            fmt::format("{} inks; {} are the most", wishes.size(), CalibratedModel::kMostInks)};
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

void predict_overprints(const Predictor &predictor, Predictions &out, const Measurement &sheet,
                        const Inks &inks)
{
    const std::size_t most = out.n_factor ? CalibratedModel::kMostInks : kMostSolids;
    for (const Patch &patch : sheet.patches) {
        const auto tints = inks.tints_of(patch);
        if (!tints || tints->size() < 2)
            continue;
        const std::vector<Layer> layers = layers_of(*tints, inks, most);
        if (layers.empty())
            ++out.left_out;
        else
            predictor.add(layers, tints, &patch);
    }
    if (out.all.empty())
        throw RequestError{fmt::format(
            "{} holds no overprint of two to four inks beside their solids; name inks with --ink",
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
    const Predictor predictor(sheet, inks, paper, out);
    if (request.inks.empty()) {
        predict_overprints(predictor, out, sheet, inks);
    } else {
        const std::vector<Layer> layers = layers_named(request.inks, sheet, inks);
        const auto tints = tints_of(layers, inks);
        predictor.add(layers, tints, tints ? inks.measured(*tints) : nullptr);
    }
    return out;
}

} // namespace vantrel::sheets
