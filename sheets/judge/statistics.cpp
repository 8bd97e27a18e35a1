#include "judge/statistics.h"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace vantrel::sheets {
namespace {

double size_of(double value) { return std::isnan(value) ? INFINITY : value; }

} // namespace

std::vector<std::size_t> largest_first(const std::vector<double> &values)
{
    std::vector<std::size_t> order(values.size());
    std::iota(order.begin(), order.end(), 0u);
    std::stable_sort(order.begin(), order.end(), [&](std::size_t first, std::size_t second) {
        return size_of(values[first]) > size_of(values[second]);
    });
    return order;
}

Statistics statistics_of(const std::vector<double> &values)
{
    const std::vector<std::size_t> order = largest_first(values);
    const std::size_t count = values.size();
    const std::size_t rank = (95 * count + 99) / 100; // counted from the smallest
    return {.mean = std::accumulate(values.begin(), values.end(), 0.0) / static_cast<double>(count),
            .p95 = values[order[count - rank]],
            .max = values[order.front()],
            .max_at = order.front()};
}

} // namespace vantrel::sheets
