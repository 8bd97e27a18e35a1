#include "density/band_constants.h"

#include <algorithm>
#include <cmath>
#include <cstdint>

namespace vantrel {
namespace {

constexpr int kShapeReach = kShape / 2; ///< of a shape to either side

// State: the centres of HIFI1_RESPONSE and so on, as band indices. Their rows are in den_weight.
constinit int centres[] = {13, 23, 22, 4, 23};

int &centre_of(int response) { return centres[response - HIFI1_RESPONSE]; }

std::span<std::int64_t, kBands> row_of(int response)
{
    const int status = response < HEXACHROME1_RESPONSE ? HIFI_STATUS : HEXACHROME_STATUS;
    return den_weight[status][response];
}

/// Halves away from zero. Weights that all but cancel out are scaled to anything: the limit keeps a
/// sum of seven in 64 bits.
std::int64_t whole_weight(double weight)
{
    constexpr double kLimit = 0x1p60;
    return static_cast<std::int64_t>(std::clamp(std::round(weight), -kLimit, kLimit));
}

/// Integer weights that sum to 100 000; the centre takes what rounding leaves over. A shape that
/// cannot be scaled to that leaves the row as it was.
void build_row(std::span<std::int64_t, kBands> row, int centre, Shape shape)
{
    double sum = 0;
    for (const double weight : shape)
        sum += weight;
    const double scale = sum == 0 ? 0 : 100000 / sum;
    if (!std::isfinite(sum) || !std::isfinite(scale))
        return;
    std::fill(row.begin(), row.end(), 0);
    if (sum == 0)
        return;
    std::int64_t left = 100000;
    for (int i = 0; i < kShape; ++i) {
        const std::int64_t weight = whole_weight(shape[i] * scale);
        row[centre - kShapeReach + i] = weight;
        left -= weight;
    }
    row[centre] += left;
}

} // namespace

void set_band(int response, double wavelength, const std::optional<Shape> &shape)
{
    const double band = (wavelength - 400) / 10;
    if (!(band >= kShapeReach && band < kBands - kShapeReach))
        return;
    const int centre = static_cast<int>(band);
    centre_of(response) = centre;
    if (shape)
        build_row(row_of(response), centre, *shape);
}

double band_centre(int response) { return centre_of(response) * 10 + 400; }

std::array<double, kShape> band_shape(int response)
{
    const auto row = row_of(response);
    const int centre = centre_of(response);
    std::array<double, kShape> shape;
    for (int i = 0; i < kShape; ++i)
        shape[i] =
            static_cast<double>(row[centre - kShapeReach + i]) / static_cast<double>(row[centre]);
    return shape;
}

} // namespace vantrel
