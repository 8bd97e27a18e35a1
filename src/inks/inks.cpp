// The exported estimates of printed inks.
#include "vantrel.h"

#include "base/require.h"
#include "colorimetry/display.h"
#include "colorimetry/illuminants.h"
#include "colorimetry/lab.h"
#include "colorimetry/spaces.h"
#include "inks/error_weights.h"
#include "inks/estimate.h"
#include "inks/film.h"
#include "inks/overprint.h"
#include "inks/saunderson.h"
#include "inks/tint.h"

#include <algorithm>
#include <array>
#include <cstddef>

using namespace vantrel;

double Saunderson(double refl, double k1, double k2) { return saunderson(refl, k1, k2); }

double UnSaunderson(double refl, double k1, double k2) { return unsaunderson(refl, k1, k2); }

void EstimateReflsForThickness(const double *ink, double thickness, const double *paper,
                               double *refl)
{
    store(film(spectrum(ink), thickness, spectrum(paper)), refl);
}

void EstimateReflsForTintColorForBestVisualColor(const double *ink, int percent,
                                                 const double *paper, double *refl)
{
    store(film_tint(spectrum(ink), percent, spectrum(paper)), refl);
}

void EstimateReflsForTintColor(const double *ink, int percent, const double *paper, double *refl)
{
    store(halftone_tint(spectrum(ink), percent, spectrum(paper)), refl);
}

int CombineInkColors(const double *first, const double *second, double *refl)
{
    VANTREL_REQUIRE(first && second && refl, "0");
    store(overprint(spectrum(first), spectrum(second)), refl);
    return 1;
}

int Combine3InkColors(const double *first, const double *second, const double *third, double *refl)
{
    VANTREL_REQUIRE(first && second && third && refl, "0");
    store(overprint(overprint(spectrum(first), spectrum(second)), spectrum(third)), refl);
    return 1;
}

int CombineInkColorsEx(const double *first, const double *second, double *lab)
{
    VANTREL_REQUIRE(first && second && lab, "0");
    store(mean(lab_of(first), lab_of(second)), lab);
    return 1;
}

int Combine3InkColorsEx(const double *first, const double *second, const double *third, double *lab)
{
    VANTREL_REQUIRE(first && second && third && lab, "0");
    store(mean(lab_of(first), lab_of(second), lab_of(third)), lab);
    return 1;
}

static constexpr int kMostInks = 3;

static bool is_ink_count(int n) { return n >= 1 && n <= kMostInks; }

static bool is_percentage(int percent) { return percent >= 0 && percent <= 100; }

static bool are_percentages(Percentages percent)
{
    return std::all_of(percent.begin(), percent.end(), is_percentage);
}

// The four estimates, as the function of that name.
static int store_estimate(const char *function, int n, const double *inks, const int *percent,
                          const double *paper, TintModel tint, double *refl)
{
    VANTREL_REQUIRE_OF(function, paper, "pdPaperRefls");
    VANTREL_REQUIRE_OF(function, percent, "piPercent");
    VANTREL_REQUIRE_OF(function, refl, "pdEstimatedRefls");
    VANTREL_REQUIRE_OF(function, inks && is_ink_count(n), "0");
    const Percentages percentages(percent, n);
    VANTREL_REQUIRE_OF(function, are_percentages(percentages), "0");
    store(estimate(inks, percentages, spectrum(paper), tint), refl);
    return 1;
}

int EstimateRefls(int n, const double *inks, const int *percent, const double *paper, double *refl)
{
    return store_estimate(__func__, n, inks, percent, paper, halftone_tint, refl);
}

int EstimateReflsForBestVisualColor(int n, const double *inks, const int *percent,
                                    const double *paper, double *refl)
{
    return store_estimate(__func__, n, inks, percent, paper, film_tint, refl);
}

using PackedInks = std::array<double, std::size_t{kMostInks} * kBands>;

// The first n inks one after the other; one that is missing reflects nothing.
static PackedInks packed(int n, const double *first, const double *second, const double *third)
{
    PackedInks inks{};
    std::copy_n(first, kBands, inks.begin());
    if (n >= 2 && second)
        std::copy_n(second, kBands, inks.begin() + kBands);
    if (n >= 3 && third)
        std::copy_n(third, kBands, inks.end() - kBands);
    return inks;
}

int EstimateReflsEx(int n, const double *first, const double *second, const double *third,
                    const int *percent, const double *paper, double *refl)
{
    VANTREL_REQUIRE(first, "0");
    const PackedInks inks = packed(n, first, second, third);
    return store_estimate(__func__, n, inks.data(), percent, paper, halftone_tint, refl);
}

int EstimateReflsExForBestVisualColor(int n, const double *first, const double *second,
                                      const double *third, const int *percent, const double *paper,
                                      double *refl)
{
    VANTREL_REQUIRE(first, "0");
    const PackedInks inks = packed(n, first, second, third);
    return store_estimate(__func__, n, inks.data(), percent, paper, film_tint, refl);
}

int EstimateColor(int n, const double *inks, const int *percent, const double *paper, double *lab)
{
    VANTREL_REQUIRE(inks && paper && percent && lab, "0");
    VANTREL_REQUIRE(is_ink_count(n), "0");
    const Percentages percentages(percent, n);
    VANTREL_REQUIRE(are_percentages(percentages), "0");
    store(estimate_colour(inks, percentages, lab_of(paper)), lab);
    return 1;
}

int EstimateTintColor(const double *ink, int percent, const double *paper, double *lab)
{
    VANTREL_REQUIRE(ink && paper && lab, "0");
    VANTREL_REQUIRE(is_percentage(percent), "0");
    store(colour_tint(lab_of(ink), percent, lab_of(paper)), lab);
    return 1;
}

int CalculateTintColor(const double *ink, const double *paper, int percent, int illumObs,
                       unsigned int *rgb)
{
    VANTREL_REQUIRE(ink && paper && rgb, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    const auto illum_obs = static_cast<ILLUM_OBS>(illumObs);
    const Lab tint = preview_tint(lab_from_spectrum(spectrum(ink), illum_obs), percent,
                                  lab_from_spectrum(spectrum(paper), illum_obs));
    *rgb = rgb_from_xyz(xyz_from_lab(tint, white_point(illum_obs)));
    return 1;
}

int ReflToABErrorWeights(const double *first, const double *second, int illumObs, double *a,
                         double *b)
{
    VANTREL_REQUIRE(first && second, "0");
    VANTREL_REQUIRE(a || b, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    const auto illum_obs = static_cast<ILLUM_OBS>(illumObs);
    const BandDifferences difference =
        band_differences(spectrum(first), spectrum(second), illum_obs);
    if (a)
        store(a_error_weights(difference, white_point(illum_obs)), a);
    if (b)
        store(b_error_weights(difference, white_point(illum_obs)), b);
    return 1;
}
