// Densitometry beside a plain C loop, and what a whole measurement costs in single densities.
#include "plain.h"
#include "rows.h"

#include "vantrel.h"

#include <array>
#include <cmath>
#include <random>
#include <vector>

namespace {

using Refl = std::array<double, VANTREL_BANDS>;

struct Print {
    Refl solid, tint, paper;
};

/// Inks with one smooth absorption on a paper: solid and 50 % tint.
std::vector<Print> prints()
{
    std::mt19937 generator(2);
    std::uniform_real_distribution<double> position(0, 30), width(3, 8), depth(0.7, 0.95);
    std::vector<Print> result(1024);
    for (auto &[solid, tint, paper] : result) {
        const double p = position(generator), w = width(generator), d = depth(generator);
        for (int i = 0; i < VANTREL_BANDS; ++i) {
            paper[i] = 85 + 0.1 * i;
            solid[i] = paper[i] * (1 - d * std::exp(-(i - p) * (i - p) / (w * w)));
            tint[i] = (solid[i] + paper[i]) / 2;
        }
    }
    return result;
}

/// What an instrument reads in four channels when its filter removes half a percent of reflectance.
std::array<double, 4> filtered(const Refl &refl, const Refl (&channels)[4])
{
    std::array<double, 4> targets{};
    for (int c = 0; c < 4; ++c)
        for (int i = 0; i < VANTREL_BANDS; ++i)
            targets[c] += channels[c][i] * (refl[i] - 0.5);
    return targets;
}

} // namespace

void density_rows()
{
    static const auto inks = prints();
    static const auto print = [](unsigned i) -> const Print & { return inks[i % inks.size()]; };
    const std::string density = "ReflToDensity";
    compare(
        density, 1.0,
        [](unsigned i) {
            double result;
            ReflToDensity(print(i).solid.data(), print(i).paper.data(), E_STATUS, RED_RESPONSE,
                          &result);
            return result;
        },
        "plain C loop",
        [](unsigned i) {
            double result;
            plain_density(print(i).solid.data(), print(i).paper.data(),
                          den_weight[E_STATUS][RED_RESPONSE], &result);
            return result;
        });

    measure("ReflToDensities", [](unsigned i) {
        DENSITYSTRUCT set;
        ReflToDensities(print(i).solid.data(), print(i).paper.data(), E_STATUS, &set);
        return set.density[RED_RESPONSE];
    });
    add_ratio("ReflToDensities", density);

    measure("DetermineDensityResponse", [](unsigned i) {
        return DetermineDensityResponse(print(i).solid.data(), E_STATUS, print(i).paper.data());
    });
    add_ratio("DetermineDensityResponse", density, 8);

    static Refl channels[4];
    for (int c = 0; c < 4; ++c)
        GetNormalizedDensityWeights(c < 3 ? E_STATUS : T_STATUS, c < 3 ? RED_RESPONSE + c : 3,
                                    channels[c].data(), nullptr, nullptr, nullptr);
    static const POLWEIGHTSTRUCT weights = {channels[0].data(), channels[1].data(),
                                            channels[2].data(), channels[3].data()};
    struct Targets {
        std::array<double, 4> solid, tint, paper;
    };
    static const auto targets = [] {
        std::vector<Targets> result;
        for (const auto &[solid, tint, paper] : inks)
            result.push_back(
                {filtered(solid, channels), filtered(tint, channels), filtered(paper, channels)});
        return result;
    }();
    measure("PolReflToDotGain", [](unsigned i) {
        const auto &[solid, tint, paper] = print(i);
        const Targets &target = targets[i % inks.size()];
        double gain = 0;
        PolReflToDotGain(solid.data(), target.solid.data(), tint.data(), target.tint.data(),
                         paper.data(), target.paper.data(), &weights, E_STATUS, RED_RESPONSE, 1, 50,
                         &gain);
        return gain;
    });
    add_ratio("PolReflToDotGain", density);
}
