// Properties of the ink estimates that a wrong formula or a careless order of writing breaks.
#include "vantrel.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <functional>
#include <random>
#include <vector>

namespace {

using Refl = std::array<double, VANTREL_BANDS>;

std::mt19937 generator(70);

double uniform(double low, double high)
{
    return std::uniform_real_distribution<double>(low, high)(generator);
}

int percentage() { return std::uniform_int_distribution<int>(0, 100)(generator); }

Refl random_spectrum(double low, double high)
{
    Refl refl;
    for (double &band : refl)
        band = uniform(low, high);
    return refl;
}

Refl random_ink() { return random_spectrum(0.5, 70); }
Refl random_paper() { return random_spectrum(75, 95); }

void expect_near(const Refl &got, const Refl &wanted)
{
    for (int i = 0; i < VANTREL_BANDS; ++i)
        EXPECT_NEAR(got[i], wanted[i], 1e-11) << "band " << i;
}

} // namespace

TEST(Saunderson, CorrectionsUndoEachOther)
{
    for (int i = 0; i < 1000; ++i) {
        const double refl = uniform(5, 120), k1 = uniform(0, 0.04), k2 = uniform(0, 0.6);
        EXPECT_NEAR(UnSaunderson(Saunderson(refl, k1, k2), k1, k2), refl, 1e-11);
    }
}

TEST(Film, FollowsAPowerLawInItsThickness)
{
    for (int i = 0; i < 100; ++i) {
        const Refl ink = random_ink(), paper = random_paper();
        const double first = uniform(0.1, 1), second = uniform(0.1, 2);
        Refl once, twice, at_once, none, solid;
        EstimateReflsForThickness(ink.data(), first, paper.data(), once.data());
        EstimateReflsForThickness(once.data(), second, paper.data(), twice.data());
        EstimateReflsForThickness(ink.data(), first * second, paper.data(), at_once.data());
        EstimateReflsForThickness(ink.data(), 0, paper.data(), none.data());
        EstimateReflsForThickness(ink.data(), 1, paper.data(), solid.data());
        expect_near(twice, at_once);
        expect_near(none, paper);
        expect_near(solid, ink);
    }
}

TEST(Overprint, InksCommute)
{
    for (int i = 0; i < 200; ++i) {
        const Refl first = random_spectrum(-1, 60), second = random_spectrum(0, 60);
        Refl there, back;
        CombineInkColors(first.data(), second.data(), there.data());
        CombineInkColors(second.data(), first.data(), back.data());
        for (int band = 0; band < VANTREL_BANDS; ++band)
            EXPECT_TRUE(there[band] == back[band] ||
                        (first[band] < 0 && std::isnan(there[band]) && std::isnan(back[band])));
    }
}

TEST(Overprint, ADensityOfSixTenthsDoesNotAddYet)
{
    double limit = 100 / std::pow(10, 0.6);
    for (int i = 0; i < 10; ++i)
        limit = std::nextafter(limit, 100);
    while (std::log10(100 / limit) < 0.6)
        limit = std::nextafter(limit, 0);
    ASSERT_EQ(std::log10(100 / limit), 0.6);
    double beyond = limit;
    while (std::log10(100 / beyond) == 0.6)
        beyond = std::nextafter(beyond, 0);
    Refl dense, lighter, printed;
    dense.fill(10);
    lighter.fill(limit);
    lighter[7] = beyond;
    CombineInkColors(dense.data(), lighter.data(), printed.data());
    EXPECT_NEAR(printed[6], 10, 1e-12);
    EXPECT_NEAR(printed[7], std::sqrt(10), 1e-12);
}

TEST(Estimate, IsTheOverprintOfItsTints)
{
    using Driver = decltype(&EstimateRefls);
    using Packing = decltype(&EstimateReflsEx);
    using Tint = decltype(&EstimateReflsForTintColor);
    struct Model {
        Driver driver;
        Packing packing;
        Tint tint;
    };
    const Model models[] = {
        {EstimateRefls, EstimateReflsEx, EstimateReflsForTintColor},
        {EstimateReflsForBestVisualColor, EstimateReflsExForBestVisualColor,
         EstimateReflsForTintColorForBestVisualColor},
    };
    for (const auto &[driver, packing, tint] : models)
        for (int i = 0; i < 50; ++i) {
            const std::array<Refl, 3> inks = {random_ink(), random_ink(), random_ink()};
            const Refl paper = random_paper();
            const int percent[] = {percentage(), i % 3 ? percentage() : 100, percentage()};
            std::array<Refl, 3> layers = inks;
            for (int k = 0; k < 3; ++k)
                if (percent[k] < 100)
                    tint(inks[k].data(), percent[k], paper.data(), layers[k].data());
            std::array<Refl, 3> chained;
            chained[0] = layers[0];
            CombineInkColors(layers[0].data(), layers[1].data(), chained[1].data());
            Combine3InkColors(layers[0].data(), layers[1].data(), layers[2].data(),
                              chained[2].data());
            for (int n = 1; n <= 3; ++n) {
                Refl driven, packed;
                ASSERT_EQ(driver(n, inks[0].data(), percent, paper.data(), driven.data()), 1);
                ASSERT_EQ(packing(n, inks[0].data(), inks[1].data(), inks[2].data(), percent,
                                  paper.data(), packed.data()),
                          1);
                EXPECT_EQ(driven, chained[n - 1]) << n;
                EXPECT_EQ(packed, driven) << n;
            }
        }
}

TEST(Estimate, DoesNotReadInksThatAreNotAskedFor)
{
    const auto *const unreadable = reinterpret_cast<const double *>(8);
    const Refl ink = random_ink(), paper = random_paper();
    const int percent[] = {100, 100};
    Refl one, two, overprint;
    ASSERT_EQ(
        EstimateReflsEx(1, ink.data(), unreadable, unreadable, percent, paper.data(), one.data()),
        1);
    EXPECT_EQ(one, ink);
    ASSERT_EQ(
        EstimateReflsEx(2, ink.data(), ink.data(), unreadable, percent, paper.data(), two.data()),
        1);
    CombineInkColors(ink.data(), ink.data(), overprint.data());
    EXPECT_EQ(two, overprint);
}

TEST(ErrorWeights, AreSignedAndScaledToAHundred)
{
    for (int i = 0; i < 200; ++i) {
        const auto illum_obs = i % NUM_ILLUM_OBS;
        const Refl first = random_spectrum(0, 100), second = random_spectrum(0, 100);
        Refl a, b, a_back, b_back, alone;
        ReflToABErrorWeights(first.data(), second.data(), illum_obs, a.data(), b.data());
        ReflToABErrorWeights(second.data(), first.data(), illum_obs, a_back.data(), b_back.data());
        ReflToABErrorWeights(first.data(), second.data(), illum_obs, nullptr, alone.data());
        EXPECT_EQ(alone, b);
        for (const auto &[there, back] : {std::pair(a, a_back), std::pair(b, b_back)}) {
            double largest = 0;
            for (int band = 0; band < VANTREL_BANDS; ++band) {
                EXPECT_EQ(there[band], -back[band]);
                largest = std::fmax(largest, std::fabs(there[band]));
            }
            EXPECT_EQ(largest, 100);
        }
    }
}

// The weights follow the signs of a* and b*: light added in one band moves the colour their way.
TEST(ErrorWeights, PointTheWayTheColourMoves)
{
    Refl grey, moved, a, b;
    grey.fill(50);
    for (int band = 0; band < VANTREL_BANDS; ++band) {
        moved = grey;
        moved[band] += 5;
        double before[3], after[3];
        ReflToCIELAB(grey.data(), D65_10DEG, before);
        ReflToCIELAB(moved.data(), D65_10DEG, after);
        ASSERT_EQ(ReflToABErrorWeights(grey.data(), moved.data(), D65_10DEG, a.data(), b.data()),
                  1);
        EXPECT_EQ(a[band], std::copysign(100, after[1] - before[1])) << band;
        EXPECT_EQ(b[band], std::copysign(100, after[2] - before[2])) << band;
    }
}

// Whatever input memory an output shares, the result is that of separate arrays.
TEST(Inks, AnOutputMayBeAnyOfTheInputs)
{
    // Three inks in a row and the paper behind them.
    using Sheet = std::array<double, std::size_t{4} * VANTREL_BANDS>;
    const int percent[] = {40, 100, 75};
    const std::function<void(double *, double *)> calls[] = {
        [](double *s, double *out) { CombineInkColors(s, s + 31, out); },
        [](double *s, double *out) { Combine3InkColors(s, s + 31, s + 62, out); },
        [](double *s, double *out) { CombineInkColorsEx(s, s + 31, out); },
        [](double *s, double *out) { Combine3InkColorsEx(s, s + 31, s + 62, out); },
        [](double *s, double *out) { EstimateReflsForThickness(s, 0.4, s + 93, out); },
        [](double *s, double *out) { EstimateReflsForTintColor(s, 40, s + 93, out); },
        [](double *s, double *out) { EstimateTintColor(s, 40, s + 93, out); },
        [&](double *s, double *out) { EstimateRefls(3, s, percent, s + 93, out); },
        [&](double *s, double *out) {
            EstimateReflsExForBestVisualColor(3, s, s + 31, s + 62, percent, s + 93, out);
        },
        [&](double *s, double *out) { EstimateColor(3, s, percent, s + 93, out); },
        [](double *s, double *out) { ReflToABErrorWeights(s, s + 31, D50_2DEG, out, nullptr); },
        [](double *s, double *out) {
            Refl b;
            ReflToABErrorWeights(s, s + 31, D50_2DEG, b.data(), out);
        },
    };
    Sheet sheet;
    for (double &value : sheet)
        value = uniform(1, 90);
    for (const auto &call : calls)
        for (int offset : {0, 1, 30, 31, 62, 93}) {
            Sheet separate = sheet, shared = sheet;
            Refl result;
            std::copy_n(&sheet[offset], VANTREL_BANDS, result.begin());
            call(separate.data(), result.data());
            call(shared.data(), &shared[offset]);
            EXPECT_EQ(separate, sheet) << "wrote to an input";
            std::copy(result.begin(), result.end(), &separate[offset]);
            EXPECT_EQ(shared, separate) << &call - calls << " at " << offset;
        }
    Refl a = random_ink(), b = random_ink(), a_apart, b_apart;
    ReflToABErrorWeights(a.data(), b.data(), D50_2DEG, a_apart.data(), b_apart.data());
    ReflToABErrorWeights(a.data(), b.data(), D50_2DEG, a.data(), b.data());
    EXPECT_EQ(a, a_apart);
    EXPECT_EQ(b, b_apart);
}
