// Properties of colorimetry and colour difference that a wrong formula breaks.
#include "golden.h"

#include "colorimetry/tristimulus.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <random>

namespace {

using Refl = std::array<double, VANTREL_BANDS>;
using Triple = std::array<double, 3>;

std::vector<Refl> random_spectra(int count)
{
    std::mt19937 generator(20);
    std::uniform_real_distribution<double> percent(-5, 120);
    std::vector<Refl> spectra(count);
    for (Refl &refl : spectra)
        for (double &band : refl)
            band = percent(generator);
    return spectra;
}

std::vector<CIELABCOORD> random_colours(int count)
{
    std::mt19937 generator(21);
    std::uniform_real_distribution<double> lightness(0, 100), chroma(-90, 90);
    std::vector<CIELABCOORD> colours(count);
    for (CIELABCOORD &lab : colours)
        lab = {lightness(generator), chroma(generator), chroma(generator)};
    return colours;
}

} // namespace

#ifdef __x86_64__
TEST(Tristimulus, EveryVariantGivesTheSameBits)
{
    if (!__builtin_cpu_supports("avx2"))
        GTEST_SKIP() << "no AVX2 here";
    auto spectra = random_spectra(500);
    spectra[0].fill(1e300);
    spectra[1].fill(-1e-310);
    for (const Refl &refl : spectra)
        for (int k = 0; k < NUM_ILLUM_OBS; ++k) {
            const auto &weights = vantrel::tristimulus_weights(static_cast<ILLUM_OBS>(k));
            const auto plain = vantrel::integrate(vantrel::spectrum(refl.data()), weights);
            const auto avx2 = vantrel::integrate_avx2(vantrel::spectrum(refl.data()), weights);
            ASSERT_EQ(std::memcmp(&plain, &avx2, sizeof plain), 0) << k;
        }
}
#endif

TEST(Tristimulus, BandsAddUpToTheSum)
{
    for (const Refl &refl : random_spectra(50))
        for (int k = 0; k < NUM_ILLUM_OBS; ++k) {
            const auto illum_obs = static_cast<ILLUM_OBS>(k);
            Triple xyz;
            Refl x, y, z;
            ReflToXYZ(refl.data(), illum_obs, xyz.data());
            ReflToXYZs(refl.data(), illum_obs, x.data(), y.data(), z.data());
            Triple sum{};
            for (int i = 0; i < VANTREL_BANDS; ++i)
                sum = {sum[0] + x[i], sum[1] + y[i], sum[2] + z[i]};
            for (int c = 0; c < 3; ++c)
                ASSERT_NEAR(sum[c], xyz[c], 1e-12 * 300);
        }
}

TEST(Lab, InverseReturnsWithinTheRoundingOfItsRatios)
{
    for (const CIELABCOORD &lab : random_colours(300))
        for (int k = 0; k < NUM_ILLUM_OBS; ++k) {
            const auto illum_obs = static_cast<ILLUM_OBS>(k);
            double xyz[3], back[3];
            LabToXYZ(&lab.L, illum_obs, xyz);
            if (xyz[0] < 1 || xyz[1] < 1 || xyz[2] < 1)
                continue; // where six decimals of a ratio are coarse
            XYZToCIELab(xyz, illum_obs, back);
            ASSERT_NEAR(back[0], lab.L, 2e-3);
            ASSERT_NEAR(back[1], lab.a, 1e-2);
            ASSERT_NEAR(back[2], lab.b, 1e-2);
        }
}

TEST(Lab, PolarFormReturnsTheRoundedColour)
{
    for (const CIELABCOORD &lab : random_colours(300)) {
        double lch[3], back[3];
        CIELabToCIELCH(&lab.L, lch);
        CIELChToCIELab(lch, back);
        EXPECT_EQ(lch[0], lab.L);
        EXPECT_TRUE(lch[2] >= 0 && lch[2] < 360);
        EXPECT_NEAR(back[1], std::round(lab.a * 100) / 100, 1e-9);
        EXPECT_NEAR(back[2], std::round(lab.b * 100) / 100, 1e-9);
    }
}

TEST(Lab, AnOutputMayBeTheInput)
{
    const CIELABCOORD lab = {61.2, -14.301, 22.449};
    double apart[3], in_place[3] = {lab.L, lab.a, lab.b};
    CIELabToCIELCH(&lab.L, apart);
    CIELabToCIELCH(in_place, in_place);
    EXPECT_EQ(0, std::memcmp(apart, in_place, sizeof apart));
    LabToXYZ(&lab.L, C_2DEG, apart);
    double xyz[3] = {lab.L, lab.a, lab.b};
    LabToXYZ(xyz, C_2DEG, xyz);
    EXPECT_EQ(0, std::memcmp(apart, xyz, sizeof apart));
}

TEST(Rgb, LevelsRiseWithLightFromHalfStepToHalfStep)
{
    // Along the grey of the display itself every channel has the same linear intensity.
    unsigned int before = 0;
    for (int step = 0; step <= 1100; ++step) {
        const double v = step / 1000.0;
        const double xyz[] = {68.685 * v, 75.948 * v, 95.423 * v};
        unsigned int rgb = 0;
        ASSERT_EQ(XYZtoRGB(xyz, &rgb), 1);
        ASSERT_GE(rgb & 0xff, before & 0xff) << step;
        ASSERT_EQ(rgb >> 24, 0u);
        before = rgb;
    }
    EXPECT_EQ(before, 0xffffffu);
}

TEST(Verbal, HueWordsFollowTheHueOfTheStandard)
{
    struct Range {
        double from, to;
        const char *clockwise, *counter_clockwise;
    };
    const Range ranges[] = {
        {0, 35, "Too Blue", "Too Yellow"},    {35, 55, "Too Red", "Too Yellow"},
        {55, 125, "Too Red", "Too Green"},    {125, 145, "Too Yellow", "Too Green"},
        {145, 215, "Too Yellow", "Too Blue"}, {215, 235, "Too Green", "Too Blue"},
        {235, 305, "Too Green", "Too Red"},   {305, 325, "Too Blue", "Too Red"},
        {325, 360, "Too Blue", "Too Yellow"}};
    const Function &verbal = *find_function("VerbalColorDifference");
    std::array<int, std::size(ranges)> seen{};
    const auto spectra = random_spectra(4000);
    for (std::size_t i = 0; i + 1 < spectra.size(); ++i) {
        float standard[5], sample[5];
        CalcLabch(spectra[i].data(), C_2DEG, standard);
        CalcLabch(spectra[i + 1].data(), C_2DEG, sample);
        const float dh = sample[4] - standard[4];
        auto slots = verbal.slots();
        slots[0].values.assign(spectra[i].begin(), spectra[i].end());
        slots[1].values.assign(spectra[i + 1].begin(), spectra[i + 1].end());
        slots[2].values = {C_2DEG};
        slots[3].values = {1};
        ASSERT_EQ(verbal.call(slots), 1);
        for (std::size_t r = 0; r < std::size(ranges); ++r)
            if (standard[4] > ranges[r].from && standard[4] <= ranges[r].to) {
                ++seen[r];
                ASSERT_EQ(slots[6].text, std::fabs(dh) <= 0.5 ? "On Target"
                                         : dh < 0             ? ranges[r].clockwise
                                                              : ranges[r].counter_clockwise)
                    << standard[4];
            }
    }
    for (int count : seen)
        EXPECT_GT(count, 0);
}

TEST(Difference, OrderMattersOnlyWhereAReferenceIsMeant)
{
    const auto colours = random_colours(400);
    for (std::size_t i = 0; i + 1 < colours.size(); ++i) {
        const CIELABCOORD &first = colours[i], &second = colours[i + 1];
        double there = 0, back = 0, plain = 0;
        LabToDE2000Ex(&first, &second, 1.5, 2, 0.5, &there);
        LabToDE2000Ex(&second, &first, 1.5, 2, 0.5, &back);
        EXPECT_NEAR(there, back, 1e-10);
        LabToDE2000(&first, &second, 1.5, 2, &there);
        LabToDE2000Ex(&first, &second, 1.5, 2, 1, &plain);
        EXPECT_EQ(there, plain);
        LabToDElab(&first, &second, &there);
        LabToDElab(&second, &first, &back);
        EXPECT_EQ(there, back);
        LabToDH(&first, &second, &there);
        LabToDH(&second, &first, &back);
        EXPECT_EQ(there, -back);
        LabToDE94(&first, &second, 1, 1, &there);
        LabToDE94(&second, &first, 1, 1, &back);
        EXPECT_NE(there, back);
        LabToDEcmc(&first, &second, 2, 1, &there);
        LabToDEcmc(&second, &first, 2, 1, &back);
        EXPECT_NE(there, back);
    }
}

// Hues exactly opposite lie 180 degrees apart in CIEDE2000, whatever the last bits of the two arc
// tangents: the mean hue jumps by 180 degrees on the wrong side, and the result with it.
TEST(Difference, OppositeHuesStayOnOneSide)
{
    for (const CIELABCOORD &lab : random_colours(2000)) {
        const CIELABCOORD opposite = {lab.L, -lab.a, -lab.b};
        const double turn = lab.b > 0 ? 1e-9 : -1e-9; // brings the hues closer
        const CIELABCOORD short_of = {lab.L, -lab.a - lab.b * turn, -lab.b + lab.a * turn};
        double exact = 0, other = 0, near = 0;
        LabToDE2000(&lab, &opposite, 1, 1, &exact);
        LabToDE2000(&opposite, &lab, 1, 1, &other);
        LabToDE2000(&lab, &short_of, 1, 1, &near);
        EXPECT_NEAR(exact, other, 1e-9);
        EXPECT_NEAR(exact, near, 1e-5) << lab.a << " " << lab.b;
    }
}

TEST(Difference, PolarCie94IsThatOfItsColours)
{
    const auto colours = random_colours(100);
    for (std::size_t i = 0; i + 1 < colours.size(); ++i) {
        CIELCHCOORD first, second;
        CIELabToCIELChEx(&colours[i].L, &first.L, 0);
        CIELabToCIELChEx(&colours[i + 1].L, &second.L, 0);
        double polar = 0, plain = 0;
        CIELChToDE94(&first, &second, 2, 1, &polar);
        LabToDE94(&colours[i], &colours[i + 1], 2, 1, &plain);
        EXPECT_NEAR(polar, plain, 1e-10);
    }
}
