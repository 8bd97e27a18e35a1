// What a sheet says: its patches, inks and paper.
#pragma once

#include "judge/advice.h"
#include "judge/colour.h"
#include "judge/inks.h"
#include "judge/left_out.h"
#include "judge/paper.h"
#include "judge/scales.h"
#include "judge/stated.h"
#include "read/measurement.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

struct ReportRequest {
    std::optional<ILLUM_OBS> illuminant; // as the file states where it is empty, or else D50
    int status = E_STATUS;
    std::string paper; // as paper_of() takes it
    double n_factor = 1;
    std::vector<std::string> order; // of printing, as Inks takes it
    // The paper that the first is compared with, as paper_of() takes it, of another sheet where
    // there is one; none where both are missing.
    std::string second_paper;
    const Measurement *second_sheet = nullptr;
    std::optional<ILLUM_OBS> second_illuminant; // the usual one where it is empty
    const Measurement *aims = nullptr;          // of the solids, for advice
    Tell tell{};
};

// Percentages and densities are missing where they make no sense.
struct PatchReport {
    const Patch *patch = nullptr;   // of the sheet
    const Spectrum *refl = nullptr; // null where the sheet holds colours alone
    Colour colour;
    CIELCHCOORD lch{};
    std::optional<double> to_paper;            // ΔE00
    std::optional<int> response;               // the one that reads this patch
    std::optional<double> density;             // in it, over the paper, absolute without one
    std::optional<double> dot_area, dot_gain;  // of a tint of one ink
    std::optional<double> sctv;                // the same by ISO 20654
    std::optional<double> print_contrast;      // of a tint of 75 to 80 %
    std::optional<double> hue_error, grayness; // of a solid
    std::optional<double> trap;                // of an overprint of two solids
    std::vector<std::size_t> lacking; // inks of which other zones have a solid, this one not
};

struct PaperReport {
    PaperChoice choice;
    std::optional<CIELABCOORD> lab;
    std::optional<double> brightness;
    std::optional<double> whiteness;
    std::string no_whiteness; // the reason
};

// How a second paper differs from the first under two illuminants.
struct MetamerismReport {
    std::string file; // of the second; empty where it is on the same sheet
    PaperChoice paper;
    ILLUM_OBS illuminant;      // the second one
    double de00;               // under the first
    std::optional<double> sum; // of the two ΔE*ab; missing where a side has no spectra
    std::optional<double> din6172;
};

// Of patches of one nominal value: their means.
struct ToneValue {
    double nominal;
    double dot_area;
    double dot_gain;
    double sctv;
    std::size_t patches;
};

// From the lightest tint to the darkest.
struct ToneCurve {
    std::string ink; // device field
    std::string solid;
    bool spot; // its tone values are by ISO 20654, not by density
    std::vector<ToneValue> values;
};

// A patch of a grey scale and its visual density over the paper.
struct NeutralStep : GreyPlace {
    std::size_t place; // among the patches
    std::string name;
    double density;
};

struct Report {
    std::shared_ptr<const Measurement> sheet;
    IlluminantChoice illuminant;
    int status;
    double n_factor;
    std::vector<std::string> inks; // device fields in the order of printing
    PaperReport paper;
    std::optional<MetamerismReport> metamerism;
    std::vector<PatchReport> patches;
    LeftOut left_out;                   // by choose_for_page()
    std::vector<ToneCurve> tone_curves; // of the inks that have measured tints
    std::vector<NeutralStep> greys;     // by scale, from light to dark
    std::vector<SolidAdvice> advice;    // where there are aims
    std::vector<std::string> warnings;
};

// What the report of a patch rests on; the sheet has to live as long as the report.
struct Conditions {
    const Measurement &sheet;
    const Inks &inks;
    const Paper &paper;
    ILLUM_OBS illuminant;
    int status;
    double n_factor = 1;
};
PatchReport patch_report(const Patch &patch, const Conditions &conditions);

PaperReport paper_report(const Paper &paper, ILLUM_OBS illuminant);

// Throws RequestError.
Report report_of(Measurement measurement, const ReportRequest &request);

} // namespace vantrel::sheets
