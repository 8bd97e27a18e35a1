// Named columns of text: what a reader of one format hands on, and how it becomes a measurement.
#ifndef VANTREL_TOOL_TABLE_H
#define VANTREL_TOOL_TABLE_H

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "measurement.h"

struct Table {
    std::vector<std::string> fields;
    std::size_t fields_line = 0;        // where the file names the fields
    std::vector<std::size_t> row_lines; // where each row stands in the file
    std::function<std::string_view(std::size_t row, std::size_t column)> cell;
    std::optional<double> full_scale; // what the perfect white reads, where the file says so
};

// The wavelength in nm that a column's name carries: SPECTRAL_NM400, NM_400, R_400, 400NM, 400, …
std::optional<double> wavelength_of(std::string_view field);

// Whether a table with these fields holds spectra, as wavelength columns or as wavelength/value
// pairs (SPECTRAL_NM with SPECTRAL_DEC or SPECTRAL_PCT).
bool has_spectra(const std::vector<std::string> &fields);

// The patches of a table; throws InputError.
Measurement measurement_of(const Table &table);

#endif
