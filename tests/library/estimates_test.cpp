// What any spectra that can be measured give.
#include "vantrel.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <functional>
#include <random>

// Papers and inks that reflect nothing, all, or hardly anything in some of their bands.
TEST(Estimates, AreReflectancesWhateverIsMeasured)
{
    using Refl = std::array<double, VANTREL_BANDS>;
    std::array<Refl, 3> ink;
    Refl paper;
    int percent[3];
    const std::function<void(double *)> estimates[] = {
        [&](double *out) { EstimateRefls(3, ink[0].data(), percent, paper.data(), out); },
        [&](double *out) {
            EstimateReflsForBestVisualColor(3, ink[0].data(), percent, paper.data(), out);
        },
        [&](double *out) { Combine3InkColors(ink[0].data(), ink[1].data(), ink[2].data(), out); },
        [&](double *out) {
            EstimateReflsForThickness(ink[0].data(), percent[0] / 30.0, paper.data(), out);
        },
        [&](double *out) { ColorAtEquivalentDensity(paper.data(), ink[0].data(), E_STATUS, out); },
    };
    std::mt19937 generator(7);
    std::uniform_real_distribution<double> any(0, 100);
    const double corners[] = {0, 100, 5e-324, 1e-310, 1e-17, 1e-4};
    const auto draw = [&] {
        const std::size_t corner = generator() % 12;
        return corner < std::size(corners) ? corners[corner] : any(generator);
    };
    for (int round = 0; round < 1000; ++round) {
        for (Refl *refl : {&ink[0], &ink[1], &ink[2], &paper})
            std::ranges::generate(*refl, draw);
        for (int &p : percent)
            p = generator() % 3 ? static_cast<int>(generator() % 101) : 0;
        for (const auto &estimate : estimates) {
            Refl out;
            estimate(out.data());
            ASSERT_TRUE(std::ranges::all_of(out, [](double r) { return 0 <= r && r < 101; }))
                << "round " << round << ", estimate " << &estimate - estimates;
        }
    }
}
