// CSV whose rows are wavelengths, and whose columns are patches.
#pragma once

#include "read/csv_record.h"
#include "read/sheet.h"

#include <cstddef>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// Turned, such a table is read as any other: what stands above the wavelengths is a column, by its
// first value.
class WavelengthsDown {
public:
    // Whether the text holds such a table: one row of a wavelength after the other, enough for a
    // spectrum; two may be exchanged.
    bool find(std::string_view text);

    // Throws InputError.
    void read(Sheet &sheet);

private:
    struct Line {
        Row row;
        std::size_t at;
    };
    void read_above(Sheet &sheet);
    void read_wavelengths(Sheet &sheet, const Row &named);
    std::size_t names() const; // kNone where there are none
    bool is_empty(std::size_t column) const;

    std::string_view above, rows; // the lines before the first wavelength, and from there
    char separator = ',';
    std::size_t width = 0; // of the first row of a wavelength
    std::size_t lines_above = 0;
    std::vector<Line> lines;    // above, that are as wide
    std::vector<Line> spectrum; // a wavelength each
};

} // namespace vantrel::sheets
