// Gathers what the reader of one format finds in a file, and makes the measurement of it.
#pragma once

#include "read/bands.h"
#include "read/measurement.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// A measurement condition of ISO 13655, 0 to 3 for M0 to M3.
using Condition = std::optional<int>;

// The condition that a text names as a word: "M1", "M1_Daylight", "CS_M1".
Condition condition_in(std::string_view text);

class Sheet {
public:
    explicit Sheet(Reading reading) : reading(std::move(reading)) {}

    // The bands of spectra at these wavelengths; throws InputError.
    const Bands &bands_at(const std::vector<double> &wavelengths, std::size_t line);

    // The patch's reflectances are still on the file's scale.
    void add(Patch patch, Condition condition, std::size_t line);

    // What the perfect white reads, and the keyword that says so; throws InputError where another
    // keyword said otherwise.
    void set_full_scale(double value, std::string_view keyword, std::size_t line);

    // Without a keyword it is 1 or 100; up to this largest reflectance it is 1.
    double largest_fraction = 2; // paper with optical brightener reads up to 1.4

    const Tell &tell() const { return reading.tell; }
    void warn(std::size_t line, const std::string &text);

    std::vector<Patch> patches;
    bool named = false; // any of them, by a name or an id of its own

    // Throws InputError.
    Measurement measurement();

private:
    void choose_condition();
    void bring_to_percent();
    void check_inks();

    Reading reading;
    Source origin; // that of the first patch
    std::vector<std::string> warnings;
    std::vector<Condition> conditions; // of each patch
    std::optional<Bands> bands;
    std::optional<double> full_scale;
    std::string scale_by;
};

} // namespace vantrel::sheets
