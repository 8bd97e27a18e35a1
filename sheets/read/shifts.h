// Rows and headings that are shifted against each other, by the columns at the ends of the
// spectrum.
#pragma once

#include "read/lines.h"

#include <cstddef>

namespace vantrel::sheets {

// A column that nothing reads, beside the first or last of the wavelengths, whose numbers are near
// those there: a name is missing in the heading.
class Neighbour {
public:
    Neighbour(std::size_t column, std::size_t end) : column(column), end(end) {}
    void take(const Row &row);
    bool continues_spectrum() const;

    const std::size_t column;
    const std::size_t end; // the column of the first or last wavelength

private:
    std::size_t rows = 0, alike = 0;
    double least = 0, most = 0;
};

// A column of a wavelength that no band needs, that is empty in a few rows: their cells may have
// been moved.
class SpareBand {
public:
    explicit SpareBand(std::size_t column) : column(column) {}
    void take(const Row &row, std::size_t line);
    bool few_empty() const { return first_line > 0 && 2 * empty <= rows; }
    bool all_empty() const { return rows > 0 && empty == rows; }

    const std::size_t column;
    std::size_t first_line = 0; // that is empty
    std::size_t empty = 0;

private:
    std::size_t rows = 0;
};

} // namespace vantrel::sheets
