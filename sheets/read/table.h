// Rows of named columns, as CGATS text and CSV hold them, and the patches that they are.
#pragma once

#include "read/lines.h"
#include "read/method.h"
#include "read/sheet.h"
#include "read/shifts.h"
#include "read/unread.h"

#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// The wavelength in nm that a column's name carries: SPECTRAL_NM400, NM_400, R_400, 400NM, 400, …
std::optional<double> wavelength_of(std::string_view field);

// Whether a table with these fields holds spectra, as wavelength columns or as wavelength/value
// pairs (SPECTRAL_NM with SPECTRAL_DEC or SPECTRAL_PCT).
bool has_spectra(const std::vector<std::string> &fields);

// Whether they hold L*a*b* or X, Y and Z.
bool has_colours(const std::vector<std::string> &fields);

class Table {
public:
    // The line names the fields; without spectra among them the colours are read. Throws
    // InputError.
    Table(Sheet &sheet, std::vector<std::string> names, std::size_t line);

    // A row has as many values as there are fields. A condition in a column of its own goes before
    // the one given. A row that is named as a statistic and lacks numbers is left out. Throws
    // InputError.
    void add(const Row &row, Condition given, std::size_t line);

    // The cell that names a mean or another statistic of other rows; empty where none does.
    static std::string_view statistic_in(const Row &row);

    // Settles what only all rows together tell: whether tints are fractions, which inks there are.
    void finish();

    const std::vector<std::string> fields;

private:
    void find_spectra(std::size_t line);
    void find_colours(const std::vector<std::string> &keys);
    void find_devices(const std::vector<std::string> &keys, std::size_t line);
    void find_unread(const std::vector<std::string> &keys);
    bool reads(std::size_t column) const;
    bool has_numbers(const Row &row) const;
    void find_ends();
    void warn_of_shifts();
    const Bands &bands(const Row &row, std::size_t line);
    std::optional<CIELABCOORD> colour(const Row &row, std::size_t line) const;
    std::vector<std::pair<std::string, double>> device_values(const Row &row, std::size_t line);
    double value_at(const Row &row, std::size_t column, std::size_t line);
    std::string text_at(const Row &row, std::size_t column) const;

    struct Device {
        std::size_t column;
        std::string name;
    };
    Sheet &sheet;
    std::vector<std::size_t> at_nm;  // columns of wavelengths; with pairs, where these stand
    std::vector<std::size_t> values; // columns of the reflectances
    bool pairs = false;
    std::vector<double> wavelengths;
    std::vector<double> refl; // of a row, on the file's scale
    std::size_t id, name, ink, tint;
    std::size_t words; // the column that names patches for want of another
    MethodColumns method;
    std::size_t setup = 0, setups_told = 0; // by the header
    std::array<std::size_t, 3> lab;         // L*, a*, b*, or X, Y, Z where the sheet says so
    std::vector<Device> devices;
    UnreadColumns unread;
    std::vector<Neighbour> neighbours; // of the columns of wavelengths
    std::vector<SpareBand> spare_bands;
    std::size_t heading = 0;    // its line
    bool free_names = false;    // of a field that no standard names, and so gives no scale
    bool percent_signs = false; // behind values of the row
};

} // namespace vantrel::sheets
