// What a press sheet tells of its press: drift, and a model that is fitted to it.

#include "judge/calibrated.h"
#include "judge/colour.h"
#include "judge/trend.h"

#include <gtest/gtest.h>

#include <cmath>

using namespace vantrel::sheets;

namespace {

// Anscombe's first set (The American Statistician 27, 1973), whose x are 4 to 14, by x.
const Series anscombe = {4.26, 5.68, 7.24, 4.82, 6.95, 8.81, 8.04, 8.33, 10.84, 7.58, 9.96};

TEST(Trend, AnscombesFirstSet)
{
    const Trend trend = trend_of(anscombe).value();
    EXPECT_EQ(trend.count, 11U);
    EXPECT_NEAR(trend.mean, 7.5009, 5e-5);
    EXPECT_NEAR(trend.deviation.value(), 2.0316, 5e-5);
    EXPECT_NEAR(trend.drift->slope, 0.5001, 5e-5);
    EXPECT_NEAR(trend.drift->uncertainty, 0.1179 * 2.262, 2e-4);
    EXPECT_NEAR(trend.drift->at(-4), 3.0001, 5e-5);
    EXPECT_TRUE(trend.drift->significant());

    EXPECT_EQ(first_outside(anscombe, {.low = {}, .high = 8.5}), 5U);
    EXPECT_EQ(first_outside(anscombe, {.low = 4.9, .high = {}}), 0U);
    // 3.0001 + 0.5001 (4 + sheet) passes 12 at sheet 14.
    EXPECT_EQ(leaves_at(*trend.drift, {.low = {}, .high = 12}, anscombe, 10), 14U);
    EXPECT_FALSE(leaves_at(*trend.drift, {.low = {}, .high = 12}, anscombe, 3));
    EXPECT_FALSE(leaves_at(*trend.drift, {.low = 4, .high = {}}, anscombe, 10));
}

// Four times over, 44 readings: Student's t of 42 degrees of freedom is 2.0181.
TEST(Trend, BeyondTheTableOfStudentsT)
{
    Series series;
    for (int i = 0; i < 4; ++i)
        series.insert(series.end(), anscombe.begin(), anscombe.end());
    const Drift drift = trend_of(series)->drift.value();
    EXPECT_NEAR(drift.slope, 0.0310134, 1e-7);
    EXPECT_NEAR(drift.uncertainty, 0.0230459 * 2.0181, 1e-3 * drift.uncertainty);
}

TEST(Trend, SheetsWithoutTheReadingLeaveGaps)
{
    const Trend trend = trend_of({{}, 2, {}, 6, 8, {}}).value();
    EXPECT_EQ(trend.count, 3U);
    EXPECT_NEAR(trend.drift->slope, 2, 1e-12);
    EXPECT_NEAR(trend.drift->at(0), 0, 1e-12);
    EXPECT_FALSE(trend_of({{}, {}}));
    EXPECT_FALSE(trend_of({1, 2})->drift);
}

// The line may be outside before any reading is; one that comes back does not leave.
TEST(Trend, LeavesByTheLimitThatItRunsTo)
{
    const Limits limits{1.24, 1.498};
    const auto leaves = [&](const Series &series) {
        return leaves_at(*trend_of(series)->drift, limits, series, 10);
    };
    EXPECT_EQ(leaves({1.461, 1.470, 1.483, 1.490, 1.497, 1.497}), 6u);
    EXPECT_EQ(leaves({1.461, 1.470, 1.483, 1.490, 1.497, 1.505}), std::nullopt);
    EXPECT_EQ(leaves({1.540, 1.531, 1.519, 1.512, 1.503, 1.497}), std::nullopt);
    EXPECT_EQ(leaves({1.277, 1.270, 1.262, 1.258, 1.251, std::nullopt}), 6u);
}

TEST(Trend, OutlierAndDriftOfOneInkDoNotHideEachOther)
{
    const Series scatter = {0.001, -0.002, 0.002, 0, -0.001, 0.001, -0.002, 0.002, -0.001, 0};
    for (const double slope : {0.009, -0.006, 0.0})
        for (const std::size_t sheet : {0U, 4U, 8U})
            for (const double apart : {-0.15, 0.15}) {
                Series series = scatter;
                for (std::size_t i = 0; i < series.size(); ++i)
                    *series[i] += 1.4 + slope * static_cast<double>(i);
                *series[sheet] += apart;
                EXPECT_EQ(outliers_about_slope(series, 0.02), std::vector<std::size_t>{sheet});
                const Trend trend = trend_of(series, {sheet}).value();
                EXPECT_NEAR(trend.drift->slope, slope, 3e-4);
                EXPECT_EQ(trend.drift->significant(), slope != 0);
                EXPECT_EQ(trend.count, 10U);
                EXPECT_GT(trend.deviation.value(), 0.04);
            }
    // Where most readings are equal one is told from a few that repeat.
    EXPECT_EQ(outliers_of({1.5, 1.5, {}, 1.5, 1.53, 1.5}, 0.02), std::vector<std::size_t>{4});
    EXPECT_TRUE(outliers_of({1.5, 1.53, 1.5, 1.53, 1.5}, 0.02).empty());
    EXPECT_TRUE(outliers_of({1.5, 1.5, 1.5, 1.9}, 0.02).empty());
    EXPECT_TRUE(outliers_of({1.5, 1.5, 1.5, 1.5, 1.51}, 0.02).empty());
}

// A press that mixes by area at n = 2, with a dot gain of its own.
struct Press {
    static double area(double percent) { return std::pow(percent / 100, 0.7); }

    static Patch patch(double cyan, double yellow)
    {
        Patch patch;
        patch.name = "C" + std::to_string(cyan) + " Y" + std::to_string(yellow);
        patch.device = {{"CMYK_C", cyan}, {"CMYK_Y", yellow}};
        for (int band = 0; band < VANTREL_BANDS; ++band) {
            const double paper = 88 - 0.1 * band, blue = 60 - 1.7 * band, lemon = 6 + 2.4 * band;
            const double c = area(cyan), y = area(yellow);
            const double root = (1 - c) * (1 - y) * std::sqrt(paper) +
                                c * (1 - y) * std::sqrt(blue) + (1 - c) * y * std::sqrt(lemon) +
                                c * y * std::sqrt(blue * lemon / paper);
            patch.refl[band] = root * root;
        }
        return patch;
    }

    explicit Press(std::vector<std::pair<double, double>> combinations)
    {
        for (const auto &[cyan, yellow] : combinations)
            sheet.patches.push_back(patch(cyan, yellow));
    }

    double miss(double cyan, double yellow) const
    {
        const Inks inks(sheet, {});
        const CalibratedModel model(sheet, inks, sheet.patches[0].refl, D50_2DEG);
        const auto refl = model.predict({{0, cyan}, {1, yellow}});
        return delta_e00(lab_of(patch(cyan, yellow).refl, D50_2DEG), lab_of(*refl, D50_2DEG));
    }

    Measurement sheet;
};

const std::vector<std::pair<double, double>> strip = {{0, 0},   {25, 0},    {50, 0},  {75, 0},
                                                      {100, 0}, {0, 25},    {0, 50},  {0, 75},
                                                      {0, 100}, {100, 100}, {25, 50}, {75, 75}};

TEST(CalibratedModel, FindsTheFactorAndTheDotsOfThePress)
{
    const Press press(strip);
    const Inks inks(press.sheet, {});
    const CalibratedModel model(press.sheet, inks, press.sheet.patches[0].refl, D50_2DEG);
    EXPECT_EQ(model.n_factor(), 2);
    EXPECT_EQ(model.error()->patches, 2U);
    EXPECT_LT(model.error()->de00.max, 1e-6);
    EXPECT_LT(press.miss(50, 75), 1e-6); // not on the sheet
    EXPECT_LT(press.miss(60, 30), 0.3);  // between its tints
    EXPECT_TRUE(model.lacking({{0, 50}, {1, 75}}).empty());
    EXPECT_FALSE(model.predict({}));
}

TEST(CalibratedModel, LeavesOutThePatchItPredicts)
{
    Press press(strip);
    press.sheet.patches.push_back(Press::patch(50, 100));
    press.sheet.patches.back().refl.fill(3); // a blot
    EXPECT_GT(press.miss(50, 75), 3);        // it makes a cell
    EXPECT_LT(press.miss(50, 100), 1.1);     // save for n, which it moves
}

TEST(CalibratedModel, SaysWhatTheSheetLacks)
{
    Press press({{0, 0}, {50, 0}, {100, 0}, {0, 100}});
    const Inks inks(press.sheet, {});
    const CalibratedModel model(press.sheet, inks, press.sheet.patches[0].refl, D50_2DEG);
    EXPECT_FALSE(model.error());
    EXPECT_EQ(model.lacking({{0, 50}, {1, 75}}),
              (std::vector<std::string>{"no tints of CMYK_Y: its dots are as large as asked for",
                                        "no overprint of CMYK_C + CMYK_Y: taken as films"}));
    press.sheet.patches.erase(press.sheet.patches.begin() + 1);
    EXPECT_THROW(CalibratedModel(press.sheet, inks, press.sheet.patches[0].refl, D50_2DEG),
                 RequestError);
}

} // namespace
