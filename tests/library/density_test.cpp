// What the golden tables cannot show of densities: two ways to one answer, and the state.
#include "golden.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <numeric>
#include <random>

namespace {

using Refl = std::array<double, VANTREL_BANDS>;

constexpr double kInf = std::numeric_limits<double>::infinity();
constexpr double kNan = std::numeric_limits<double>::quiet_NaN();

} // namespace

// Steps between two of twenty levels: the densities of two filters often tie but for rounding.
TEST(Density, ThePaperChangesTheChoiceByItsAdjustmentAlone)
{
    std::mt19937 generator(31);
    std::uniform_int_distribution<int> level(1, 20), edge(0, 31);
    std::vector<Refl> papers(9), inks(3000);
    std::ranges::copy(golden_values("paper"), papers[0].begin());
    const double flat[] = {100.0, 92.03565821480744, 87.5, 0.5, 0.0, -3.0, kInf, kNan};
    for (std::size_t i = 0; i < std::size(flat); ++i)
        papers[i + 1].fill(flat[i]);
    for (Refl &ink : inks) {
        ink.fill(5 * level(generator));
        const int first = edge(generator), second = edge(generator);
        std::fill(ink.begin() + std::min(first, second), ink.begin() + std::max(first, second),
                  5 * level(generator));
        for (const Refl &paper : papers) {
            Refl adjusted;
            AdjustForPaperRefls(ink.data(), paper.data(), adjusted.data());
            for (int status = 0; status < NUM_STATUSES; ++status)
                ASSERT_EQ(DetermineDensityResponse(ink.data(), status, paper.data()),
                          DetermineDensityResponse(adjusted.data(), status, nullptr))
                    << "status " << status << " on " << paper[0];
        }
    }
}

TEST(DenWeight, IsReadAtTheMomentOfTheCall)
{
    Refl grey;
    grey.fill(25);
    auto &weight = den_weight[A_STATUS][RED_RESPONSE];
    std::int64_t kept[VANTREL_BANDS];
    std::ranges::copy(weight, kept);
    std::ranges::fill(weight, 0);
    weight[30] = 40000;
    DENSITYSTRUCT set;
    double single = 0;
    ReflToDensity(grey.data(), nullptr, A_STATUS, RED_RESPONSE, &single);
    ReflToDensities(grey.data(), nullptr, A_STATUS, &set);
    EXPECT_NEAR(single, 1, 1e-14);
    EXPECT_EQ(set.density[RED_RESPONSE], single);
    std::ranges::copy(kept, weight);
}

TEST(SettableBands, RowsSumToExactlyAHundredThousandForAnyShape)
{
    const double shapes[][7] = {{kInf, 1, 1, 1, 1, 1, kNan},
                                {1e300, 1, -1e300, 1, 1, 1, 1},
                                {1, -1, 5e-324, 0, 0, 0, 0},
                                {1e308, 1e308, 1e308, 1e308, -1e308, -1e308, -1e308},
                                {0.3, 0.7, 1.1, 1.3, 0.9, 0.5, 0.1},
                                {0.1, 0.5, 0.8, 1, 0.8, 0.5, 0.1}}; // the default again
    for (const auto &shape : shapes) {
        SetHiFiConstants(std::data({530.0, 630.0, 620.0}), shape, shape, shape);
        SetHexachromeConstants(std::data({440.0, 630.0}), shape, shape);
        for (int r = HIFI1_RESPONSE; r <= HEXACHROME2_RESPONSE; ++r) {
            const auto &row =
                den_weight[r < HEXACHROME1_RESPONSE ? HIFI_STATUS : HEXACHROME_STATUS][r];
            EXPECT_EQ(std::accumulate(std::begin(row), std::end(row), std::int64_t{0}), 100000)
                << r;
        }
    }
}
