// Colorimetry and colour difference beside a plain C loop and Little CMS.
#include "plain.h"
#include "rows.h"

#include "vantrel.h"

#include <array>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <lcms2.h>
#include <random>
#include <vector>

namespace {

constexpr unsigned kInputs = 1024;
using Refl = std::array<double, VANTREL_BANDS>;

std::vector<Refl> spectra()
{
    std::mt19937 generator(1);
    std::uniform_real_distribution<double> percent(0, 100);
    std::vector<Refl> result(kInputs + 1);
    for (Refl &refl : result)
        for (double &band : refl)
            band = percent(generator);
    return result;
}

struct Weights {
    int rows[3][VANTREL_BANDS];
};

// The weights of a combination, read band by band: a reflectance of 100 000 at one band yields the
// weight itself.
Weights weights(ILLUM_OBS illum_obs)
{
    Weights result;
    for (int i = 0; i < VANTREL_BANDS; ++i) {
        Refl refl{};
        double xyz[3];
        refl[i] = 100000;
        ReflToXYZ(refl.data(), illum_obs, xyz);
        for (int c = 0; c < 3; ++c)
            result.rows[c][i] = static_cast<int>(xyz[c]);
    }
    return result;
}

std::vector<CIELABCOORD> colours()
{
    std::mt19937 generator(3);
    std::uniform_real_distribution<double> lightness(0, 100), chroma(-90, 90);
    std::vector<CIELABCOORD> result(kInputs + 1);
    for (CIELABCOORD &lab : result)
        lab = {lightness(generator), chroma(generator), chroma(generator)};
    return result;
}

/// A faster way counts only with the same bits.
void expect_same_bits(const std::vector<Refl> &refls, const Weights &weights)
{
    for (const Refl &refl : refls) {
        double ours[3], theirs[3];
        ReflToXYZ(refl.data(), D50_2DEG, ours);
        plain_xyz(refl.data(), weights.rows, theirs);
        if (std::memcmp(ours, theirs, sizeof ours) != 0) {
            std::fputs("ReflToXYZ and the plain loop differ\n", stderr);
            std::exit(1);
        }
    }
}

} // namespace

void colour_rows()
{
    static const auto refls = spectra();
    static const auto plain_weights = weights(D50_2DEG);
    expect_same_bits(refls, plain_weights);
    compare(
        "ReflToXYZ", 0.75,
        [](unsigned i) {
            std::array<double, 3> xyz;
            ReflToXYZ(refls[i % kInputs].data(), D50_2DEG, xyz.data());
            return xyz;
        },
        "plain C loop",
        [](unsigned i) {
            std::array<double, 3> xyz;
            plain_xyz(refls[i % kInputs].data(), plain_weights.rows, xyz.data());
            return xyz;
        });

    static const auto xyzs = [] {
        std::vector<cmsCIEXYZ> result(kInputs);
        for (unsigned i = 0; i < kInputs; ++i)
            ReflToXYZ(refls[i].data(), D50_2DEG, &result[i].X);
        return result;
    }();
    static const cmsCIEXYZ white = {96.422, 100, 82.521};
    compare(
        "XYZToCIELab", 1.0,
        [](unsigned i) {
            CIELABCOORD lab;
            XYZToCIELab(&xyzs[i % kInputs].X, D50_2DEG, &lab.L);
            return lab.L;
        },
        "Little CMS",
        [](unsigned i) {
            cmsCIELab lab;
            cmsXYZ2Lab(&white, &lab, &xyzs[i % kInputs]);
            return lab.L;
        });

    static const auto labs = colours();
    static const auto cms_labs = [] {
        std::vector<cmsCIELab> result;
        for (const CIELABCOORD &lab : labs)
            result.push_back({lab.L, lab.a, lab.b});
        return result;
    }();
    compare(
        "LabToDE2000", 0.8,
        [](unsigned i) {
            double dE;
            LabToDE2000(&labs[i % kInputs], &labs[i % kInputs + 1], 1, 1, &dE);
            return dE;
        },
        "Little CMS",
        [](unsigned i) {
            return cmsCIE2000DeltaE(&cms_labs[i % kInputs], &cms_labs[i % kInputs + 1], 1, 1, 1);
        });
    compare(
        "LabToDEcmc", 0.8,
        [](unsigned i) {
            double dE;
            LabToDEcmc(&labs[i % kInputs], &labs[i % kInputs + 1], 2, 1, &dE);
            return dE;
        },
        "Little CMS",
        [](unsigned i) {
            return cmsCMCdeltaE(&cms_labs[i % kInputs], &cms_labs[i % kInputs + 1], 2, 1);
        });
    compare(
        "LabToDE94", 0.2,
        [](unsigned i) {
            double dE;
            LabToDE94(&labs[i % kInputs], &labs[i % kInputs + 1], 1, 1, &dE);
            return dE;
        },
        "Little CMS",
        [](unsigned i) {
            return cmsCIE94DeltaE(&cms_labs[i % kInputs], &cms_labs[i % kInputs + 1]);
        });
}
