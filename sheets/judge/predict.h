// What inks will measure as tints and over one another, beside what was measured.
#pragma once

#include "judge/calibrated.h"
#include "judge/colour.h"
#include "judge/densitometer.h"
#include "judge/paper.h"
#include "judge/stated.h"
#include "read/measurement.h"

#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// Tints as ink and paper mixed by area, as thinner films (these two know the solids and the paper
// alone, of up to three inks), and by the model that is fitted to the sheet.
constexpr std::array<std::string_view, 3> kModels = {"halftone", "film", "calibrated"};

struct InkTint {
    std::string name; // of the solid's patch
    int percent;
};

// One model's estimate.
struct Estimate {
    Spectrum refl{};
    Colour colour;
    std::optional<double> to_measured; // ΔE00
    DensityReading reading;
};

struct Measured {
    std::string patch;
    Colour colour;
    DensityReading reading;
};

struct Prediction {
    std::vector<InkTint> inks;                                     // in the order of printing
    std::array<std::optional<Estimate>, kModels.size()> estimates; // by model
    std::vector<std::string> lacking; // on the sheet, for the calibrated model
    std::optional<Measured> measured;
};

struct Predictions {
    std::string file;
    IlluminantChoice illuminant;
    int status;
    PaperChoice paper;
    std::vector<Prediction> all;
    std::size_t left_out = 0; // measured overprints that cannot be predicted
    // The calibrated model's Yule-Nielsen factor, and its error on patches that it was not shown.
    std::optional<double> n_factor{};
    std::optional<CalibratedModel::Error> error{};
    std::string not_calibrated{}; // what the sheet holds instead of what such a model takes
    std::vector<std::string> warnings;
};

struct PredictRequest {
    std::optional<ILLUM_OBS> illuminant; // as the file states where it is empty, or else D50
    int status = E_STATUS;
    std::string paper;              // as paper_of() takes it
    std::vector<std::string> order; // of printing, as Inks takes it
    // The combination to predict, in the order of printing, each by its solid's patch, name or id,
    // or by its device field; every measured overprint of two to four inks where it is empty.
    std::vector<InkTint> inks;
};

// Throws RequestError.
Predictions predict(const Measurement &sheet, const PredictRequest &request);

} // namespace vantrel::sheets
