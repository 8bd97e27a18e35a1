// What inks will measure as tints and over one another, beside what was measured.
#pragma once

#include "judge/colour.h"
#include "judge/densitometer.h"
#include "judge/inks.h"
#include "read/measurement.h"
#include "write/flat.h"

#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

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
    std::vector<InkTint> inks; // in the order of printing
    Estimate halftone;         // tints as ink and paper mixed by area
    Estimate film;             // tints as thinner films
    std::optional<Measured> measured;
};

struct Predictions {
    std::string file;
    ILLUM_OBS illuminant;
    int status;
    std::string paper;
    std::vector<Prediction> all;
    std::size_t left_out = 0; // measured overprints that cannot be predicted
};

// The combination that `wishes` name, each NAME:PERCENT, in the order of printing; throws
// RequestError.
Predictions predict(const Measurement &sheet, const Inks &inks, const Patch &paper,
                    ILLUM_OBS illuminant, int status, const std::vector<std::string> &wishes);

// Every measured overprint of two or three inks; throws RequestError where there is none.
Predictions predict_overprints(const Measurement &sheet, const Inks &inks, const Patch &paper,
                               ILLUM_OBS illuminant, int status);

// "Magenta 100 40 % + Yellow 100 70 %", each name cut to a number of characters.
std::string inks_of(const Prediction &prediction, std::size_t kWidestName);

// The output formats.
void write_table(const Predictions &predictions, const Sink &sink, bool colour);
void write_json(const Predictions &predictions, const Sink &sink);
std::vector<Flat> flat_of(const Predictions &predictions);

} // namespace vantrel::sheets
