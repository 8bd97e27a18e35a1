// Where an output shares memory with an input, the result is that of separate arrays.
#include "vantrel.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <functional>

TEST(Aliasing, AnOutputMayBeAnyOfTheInputs)
{
    // Three inks in a row and the paper behind them.
    using Sheet = std::array<double, std::size_t{4} * VANTREL_BANDS>;
    const int percent[] = {40, 100, 75};
    const std::function<void(double *, double *)> calls[] = {
        [](double *s, double *out) { CIELabToCIELCH(s, out); },
        [](double *s, double *out) { LabToXYZ(s, C_2DEG, out); },
        [](double *s, double *out) { CombineInkColors(s, s + 31, out); },
        [](double *s, double *out) { Combine3InkColors(s, s + 31, s + 62, out); },
        [](double *s, double *out) { Combine3InkColorsEx(s, s + 31, s + 62, out); },
        [](double *s, double *out) { EstimateReflsForThickness(s, 0.4, s + 93, out); },
        [](double *s, double *out) { EstimateReflsForTintColor(s, 40, s + 93, out); },
        [](double *s, double *out) { EstimateTintColor(s, 40, s + 93, out); },
        [&](double *s, double *out) { EstimateRefls(3, s, percent, s + 93, out); },
        [&](double *s, double *out) { EstimateColor(3, s, percent, s + 93, out); },
        [](double *s, double *out) { ReflToABErrorWeights(s, s + 31, D50_2DEG, out, nullptr); },
        [](double *s, double *out) {
            double a[VANTREL_BANDS];
            ReflToABErrorWeights(s, s + 31, D50_2DEG, a, out);
        },
    };
    Sheet sheet;
    for (std::size_t i = 0; i < sheet.size(); ++i)
        sheet[i] = 1 + 37 * i % 89;
    for (const auto &call : calls)
        for (int offset : {0, 1, 30, 31, 62, 93}) {
            Sheet separate = sheet, shared = sheet;
            std::array<double, VANTREL_BANDS> result;
            std::copy_n(&sheet[offset], VANTREL_BANDS, result.begin());
            call(separate.data(), result.data());
            call(shared.data(), &shared[offset]);
            EXPECT_EQ(separate, sheet) << "wrote to an input";
            std::ranges::copy(result, &separate[offset]);
            EXPECT_EQ(shared, separate) << &call - calls << " at " << offset;
        }
}
