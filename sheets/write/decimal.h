// Decimals of four places, which most numbers in files are.
#pragma once

#include <optional>
#include <string>

namespace vantrel::sheets {

// Above it the products with 10,000 are not right to 0.0001.
inline constexpr double kMostTenThousandths = 1e11;

// Appends k / 10,000, with four decimals or without the zeros at their end.
void append_ten_thousandths(long long k, bool zeros, std::string &out);

// The k that makes k / 10,000 this double; nothing where there is none, or it is 0.
std::optional<long long> ten_thousandths(double value);

} // namespace vantrel::sheets
