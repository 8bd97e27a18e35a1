// CIEDE2000 of many pairs in one call, two at a time, with the bits of LabToDE2000(). A step is
// from one colour to the next in bytes, 0 for one colour to all.
#include "difference/de2000.h"

#include <cstddef>

namespace {

using Two = vantrel::Lanes<2>;
using Lab = vantrel::LabOf<Two>;

Lab lab_of(const double *first, const double *second)
{
    const auto both = [=](int i) { return Two::Doubles{first[i], second[i]}; };
    return {both(0), both(1), both(2)};
}

} // namespace

extern "C" void LabToDE2000Rows(const double *first, std::size_t first_step, const double *second,
                                std::size_t second_step, double kL, double kC, double *out,
                                std::size_t rows)
{
    const std::size_t to_first = first_step / sizeof(double),
                      to_second = second_step / sizeof(double);
    for (std::size_t i = 0; i < rows; i += 2) {
        const std::size_t next = i + 1 < rows ? i + 1 : i;
        const Two difference =
            vantrel::delta_e2000(lab_of(first + i * to_first, first + next * to_first),
                                 lab_of(second + i * to_second, second + next * to_second),
                                 vantrel::Factors{kL, kC, 1}, vantrel::kPow25To7);
        out[next] = difference[1];
        out[i] = difference[0];
    }
}
