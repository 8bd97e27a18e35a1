// Properties of densities that a wrong formula, a stale table or a forgotten state breaks.
#include "golden.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <limits>
#include <numeric>
#include <random>

namespace {

using Refl = std::array<double, VANTREL_BANDS>;
using Shape = std::array<double, 7>;

constexpr double kInf = std::numeric_limits<double>::infinity();
constexpr double kNan = std::numeric_limits<double>::quiet_NaN();
constexpr Shape kDefaultShape = {0.1, 0.5, 0.8, 1, 0.8, 0.5, 0.1};

const Refl &paper()
{
    static const Refl refl = [] {
        Refl result;
        std::ranges::copy(golden_values("paper"), result.begin());
        return result;
    }();
    return refl;
}

/// Spectra of inks: two levels and a soft edge between them, rising or falling.
std::vector<Refl> random_inks(int count)
{
    std::mt19937 generator(30);
    std::uniform_real_distribution<double> percent(1, 95), place(-3, 33), width(0.5, 6);
    std::vector<Refl> inks(count);
    for (Refl &ink : inks) {
        const double left = percent(generator), right = percent(generator);
        const double edge = place(generator), softness = width(generator);
        for (int i = 0; i < VANTREL_BANDS; ++i)
            ink[i] = left + (right - left) / (1 + std::exp((edge - i) / softness));
    }
    return inks;
}

double density(const Refl &refl, const Refl *paper_refl, int status, int response)
{
    double result = kNan;
    EXPECT_EQ(ReflToDensity(refl.data(), paper_refl ? paper_refl->data() : nullptr, status,
                            response, &result),
              1);
    return result;
}

DENSITYSTRUCT densities(const Refl &refl, const Refl *paper_refl, int status)
{
    DENSITYSTRUCT set;
    EXPECT_EQ(ReflToDensities(refl.data(), paper_refl ? paper_refl->data() : nullptr, status, &set),
              1);
    return set;
}

std::int64_t row_sum(int status, int response)
{
    const auto &row = den_weight[status][response];
    return std::accumulate(std::begin(row), std::end(row), std::int64_t{0});
}

/// Puts the default bands back at the end of a test.
struct DefaultBands {
    ~DefaultBands()
    {
        const double *shape = kDefaultShape.data();
        SetHiFiConstants(std::data({530.0, 630.0, 620.0}), shape, shape, shape);
        SetHexachromeConstants(std::data({440.0, 630.0}), shape, shape);
    }
};

} // namespace

TEST(Density, SetsHoldTheSingleDensities)
{
    for (const Refl &ink : random_inks(50))
        for (const Refl *base : {static_cast<const Refl *>(nullptr), &paper()})
            for (int status = 0; status < NUM_STATUSES; ++status) {
                const DENSITYSTRUCT set = densities(ink, base, status);
                if (status == CCR1_STATUS)
                    continue; // its single densities are not corrected
                int response = VISUAL_RESPONSE;
                if (status == SPECTRAL_STATUS)
                    response =
                        DetermineDensityResponse(ink.data(), status, base ? base->data() : nullptr);
                const int measured = GetNumStatusResponses(status);
                EXPECT_EQ(set.density[0], density(ink, base, status, response));
                for (int r = 1; measured > 0 && r < NUM_RESPONSES; ++r)
                    EXPECT_EQ(set.density[r],
                              row_sum(status, r) == 0 ? 0 : density(ink, base, status, r))
                        << "status " << status << " response " << r;
                for (int r = 1; measured == 0 && r < NUM_RESPONSES; ++r)
                    EXPECT_EQ(set.density[r], set.density[0]);
            }
}

TEST(Density, AHalfOfTheLightAddsLogTwo)
{
    for (const Refl &ink : random_inks(50)) {
        Refl half;
        std::ranges::transform(ink, half.begin(), [](double band) { return band / 2; });
        for (int status : {A_STATUS, E_STATUS, I_STATUS, T_STATUS, HIFI_STATUS, CCR1_STATUS})
            for (int r = VISUAL_RESPONSE; r <= BLUE_RESPONSE; ++r) {
                EXPECT_NEAR(density(half, nullptr, status, r),
                            density(ink, nullptr, status, r) + std::log10(2), 1e-12);
                EXPECT_NEAR(density(ink, &half, status, r), -std::log10(2), 1e-12);
            }
    }
}

TEST(Density, TheAnswerOfDetermineDensityResponseIsOneThatReflToDensityTakes)
{
    std::array<int, NUM_RESPONSES> chosen{};
    for (const Refl &ink : random_inks(500))
        for (const double *base : {static_cast<const double *>(nullptr), paper().data()})
            for (int status = 0; status < NUM_STATUSES; ++status) {
                const int response = DetermineDensityResponse(ink.data(), status, base);
                double unused;
                EXPECT_EQ(ReflToDensity(ink.data(), base, status, response, &unused), 1);
                if (GetNumStatusResponses(status) > 0)
                    ++chosen.at(response);
                if (response == VISUAL_RESPONSE && !base && status != SPECTRAL_STATUS &&
                    IsChromatic(ink.data(), D65_10DEG)) {
                    const DENSITYSTRUCT set = densities(ink, nullptr, status);
                    EXPECT_EQ(set.density[0], *std::ranges::max_element(set.density));
                }
            }
    for (int r = 0; r < NUM_RESPONSES; ++r)
        EXPECT_GT(chosen[r], 0) << r;
}

TEST(Density, GreysAreReadThroughTheVisualFilter)
{
    for (double level : {0.0, 1e-3, 3.0, 50.0, 100.0}) {
        Refl grey;
        grey.fill(level);
        for (int status = 0; status < NUM_STATUSES; ++status)
            EXPECT_EQ(DetermineDensityResponse(grey.data(), status, nullptr),
                      status == SPECTRAL_STATUS ? 420 : VISUAL_RESPONSE);
    }
}

// Also where the densities of two filters tie but for rounding: steps between flat levels, on flat
// papers.
TEST(Density, ThePaperChangesTheChoiceByItsAdjustmentAlone)
{
    std::vector<Refl> inks = random_inks(300), papers = {paper()};
    std::mt19937 generator(31);
    std::uniform_int_distribution<int> level(1, 20), edge(0, 31);
    for (int i = 0; i < 3000; ++i) {
        const int first = edge(generator), second = edge(generator);
        const double levels[] = {5.0 * level(generator), 5.0 * level(generator)};
        for (int band = 0; band < VANTREL_BANDS; ++band)
            (band == 0 ? inks.emplace_back() : inks.back())[band] =
                levels[band >= std::min(first, second) && band < std::max(first, second)];
    }
    for (double flat : {100.0, 92.03565821480744, 87.5, 0.5, 0.0, -3.0, kInf, kNan})
        papers.emplace_back().fill(flat);
    for (const Refl &base : papers)
        for (const Refl &ink : inks) {
            Refl adjusted;
            AdjustForPaperRefls(ink.data(), base.data(), adjusted.data());
            for (int status = 0; status < NUM_STATUSES; ++status)
                ASSERT_EQ(DetermineDensityResponse(ink.data(), status, base.data()),
                          DetermineDensityResponse(adjusted.data(), status, nullptr))
                    << "status " << status << " on " << base[0];
        }
}

TEST(DenWeight, IsReadAtTheMomentOfTheCall)
{
    const Refl grey = [] {
        Refl result;
        result.fill(25);
        return result;
    }();
    std::int64_t(&weight)[VANTREL_BANDS] = den_weight[A_STATUS][RED_RESPONSE];
    std::int64_t kept[VANTREL_BANDS];
    std::ranges::copy(weight, kept);
    std::ranges::fill(weight, 0);
    weight[30] = 40000;
    EXPECT_NEAR(density(grey, nullptr, A_STATUS, RED_RESPONSE), 1, 1e-14);
    EXPECT_NEAR(densities(grey, nullptr, A_STATUS).density[RED_RESPONSE], 1, 1e-14);
    std::ranges::copy(kept, weight);
}

TEST(SettableBands, RowsSumToExactlyAHundredThousandForAnyShape)
{
    const DefaultBands restore;
    std::mt19937 generator(32);
    std::uniform_real_distribution<double> weight(-1, 3), centre(430, 680);
    std::vector<Shape> shapes = {{kInf, 1, 1, 1, 1, 1, 1},
                                 {kNan, 1, 1, 1, 1, 1, 1},
                                 {1e300, 1, -1e300, 1, 1, 1, 1},
                                 {1, -1, 5e-324, 0, 0, 0, 0},
                                 {1e308, 1e308, 1e308, 1e308, -1e308, -1e308, -1e308},
                                 {-1, -5, -8, -10, -8, -5, -1}};
    for (int i = 0; i < 500; ++i)
        std::ranges::generate(shapes.emplace_back(), [&] { return weight(generator); });
    for (const Shape &shape : shapes) {
        const double *values = shape.data();
        const double nm[3] = {centre(generator), centre(generator), centre(generator)};
        SetHiFiConstants(nm, values, values, values);
        SetHexachromeConstants(nm, values, values);
        double got_nm[3], got[7];
        for (int r = HIFI1_RESPONSE; r <= HEXACHROME2_RESPONSE; ++r) {
            const int status = r < HEXACHROME1_RESPONSE ? HIFI_STATUS : HEXACHROME_STATUS;
            EXPECT_EQ(row_sum(status, r), 100000) << r;
        }
        GetHiFiConstants(got_nm, nullptr, nullptr, got);
        EXPECT_EQ(got_nm[2], std::floor(nm[2] / 10) * 10);
        // half a weight of rounding in every band, and the centre takes those of all seven
        const double sum = std::accumulate(shape.begin(), shape.end(), 0.0);
        const bool ordinary = *std::ranges::max_element(shape) <= 3 && sum > 1 && shape[3] > 0.5;
        for (int j = 0; ordinary && j < 7; ++j)
            EXPECT_NEAR(got[j], shape[j] / shape[3],
                        sum / 1e5 / shape[3] * (0.5 + 3.5 * std::fabs(got[j])));
    }
    for (int status : {HIFI_STATUS, HEXACHROME_STATUS})
        for (int r = VISUAL_RESPONSE; r <= BLUE_RESPONSE; ++r)
            EXPECT_TRUE(std::ranges::equal(den_weight[status][r], den_weight[E_STATUS][r]));
}

TEST(SpectralX, AutomaticAndNamedBandsAgree)
{
    double window[] = {0.1, 0.5, 1, 0.5, 0.1};
    for (const Refl &ink : random_inks(200)) {
        DENSITYPOINT points[VANTREL_BANDS];
        int count = 0, band = 0, named = 0;
        double automatic = 0, asked = 0;
        ASSERT_EQ(FindMaxDensityPoints(ink.data(), points, &count), 1);
        ASSERT_EQ(CalculateSpectralXDensity(ink.data(), paper().data(), -1, &automatic, &band), 1);
        EXPECT_EQ(band, points[ChooseBPWavelen(ink.data(), points, count)].band);
        CalculateSpectralXDensity(ink.data(), paper().data(), band, &asked, &named);
        EXPECT_EQ(automatic, asked);
        EXPECT_EQ(band, named);
        for (int i = 0; i < count; ++i)
            EXPECT_EQ(points[i].density,
                      CalculateSpecialDensity(ink.data(), points[i].band, window, 5));
        for (int request = -1; request < VANTREL_BANDS; ++request) {
            CalculateSpectralXDensity(ink.data(), ink.data(), request, &asked, nullptr);
            EXPECT_EQ(asked, 0) << request;
        }
    }
}

TEST(Setters, RefuseNullsAsAWhole)
{
    const double one = 1, value = 7;
    SetHiFiConstants(nullptr, nullptr, kDefaultShape.data(), nullptr);
    SetHexachromeConstants(nullptr, kDefaultShape.data(), nullptr);
    SetSpectralXConstants(&value, &value, &one, &value, nullptr);
    SetSpectralXConstants(&value, &value, nullptr, &value, &value);
    SetAChromaticConstants(&value, &one, &value, nullptr);
    double nm[3], tolerance, inner, L1, L2, C1, C2 = -1;
    GetHiFiConstants(nm, nullptr, nullptr, nullptr);
    EXPECT_EQ(nm[1], 630);
    GetSpectralXConstants(&tolerance, nullptr, nullptr, &inner, nullptr);
    EXPECT_EQ(tolerance, 2);
    EXPECT_EQ(inner, 0.5);
    GetAChromaticConstants(&L1, &L2, nullptr, &C2);
    EXPECT_EQ(C2, -1);
    GetAChromaticConstants(&L1, &L2, &C1, &C2);
    EXPECT_EQ(L1, 84);
    EXPECT_EQ(C2, 11);
}
