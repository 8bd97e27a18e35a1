// The paper of a sheet, which densities and differences are over.
#pragma once

#include "read/measurement.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// Which patch stands for the paper and why: "by name", "without ink", "the lightest", with "mean of
// 4" in front where there are several; or why there is none.
struct PaperChoice {
    std::string name; // of several the first; empty where there is none
    std::string reason;

    bool exists() const { return !name.empty(); }
};

struct Paper {
    PaperChoice choice;
    Spectrum refl{}; // the perfect white where there is none: densities are absolute
    std::optional<CIELABCOORD> lab{}; // where the sheet holds colours alone
};

CIELABCOORD lab_of(const Paper &paper, ILLUM_OBS illuminant);

// The patches of this name, or else of this id; "none" for no paper. Without a name those whose
// device values say that nothing is printed: no ink, or RGB at the end of its scale; or else the
// lightest patch, with a warning where it has device values or is coloured. Several stand as their
// mean, with a warning where they differ. There is none in a collection of colours, nor of film.
// Throws RequestError.
Paper paper_of(const Measurement &sheet, std::string_view name, ILLUM_OBS illuminant,
               std::vector<std::string> &warnings);

// Throws RequestError where there is no paper, for what has no meaning without one.
void require_paper(const PaperChoice &paper, const std::string &file, std::string_view what);

// Warns where more than a tenth of a sheet is below its paper by more than 0.02, the noise of a
// measurement.
void warn_of_paper(const std::string &file, const PaperChoice &paper,
                   const std::vector<std::optional<double>> &densities,
                   std::vector<std::string> &warnings);

} // namespace vantrel::sheets
