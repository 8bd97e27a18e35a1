#include "write/decimal.h"

#include <cmath>
#include <iterator>

namespace vantrel::sheets {

void append_ten_thousandths(long long k, bool zeros, std::string &out)
{
    char text[24];
    char *end = std::end(text), *begin = end;
    auto rest = static_cast<unsigned long long>(k < 0 ? -k : k);
    for (int place = 0; place <= 4 || rest != 0; ++place) {
        if (place == 4)
            *--begin = '.';
        *--begin = static_cast<char>('0' + rest % 10);
        rest /= 10;
    }
    if (!zeros) {
        while (end[-1] == '0')
            --end;
        if (end[-1] == '.')
            --end;
    }
    if (k < 0)
        *--begin = '-';
    out.append(begin, end);
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
