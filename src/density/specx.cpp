// The exported SpectralX densities and the achromatic test.
#include "vantrel.h"

#include "base/require.h"
#include "colorimetry/lab.h"
#include "density/achromatic.h"
#include "density/spectralx.h"
#include "density/weighted.h"

#include <algorithm>

using namespace vantrel;

int CalculateSpectralXDensity(const double *refl, const double *paper, int request, double *density,
                              int *band)
{
    VANTREL_REQUIRE(refl && (density || request != VISUAL_RESPONSE), "0");
    if (request == VISUAL_RESPONSE) {
        *density = weighted_density(spectrum(refl), vantrel::paper(paper), T_STATUS, request);
        return 1;
    }
    const int read = band_to_read(spectrum(refl), request);
    if (density)
        *density = band_density(spectrum(refl), vantrel::paper(paper), read);
    if (band)
        *band = read;
    return 1;
}

int FindMaxDensityPoints(const double *refl, DENSITYPOINT *points, int *count)
{
    VANTREL_REQUIRE(refl && points && count, "0");
    const Peaks peaks = absorption_peaks(spectrum(refl));
    std::copy_n(peaks.points.begin(), peaks.count, points);
    *count = peaks.count;
    return 1;
}

int ChooseBPWavelen(const double *refl, const DENSITYPOINT *points, int count)
{
    VANTREL_REQUIRE(refl && points && count > 0, "0");
    const std::span peaks(points, static_cast<std::size_t>(count));
    VANTREL_REQUIRE(
        std::all_of(peaks.begin(), peaks.end(),
                    [](const DENSITYPOINT &p) { return p.band >= 0 && p.band < kBands; }),
        "0");
    return choose_peak(spectrum(refl), peaks);
}

double CalculateSpecialDensity(const double *refl, int centre, double *weights, int width)
{
    VANTREL_REQUIRE(refl && weights && width >= 0, "0");
    VANTREL_REQUIRE(centre >= width / 2 && centre < kBands && centre - width / 2 + width <= kBands,
                    "0");
    return window_density(spectrum(refl), centre - width / 2,
                          std::span(weights, static_cast<std::size_t>(width)));
}

void SetSpectralXConstants(const double *tolerance, const double *reserved, const double *centre,
                           const double *inner, const double *outer)
{
    VANTREL_REQUIRE_ELSE(tolerance && reserved && centre && inner && outer, "0", );
    VANTREL_REQUIRE_ELSE(*centre == 1.0, "SpectralXWeights[2] == 1.0", );
    set_spectralx_constants({*tolerance, *reserved, *centre, *inner, *outer});
}

void GetSpectralXConstants(double *tolerance, double *reserved, double *centre, double *inner,
                           double *outer)
{
    const SpectralXConstants &constants = spectralx_constants();
    if (tolerance)
        *tolerance = constants.tolerance;
    if (reserved)
        *reserved = constants.reserved;
    if (centre)
        *centre = constants.centre;
    if (inner)
        *inner = constants.inner;
    if (outer)
        *outer = constants.outer;
}

int IsChromatic(const double *refl, uint8_t illumObs)
{
    VANTREL_REQUIRE(refl, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    const Lab lab = rounded(lab_from_spectrum(spectrum(refl), static_cast<ILLUM_OBS>(illumObs)));
    return is_chromatic(lab.L, chroma(lab));
}

int IsChromaticLCH(const double *lch)
{
    VANTREL_REQUIRE(lch, "0");
    return is_chromatic(lch[0], lch[1]);
}

void SetAChromaticConstants(const double *L1, const double *L2, const double *C1, const double *C2)
{
    VANTREL_REQUIRE_ELSE(L1 && L2 && C1 && C2, "0", );
    VANTREL_REQUIRE_ELSE(set_achromatic_points({*L1, *L2, *C1, *C2}), "0", );
}

void GetAChromaticConstants(double *L1, double *L2, double *C1, double *C2)
{
    VANTREL_REQUIRE_ELSE(L1 && L2 && C1 && C2, "0", );
    const AchromaticPoints &points = achromatic_points();
    *L1 = points.L1;
    *L2 = points.L2;
    *C1 = points.C1;
    *C2 = points.C2;
}
