// Properties of the print attributes: each function is the chain that
// it stands for to the last bit, and inverse pairs come back.
#include "golden.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>

namespace {

using Refl = std::array<double, VANTREL_BANDS>;

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
