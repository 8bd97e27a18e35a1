// Gathers what the reader of one format finds in a file, and makes the measurement of it.
#pragma once

#include "read/bands.h"
#include "read/header.h"
#include "read/measurement.h"

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// Of reflectances in percent and of colours: beyond it colours overflow, and no instrument measures
// it.
inline constexpr double kLargest = 1e6;

// The name of an ink as a file writes it, for a device value.
std::string ink_name(std::string_view written);

class Sheet {
public:
    explicit Sheet(Reading reading) : reading(std::move(reading)) {}

    // The bands of spectra at these wavelengths; throws InputError.
    const Bands &bands_at(const std::vector<double> &wavelengths, std::size_t line);

    // The patch's reflectances are still on the file's scale; its id and name are empty where the
    // file gives none. Patches of several setups are kept apart, as those under several conditions.
    void add(Patch patch, Condition condition, std::size_t line, std::size_t setup = 0);

    // What a column tells of the first patches; it goes before what was given. A patch has no
    // condition of it where the column is blank.
    void tell_conditions(const std::vector<Condition> &told);

    // The number of the geometry, backing and the like that this text tells; before any patch.
    std::size_t setup_number(const std::string &setup);

    // A row that is no patch, by the name of a statistic that it has.
    void leave_out(std::string_view statistic, std::size_t line);

    // What the perfect white reads, and the keyword that says so; throws InputError where another
    // keyword said otherwise.
    void set_full_scale(double value, std::string_view keyword, std::size_t line);

    // What it reads in files of this kind where no keyword says it.
    void set_usual_scale(double value, std::string_view kind);

    // Without either it is 1 or 100, by the largest reflectance; 1 needs no warning where the files
    // of this kind hold fractions.
    bool fractions = false;

    const Tell &tell() const { return reading.tell; }
    void warn(std::size_t line, const std::string &text);

    // Where the values of all inks are at most 1.
    void bring_inks_to_percent();

    Header header;
    Kind kind = Kind::reflectance;
    bool collection = false;
    bool xyz = false; // the lab of the patches holds X, Y, Z
    std::string_view colour_space = "L*a*b*";
    std::vector<Patch> patches;

    // Throws InputError.
    Measurement measurement();

private:
    void warn_of(const Bands &used, std::size_t line);
    void choose_condition();
    void choose_setup();
    void leave_out_statistics();
    bool name_patches();
    void bring_to_percent();
    double largest_fraction() const;
    void warn_of_scale(double largest);
    void bring_to_lab(const Colours &colours);

    Reading reading;
    Source origin; // that of the first patch
    std::vector<std::string> warnings;
    std::vector<Condition> conditions; // of each patch
    std::vector<std::size_t> setups;   // of each patch, where there are several
    std::vector<std::string> told_setups = {""};
    std::map<std::string, std::size_t> setup_numbers = {{"", 0}};
    std::optional<Bands> bands;
    std::optional<double> full_scale, usual_scale;
    std::string scale_by, usually_by;
    std::vector<std::string> left_out; // names of statistics
    std::size_t left_out_line = 0;     // of the first
    bool told_order = false, told_interpolated = false, told_held = false;
};

} // namespace vantrel::sheets
