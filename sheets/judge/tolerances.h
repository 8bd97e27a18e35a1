// Limits that a user sets for a sheet, as a TOML file holds them.
#pragma once

#include "judge/formulas.h"
#include "read/measurement.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// Patches that a limit is about, by the inks that they print.
enum class Group {
    all,
    paper,
    solids,     // of one ink
    overprints, // solids over one another
    tints,      // of one ink
    neutrals,   // of cyan, magenta and yellow together, whose aim has hardly any chroma
    spots,      // of inks other than cyan, magenta, yellow and black
};

// What of a patch is limited, from its aim to the patch; the sign does not count.
enum class Quantity {
    colour_difference, // by a formula
    lightness,         // ΔL*
    hue,               // ΔH*ab
    neutral_chroma,    // ΔCh = √(Δa*² + Δb*²)
    density,
    gain,   // of a tint's area, in percent
    spread, // between the gains of cyan, magenta and yellow at one nominal value
};

enum class Statistic { maximum, mean, p95 };

struct Tolerance {
    Group group = Group::all;
    std::string ink;               // device field; any where it is empty
    std::optional<double> nominal; // of tints, in percent; any where it is missing
    Quantity quantity = Quantity::colour_difference;
    Metric metric; // of a colour difference
    Statistic statistic = Statistic::maximum;
    std::optional<double> aim; // of density and gain, instead of that of the reference
    double limit = 0;
};

struct Tolerances {
    std::string name;
    std::vector<Tolerance> limits; // at least one
};

// Of TOML text. Throws InputError with the line.
Tolerances read_tolerances(std::string_view text);

std::string_view key_of(Group group);         // near-neutrals
std::string_view key_of(Statistic statistic); // p95
std::string key_of(const Tolerance &limit);   // de2000, dch: of what is limited

// "Solids CMYK_K", "Tints of 50 %"; "ΔE00", "ΔCh"; "95 %".
std::string patches_of(const Tolerance &limit);
std::string title_of(const Tolerance &limit);
std::string_view title_of(Statistic statistic);

} // namespace vantrel::sheets
