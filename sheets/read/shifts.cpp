#include "read/shifts.h"

#include "read/text.h"

#include <algorithm>
#include <cmath>

namespace vantrel::sheets {

void Neighbour::take(const Row &row)
{
    constexpr double kNear = 0.25; // of reflectances 10 or 20 nm apart at the ends of the range
    const auto value = number_in(row.values[column]), known = number_in(row.values[end]);
    ++rows;
    if (!value || !known)
        return;
    alike += std::abs(*value - *known) <= kNear * std::max(std::abs(*value), std::abs(*known));
    least = rows == 1 ? *value : std::min(least, *value);
    most = rows == 1 ? *value : std::max(most, *value);
}

bool Neighbour::continues_spectrum() const
{
    return rows >= 3 && 10 * alike >= 9 * rows && most > 2 * least && least >= 0;
}

void SpareBand::take(const Row &row, std::size_t line)
{
    ++rows;
    if (!row.values[column].empty())
        return;
    first_line = first_line ? first_line : line;
    ++empty;
}

} // namespace vantrel::sheets
