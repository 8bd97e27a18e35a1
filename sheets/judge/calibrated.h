// What inks will measure over one another on this press: a model that is fitted to the sheet.
#pragma once

#include "judge/inks.h"
#include "judge/statistics.h"
#include "read/measurement.h"

#include <map>
#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

// The spectral Neugebauer model with the Yule-Nielsen factor n (Yule and Nielsen, Proc. TAGA 1951;
// Viggiano, Proc. TAGA 1985): R^(1/n) is the mean of the primaries' R^(1/n), weighed by the areas
// that they cover (Demichel 1924). Areas come from the sheet's tint ramps. Where the sheet holds a
// grid of overprinted mid-tones these are primaries too, of cells between neighbouring tints
// (Rolleston and Balasubramanian, Proc. CIC 1993). A combination is always predicted as if the
// sheet did not hold it.
class CalibratedModel {
public:
    static constexpr std::size_t kMostInks = 4;

    // Throws RequestError that tells what the sheet lacks.
    CalibratedModel(const Measurement &sheet, const Inks &inks, const Spectrum &paper,
                    ILLUM_OBS illuminant);

    // Of one to four inks whose solids the sheet holds; nothing for others.
    std::optional<Spectrum> predict(const Tints &tints) const;

    // What the sheet lacks for this combination, so that the model takes something else.
    std::vector<std::string> lacking(const Tints &tints) const;

    double n_factor() const { return n; }
    static bool ends_range(double n_factor); // of those that are tried

    // ΔE00 of the sheet's overprints with tints, each predicted without it, n chosen without it
    // too; nothing where there are none. Overprints of solids alone are not among them, nor are
    // those passed over by an even choice of very many.
    struct Error {
        std::size_t patches;
        Statistics de00;
        std::size_t solids, passed_over;
    };
    const std::optional<Error> &error() const { return left_out; }

private:
    using Levels = std::vector<double>; // nominal percentages from 0 to 100, sorted
    // Where a combination lies: the nodes of its inks.
    struct Place {
        const Tints &tints;
        std::vector<Levels> nodes;
        std::optional<double> no_tint = {}; // of the one ink: not to be taken for its ramp
        bool films = false; // solids over one another are not to be taken as measured
    };

    bool knows(const Tints &tints) const;
    std::string names_of(const Tints &tints) const;
    std::vector<Levels> grid_of(const Tints &tints) const;
    std::vector<std::vector<std::size_t>> overprints_held(const Tints &tints,
                                                          const std::vector<Levels> &grid) const;
    Place place_without(const Tints &tints) const;
    Spectrum primary(const Tints &tints, bool films) const;
    double area(const Tint &tint, double below, double above, std::optional<double> no_tint) const;
    Spectrum estimate(const Place &place) const;
    void set_factor(double factor);
    void fit(ILLUM_OBS illuminant);

    const Inks &inks;
    std::map<Tints, Spectrum> measured; // in percent; patches of the same combination averaged
    std::map<Tints, Spectrum> roots;    // the same to the power of 1/n
    std::vector<Levels> ramps;          // of each ink; empty without its solid
    std::map<std::vector<std::size_t>, std::vector<Levels>> grids; // of the overprinted inks
    double n = 1;
    std::optional<Error> left_out;
};

} // namespace vantrel::sheets
