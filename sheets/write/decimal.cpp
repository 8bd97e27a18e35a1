#include "write/decimal.h"

#include <charconv>
#include <cmath>
#include <iterator>

namespace vantrel::sheets {

void append_ten_thousandths(long long k, bool zeros, std::string &out)
{
    char text[24] = "-";
    const auto rest = static_cast<unsigned long long>(k < 0 ? -k : k);
    char *end = std::to_chars(text + (k < 0), std::end(text), rest / 10000).ptr;
    const auto decimals = static_cast<unsigned>(rest % 10000);
    *end++ = '.';
    for (const unsigned place : {1000, 100, 10, 1})
        *end++ = static_cast<char>('0' + decimals / place % 10);
    if (!zeros) {
        while (end[-1] == '0')
            --end;
        if (end[-1] == '.')
            --end;
    }
    out.append(text, end);
}

std::optional<long long> ten_thousandths(double value)
{
    const double scaled = value * 1e4;
    if (!(std::abs(scaled) < kMostTenThousandths))
        return std::nullopt;
    const auto k = static_cast<long long>(scaled + (scaled < 0 ? -0.5 : 0.5));
    return k != 0 && static_cast<double>(k) / 1e4 == value ? std::optional(k) : std::nullopt;
}

} // namespace vantrel::sheets
