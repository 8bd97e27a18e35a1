// A result as plain rows under named columns: what CSV and CGATS text are written from.
#pragma once

#include "judge/advice.h"
#include "judge/colour.h"
#include "write/sink.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace vantrel::sheets {

struct Column {
    std::string name;  // in CSV
    std::string cgats; // in CGATS text; empty where the column is left out there
    bool text;         // otherwise a number, or nothing
    std::function<void(std::size_t, std::string &)> append; // what a row holds here

    std::string cell(std::size_t row) const
    {
        std::string out;
        append(row, out);
        return out;
    }
};

struct Flat {
    std::string description;
    std::size_t rows = 0;
    std::vector<Column> columns;
    bool spectra = false; // among the columns, in percent

    // Add columns, given what a row holds there. A number has four decimals, an exact one all that
    // it takes; nothing makes an empty cell.
    void text(std::string name, std::string cgats, std::function<std::string(std::size_t)> get);
    void same(std::string name, std::string cgats, std::string text); // in every row
    void number(std::string name, std::string cgats,
                std::function<std::optional<double>(std::size_t)> get);
    void exact(std::string name, std::string cgats,
               std::function<std::optional<double>(std::size_t)> get);
    // All in the first row; no column where there are none.
    void warnings(std::vector<std::string> texts);
    // Its words stand under `note`; a null pointer makes empty cells.
    void advice(const std::string &note,
                const std::function<const SolidAdvice *(std::size_t)> &get);
    // Preview and L*a*b*; a null pointer makes empty cells.
    void colour(const std::string &prefix, const std::function<const Colour *(std::size_t)> &get);
    void spectrum(const std::function<const Spectrum &(std::size_t)> &get);
    // Device values of these names.
    using Device = std::vector<std::pair<std::string, double>>; // as in Patch
    void device(const std::vector<std::string> &names,
                const std::function<const Device &(std::size_t)> &get);
};

// The advice has to live as long as the columns.
Flat flat_of(const std::vector<SolidAdvice> &advice, const std::string &description);

// RFC 4180. Tables of different columns share one header, with a column for every name. Text that a
// spreadsheet would take for a formula gets an apostrophe in front.
void write_csv(const std::vector<Flat> &tables, const Sink &sink);

// CGATS text (ISO 28178), one table after the other.
void write_cgats(const std::vector<Flat> &tables, const Sink &sink);

} // namespace vantrel::sheets
