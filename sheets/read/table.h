// Rows of named columns, as CGATS text and CSV hold them, and the patches that they are.
#pragma once

#include "read/sheet.h"

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

using Row = std::vector<std::string>; // as many values as there are fields

class Table {
public:
    // The line names the fields. Throws InputError.
    Table(Sheet &sheet, std::vector<std::string> names, std::size_t line);

    // A condition in a column of the row itself goes before the one given. Throws
    // InputError.
    void add(const Row &row, Condition given, std::size_t line);

    // Settles what only all rows together tell: whether tints are fractions, which inks there are.
    void finish();

    const std::vector<std::string> fields;

private:
    const Bands &bands(const Row &row, std::size_t line);
    std::vector<std::pair<std::string, double>> device_values(const Row &row, std::size_t line);
    double value_at(const Row &row, std::size_t column, std::size_t line) const;
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
    std::size_t id, name, condition, ink, tint;
    std::vector<Device> devices;
    bool free_names = false; // of a field that no standard names, and so gives no scale
};

} // namespace vantrel::sheets
