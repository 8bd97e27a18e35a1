// Everything about one patch.
#pragma once

#include "judge/densitometer.h"
#include "judge/report.h"

#include <array>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

struct StatusReading {
    DensityReading reading; // in the response that reads the patch
    std::array<std::optional<double>, NUM_RESPONSES> densities; // of the status's own responses
};

// Under one illuminant and observer.
struct IlluminantReading {
    Colour colour;
    CIELCHCOORD lch{};
    std::optional<Colour> other;
    // From the other patch to this one.
    std::optional<double> de00, metamerism, din6172; // metamerism beside the chosen illuminant
};

// The other patch, and where along the spectrum the difference from it comes from.
struct Against {
    PatchReport patch;
    double de00 = 0;   // under the chosen illuminant
    Spectrum a{}, b{}; // error weights, the largest 100
};

struct PatchStudy {
    std::shared_ptr<const Measurement> sheet;
    IlluminantChoice illuminant;
    int status;
    PaperChoice paper;
    std::shared_ptr<const Patch> kept, kept_against; // of several patches the mean
    PatchReport patch;
    PaperReport as_paper; // brightness and whiteness of this patch
    std::array<StatusReading, NUM_STATUSES> statuses;
    std::array<IlluminantReading, NUM_ILLUM_OBS> illuminants;
    std::optional<Against> against;
    std::vector<std::string> warnings;
};

struct InkRequest {
    std::string patch;                   // by name or id; of several their mean
    std::string against;                 // likewise; none where it is empty
    std::optional<ILLUM_OBS> illuminant; // as the file states where it is empty, or else D50
    int status = E_STATUS;
    std::string paper;              // as paper_of() takes it
    std::vector<std::string> order; // of printing, as Inks takes it
};

// Throws RequestError.
PatchStudy study_of(Measurement measurement, const InkRequest &request);

} // namespace vantrel::sheets
