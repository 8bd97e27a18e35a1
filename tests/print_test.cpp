// Properties of the print attributes and of the polarised readings: each function is the chain that
// it stands for to the last bit, and inverse pairs come back.
#include "golden.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <random>

namespace {

using Refl = std::array<double, VANTREL_BANDS>;
using Targets = std::array<double, 4>;

Refl named(const char *name)
{
    Refl refl;
    std::ranges::copy(golden_values(name), refl.begin());
    return refl;
}

// A real two-ink print.
struct Print {
    Refl paper = named("paper"), magenta = named("magenta"), yellow = named("yellow"),
         overprint = named("magenta_yellow"), magenta50 = named("magenta50");
};

const Print &print()
{
    static const Print patches;
    return patches;
}

// Every status with every response (wavelength, band) that it takes.
template <class Check> void for_each_filter(Check check)
{
    for (int status = 0; status < NUM_STATUSES; ++status) {
        const bool spectral = status == SPECTRAL_STATUS;
        const int last = spectral ? 700 : status == SPECTRALX_STATUS ? 28 : NUM_RESPONSES - 1;
        for (int response = spectral ? 400 : 0; response <= last; response += spectral ? 50 : 1) {
            SCOPED_TRACE("status " + std::to_string(status) + " response " +
                         std::to_string(response));
            check(status, response);
        }
    }
}

double density(const Refl &refl, const Refl *paper, int status, int response)
{
    double result = -1;
    EXPECT_EQ(
        ReflToDensity(refl.data(), paper ? paper->data() : nullptr, status, response, &result), 1);
    return result;
}

struct HueGray {
    double grayness, hue_error;
    bool operator==(const HueGray &) const = default;
};

/// What a function of one result returned and wrote.
struct Outcome {
    int returned;
    double value;
    bool operator==(const Outcome &) const = default;
};

template <class Function, class... Arguments>
Outcome outcome(Function function, Arguments... arguments)
{
    Outcome result = {};
    result.returned = function(arguments..., &result.value);
    return result;
}

} // namespace

TEST(DotArea, TintDensityComesBack)
{
    for (double solid : {0.3, 1.0, 1.4, 2.2})
        for (double part : {0.1, 0.5, 0.9, 1.0})
            for (double n : {1.0, 1.7, 2.0, -1.0}) {
                double area, back;
                ASSERT_EQ(DensityToDotArea(solid, part * solid, n, &area), 1);
                ASSERT_EQ(DensityFromDotArea(solid, area, n, &back), 1);
                ASSERT_NEAR(back, part * solid, 5e-8 * part * solid);
            }
}

TEST(PrintAttributes, AreTheChainOverTheDensities)
{
    const Print &p = print();
    for (const Refl *paper : {static_cast<const Refl *>(nullptr), &p.paper})
        for_each_filter([&](int status, int response) {
            const double *over = paper ? paper->data() : nullptr;
            const double solid = density(p.magenta, paper, status, response);
            const double tint = density(p.magenta50, paper, status, response);
            const double first = density(p.yellow, paper, status, response);
            const double overprint = density(p.overprint, paper, status, response);
            const Outcome area = outcome(DensityToDotArea, solid, tint, 1.7);
            EXPECT_EQ(outcome(ReflToDotArea, p.magenta.data(), p.magenta50.data(), over, status,
                              response, 1.7),
                      area);
            EXPECT_EQ(outcome(ReflToDotGain, p.magenta.data(), p.magenta50.data(), over, status,
                              response, 1.7, 50),
                      (Outcome{1, std::fmax(area.value - 50, 0)}));
            EXPECT_EQ(outcome(ReflToPrintContrast, p.magenta.data(), p.magenta50.data(), over,
                              status, response),
                      outcome(DensityToPrintContrast, solid, tint));
            EXPECT_EQ(outcome(ReflToTrap, p.magenta.data(), p.yellow.data(), p.overprint.data(),
                              over, status, response),
                      outcome(DensityToTrap, overprint, solid, first));
        });
}

TEST(IntegratedRefl, IsTheSpectrumUnderTheNormalisedFilter)
{
    for_each_filter([](int status, int response) {
        Refl weights;
        const bool plain = status != SPECTRAL_STATUS && status != SPECTRALX_STATUS &&
                           status != CCR2_STATUS && response != VISUAL_RESPONSE;
        if (!plain || !GetNormalizedDensityWeights(status, response, weights.data(), nullptr,
                                                   nullptr, nullptr))
            return;
        double sum = 0, integrated;
        for (int i = 0; i < VANTREL_BANDS; ++i)
            sum += print().overprint[i] * weights[i] / 100;
        DensitytoIntegratedRefl(density(print().overprint, nullptr, status, response), status,
                                response, &integrated);
        EXPECT_NEAR(integrated, sum, 1e-11 * sum);
    });
}

TEST(PolIntercept, IsZeroForTheSpectrumsOwnDensities)
{
    for (const Refl &refl : {print().paper, print().magenta, print().yellow, print().overprint}) {
        double intercept = 1;
        ReflToPolIntercept(refl.data(), density(refl, nullptr, E_STATUS, RED_RESPONSE),
                           density(refl, nullptr, E_STATUS, GREEN_RESPONSE),
                           density(refl, nullptr, E_STATUS, BLUE_RESPONSE), &intercept);
        EXPECT_NEAR(intercept, 0, 1e-9);
    }
}

namespace {

// Box-shaped curves, so that readings are plain sums.
const double *curve(std::size_t channel)
{
    static const std::vector<double> curves = golden_values("pol_weights");
    return &curves[VANTREL_BANDS * channel];
}

const POLWEIGHTSTRUCT *weights()
{
    static const POLWEIGHTSTRUCT curves = {curve(0), curve(1), curve(2), curve(3)};
    return &curves;
}

double reading(const Refl &refl, int channel)
{
    double sum = 0;
    for (int i = 0; i < VANTREL_BANDS; ++i)
        sum += curve(channel)[i] * refl[i];
    return sum;
}

Targets targets_at(const Refl &refl, Targets factors)
{
    for (int channel = 0; channel < 4; ++channel)
        factors[channel] *= reading(refl, channel);
    return factors;
}

// A patch, its targets, and the patch as it is adjusted.
struct Patch {
    Refl refl;
    Targets targets;
    Refl adjusted = {};

    Patch(const Refl &refl_, const Targets &factors)
        : refl(refl_), targets(targets_at(refl_, factors))
    {
        EXPECT_EQ(PolReflAutoAdjust(refl.data(), targets.data(), adjusted.data(), weights()), 1);
    }
    const double *r() const { return refl.data(); }
    const double *t() const { return targets.data(); }
    const double *a() const { return adjusted.data(); }
};

void expect_polarised_is_plain_of_adjusted(const Targets &factors)
{
    const Patch paper(print().paper, factors), solid(print().magenta, factors),
        tint(print().magenta50, factors), first(print().yellow, factors),
        overprint(print().overprint, factors);
    for_each_filter([&](int s, int r) {
        EXPECT_EQ(
            outcome(PolReflToDensity, solid.r(), solid.t(), paper.r(), paper.t(), weights(), s, r),
            outcome(ReflToDensity, solid.a(), paper.a(), s, r));
        EXPECT_EQ(outcome(PolReflToDotArea, solid.r(), solid.t(), tint.r(), tint.t(), paper.r(),
                          paper.t(), weights(), s, r, 1.7),
                  outcome(ReflToDotArea, solid.a(), tint.a(), paper.a(), s, r, 1.7));
        EXPECT_EQ(outcome(PolReflToDotGain, solid.r(), solid.t(), tint.r(), tint.t(), nullptr,
                          nullptr, weights(), s, r, 1.7, 50),
                  outcome(ReflToDotGain, solid.a(), tint.a(), nullptr, s, r, 1.7, 50));
        EXPECT_EQ(outcome(PolReflToPrintContrast, solid.r(), solid.t(), tint.r(), tint.t(),
                          paper.r(), paper.t(), weights(), s, r),
                  outcome(ReflToPrintContrast, solid.a(), tint.a(), paper.a(), s, r));
        EXPECT_EQ(outcome(PolReflToTrap, solid.r(), solid.t(), first.r(), first.t(), overprint.r(),
                          overprint.t(), paper.r(), paper.t(), weights(), s, r),
                  outcome(ReflToTrap, solid.a(), first.a(), overprint.a(), paper.a(), s, r));
    });
    for (int status = 0; status < NUM_STATUSES; ++status)
        EXPECT_EQ(PolDetermineDensityResponse(solid.r(), solid.t(), status, paper.r(), paper.t(),
                                              weights()),
                  DetermineDensityResponse(solid.a(), status, paper.a()));
}

} // namespace

TEST(Polarised, IsThePlainFunctionOfTheAdjustedSpectra)
{
    expect_polarised_is_plain_of_adjusted({0.9, 0.8, 0.7, 0.6});
    expect_polarised_is_plain_of_adjusted({0.5, 0.95, 0.85, 1.0});
}

TEST(Polarised, ChangesNothingWhenEveryFactorIsOne)
{
    constexpr Targets one = {1, 1, 1, 1};
    const Patch paper(print().paper, one), solid(print().magenta, one);
    EXPECT_EQ(paper.adjusted, print().paper);
    EXPECT_EQ(solid.adjusted, print().magenta);
    expect_polarised_is_plain_of_adjusted(one);
    for (int status = 0; status < NUM_STATUSES; ++status) {
        if (status == CCR1_STATUS)
            continue; // a plain set is corrected, single densities are not
        DENSITYSTRUCT set, plain_set;
        EXPECT_EQ(
            PolReflToDensities(solid.r(), solid.t(), paper.r(), paper.t(), weights(), status, &set),
            1);
        EXPECT_EQ(ReflToDensities(solid.r(), paper.r(), status, &plain_set), 1);
        EXPECT_TRUE(std::ranges::equal(set.density, plain_set.density)) << status;
        double gray = 0, hue = 0, plain_gray = 0, plain_hue = 0;
        EXPECT_EQ(PolReflToHueGray(solid.r(), solid.t(), paper.r(), paper.t(), weights(), status,
                                   &gray, &hue),
                  ReflToHueGray(solid.r(), paper.r(), status, &plain_gray, &plain_hue));
        EXPECT_EQ(gray, plain_gray) << status;
        EXPECT_EQ(hue, plain_hue) << status;
    }
}

TEST(PolReflAdjust, MeetsItsTargetAndWorksInPlace)
{
    const Targets targets = targets_at(print().overprint, {0.9, 0.8, 0.7, 0.6});
    for (int response : {RED_RESPONSE, GREEN_RESPONSE}) {
        Refl adjusted, in_place = print().overprint;
        ASSERT_EQ(PolReflAdjust(print().overprint.data(), response, targets.data(), adjusted.data(),
                                weights()),
                  1);
        PolReflAdjust(in_place.data(), response, targets.data(), in_place.data(), weights());
        EXPECT_EQ(in_place, adjusted);
        EXPECT_NEAR(reading(adjusted, response - 1), targets[response - 1], 1e-9);
    }
}

// The paper is adjusted a second time with a factor of 1 give or take rounding. Where rounding
// makes it exceed 1, which the strict adjustment refuses, it counts as exactly 1.
TEST(PolReflToHueGray, TakesRoundingNoiseForOne)
{
    std::mt19937 generator(5);
    std::uniform_real_distribution<double> factor(0.5, 0.99), band(-1, 1);
    const Patch solid(print().magenta, {0.9, 0.8, 0.7, 0.6});
    const auto hue_gray = [&](const Refl &paper, const Targets &targets) {
        HueGray result = {};
        EXPECT_EQ(PolReflToHueGray(solid.r(), solid.t(), paper.data(), targets.data(), weights(),
                                   E_STATUS, &result.grayness, &result.hue_error),
                  1);
        return result;
    };
    int refused = 0;
    for (int round = 0; round < 300; ++round) {
        Refl refl = print().paper;
        for (double &value : refl)
            value += band(generator);
        const Patch paper(
            refl, {factor(generator), factor(generator), factor(generator), factor(generator)});
        const auto result = hue_gray(paper.refl, paper.targets);
        Refl twice;
        if (!PolReflAutoAdjust(paper.a(), paper.t(), twice.data(), weights())) {
            ++refused;
            EXPECT_EQ(result, hue_gray(paper.adjusted, targets_at(paper.adjusted, {1, 1, 1, 1})));
        }
    }
    EXPECT_GT(refused, 0);
}
