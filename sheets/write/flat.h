// A result as plain rows under named columns: what CSV and CGATS text are written from.
#pragma once

#include "judge/colour.h"
#include "write/sink.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace vantrel::sheets {

struct Field {
    std::string name;  // in CSV
    std::string cgats; // in CGATS text; empty where the column is left out there
    bool text = false; // otherwise a number, or nothing
};

using Row = std::vector<std::string>; // a cell for each field

struct Flat {
    std::string description;
    std::vector<Field> fields;
    std::size_t rows = 0;
    std::function<Row(std::size_t)> row;
    bool spectra = false; // among the fields, in percent
};

// RFC 4180. Tables of different fields share one header, with a column for every name. Text that a
// spreadsheet would take for a formula gets an apostrophe in front.
void write_csv(const std::vector<Flat> &tables, const Sink &sink);

// CGATS text (ISO 28178), one table after the other.
void write_cgats(const std::vector<Flat> &tables, const Sink &sink);

// Cells: with four decimals, to the last bit, empty where there is no value.
std::string cell(const std::optional<double> &value);
std::string exact_cell(double value);

// Columns of device values, in order, and their cells: empty where a patch does not have the value.
using Device = std::vector<std::pair<std::string, double>>; // as in Patch
void add_device_fields(std::vector<Field> &fields, const std::vector<std::string> &names);
void add_device_cells(Row &row, const std::vector<std::string> &names, const Device &device);

// Columns of a colour and its cells.
void add_colour_fields(std::vector<Field> &fields, const std::string &prefix);
void add_colour_cells(Row &row, const Colour &colour);

// Columns of a spectrum and its cells.
void add_spectrum_fields(std::vector<Field> &fields);
void add_spectrum_cells(Row &row, const Spectrum &refl);

} // namespace vantrel::sheets
