// The 31 bands of a spectrum, out of the values that a file has at wavelengths of its own.
#pragma once

#include "read/measurement.h"

#include <array>
#include <cstddef>
#include <optional>
#include <utility>
#include <vector>

namespace vantrel::sheets {

class Bands {
public:
    // Wavelengths in nm, in any order, evenly spaced in steps of 20, 10 or fewer nm, from 410 to
    // 680 nm at least; throws InputError for this line where they are not.
    Bands(std::vector<double> wavelengths, std::size_t line);

    const std::vector<double> &wavelengths() const { return nm; }

    // Which of the values the bands need.
    const std::vector<std::size_t> &used() const { return needed; }

    // One value for each wavelength.
    //
    // Steps of 10 nm are taken as they are. Between steps of 20 nm a cubic goes through the four
    // nearest values, in the first and last interval a parabola through three (Lagrange; ASTM
    // E2022). Of finer steps a band is the mean weighted by a triangle of 10 nm half width, the
    // passband of spectral data at 10 nm (ISO 13655), which then is corrected for its width by
    // -0.083, 1.166, -0.083 of the three neighbouring bands (Stearns and Stearns 1988). Where the
    // range ends too early for the three triangles, the value at the band's own wavelength stands
    // for it: that is what the correction brings the mean back to. Bands outside the range are
    // equal to the last one inside.
    Spectrum of(const std::vector<double> &values) const;

    // The first two neighbours in the file that do not stand as its others do, which ascend or
    // descend; none where all do.
    std::optional<std::pair<double, double>> out_of_order() const;

    // All but the scale and the condition.
    Source source() const;

private:
    struct Part {
        std::size_t value;
        double weight; // of a sum of 1
    };
    using Parts = std::vector<Part>;
    Parts value_at(double wavelength) const;
    Parts triangle(double centre) const;
    Parts between(double wavelength) const;
    Parts corrected(double centre) const;

    std::vector<double> nm;
    std::vector<std::size_t> order; // of the values, by wavelength
    double step;
    std::vector<std::size_t> needed; // by wavelength
    std::array<Parts, VANTREL_BANDS> parts;
};

} // namespace vantrel::sheets
