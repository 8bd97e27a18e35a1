// How large a number of differences are.
#pragma once

#include <cstddef>
#include <vector>

namespace vantrel::sheets {

// What cannot be measured (not a number) is larger than anything.
struct Statistics {
    double mean = 0;
    double p95 = 0; // the smallest value that at least 95 % do not exceed
    double max = 0;
    std::size_t max_at = 0; // its place among the values
};

// At least one value.
Statistics statistics_of(const std::vector<double> &values);

// The places of the values from the largest on; equal ones in their order.
std::vector<std::size_t> largest_first(const std::vector<double> &values);

} // namespace vantrel::sheets
