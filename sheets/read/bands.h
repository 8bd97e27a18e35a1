// The 31 bands of a spectrum, out of the values that a file has at wavelengths of its own.
#pragma once

#include "read/measurement.h"

#include <array>
#include <cstddef>
#include <vector>

namespace vantrel::sheets {

class Bands {
public:
    // Wavelengths in nm, in any order, evenly spaced from 400 to 700 nm at least, in steps of 10 nm
    // or finer; throws InputError for this line where they are not.
    Bands(std::vector<double> wavelengths, std::size_t line);

    const std::vector<double> &wavelengths() const { return nm; }

    // Which of the values the bands need.
    const std::vector<std::size_t> &used() const { return needed; }

    // One value for each wavelength. A band is the mean of those less than 10 nm away, weighted by
    // a triangle, the passband of spectral data at 10 nm (ISO 13655); of steps of 10 nm it is the
    // value itself.
    Spectrum of(const std::vector<double> &values) const;

    // All but the scale and the condition.
    Source source() const;

private:
    struct Part {
        std::size_t value;
        double weight; // of a sum of 1
    };
    std::vector<double> nm;
    std::vector<std::size_t> needed; // by wavelength
    std::array<std::vector<Part>, VANTREL_BANDS> parts;
};

} // namespace vantrel::sheets
