// Densities, print attributes, and readings through a polarisation filter.
#include "rows.h"

namespace {

// Functions of one paper, which may be missing.

int refl_to_density(const double *refl, Optional paper, int status, int response, double *density)
{
    return ReflToDensity(refl, paper.values, status, response, density);
}
int refl_to_densities(const double *refl, Optional paper, int status, DENSITYSTRUCT *densities)
{
    return ReflToDensities(refl, paper.values, status, densities);
}
int determine_density_response(const double *refl, int status, Optional paper)
{
    return DetermineDensityResponse(refl, status, paper.values);
}
int calculate_ccr_densities(const double *refl, Optional paper, int status,
                            DENSITYSTRUCT *densities)
{
    return CalculateCCRDensities(refl, paper.values, status, densities->density);
}
int calculate_spectralx_density(const double *refl, Optional paper, int request, double *density,
                                int *band)
{
    *band = -1; // not written for request 0
    return CalculateSpectralXDensity(refl, paper.values, request, density, band);
}
int refl_to_dot_area(const double *solid, const double *tint, Optional paper, int status,
                     int response, double n_factor, double *area)
{
    return ReflToDotArea(solid, tint, paper.values, status, response, n_factor, area);
}
int refl_to_dot_gain(const double *solid, const double *tint, Optional paper, int status,
                     int response, double n_factor, int nominal, double *gain)
{
    return ReflToDotGain(solid, tint, paper.values, status, response, n_factor, nominal, gain);
}
int refl_to_print_contrast(const double *solid, const double *tint, Optional paper, int status,
                           int response, double *contrast)
{
    return ReflToPrintContrast(solid, tint, paper.values, status, response, contrast);
}
int refl_to_trap(const double *second, const double *first, const double *overprint, Optional paper,
                 int status, int response, double *trap)
{
    return ReflToTrap(second, first, overprint, paper.values, status, response, trap);
}
int refl_to_hue_gray(const double *refl, Optional paper, int status, double *gray, double *hue)
{
    return ReflToHueGray(refl, paper.values, status, gray, hue);
}

using Weights = const POLWEIGHTSTRUCT *;

int pol_determine_density_response(const double *refl, const double *targets, int status,
                                   Optional paper, const double *paper_targets, Weights weights)
{
    return PolDetermineDensityResponse(refl, targets, status, paper.values, paper_targets, weights);
}
int pol_refl_to_density(const double *refl, const double *targets, Optional paper,
                        const double *paper_targets, Weights weights, int status, int response,
                        double *density)
{
    return PolReflToDensity(refl, targets, paper.values, paper_targets, weights, status, response,
                            density);
}
int pol_refl_to_densities(const double *refl, const double *targets, Optional paper,
                          const double *paper_targets, Weights weights, int status,
                          DENSITYSTRUCT *densities)
{
    return PolReflToDensities(refl, targets, paper.values, paper_targets, weights, status,
                              densities);
}
int pol_refl_to_hue_gray(const double *refl, const double *targets, Optional paper,
                         const double *paper_targets, Weights weights, int status, double *gray,
                         double *hue)
{
    return PolReflToHueGray(refl, targets, paper.values, paper_targets, weights, status, gray, hue);
}
int pol_refl_to_dot_area(const double *solid, const double *solid_targets, const double *tint,
                         const double *tint_targets, Optional paper, const double *paper_targets,
                         Weights weights, int status, int response, double n_factor, double *area)
{
    return PolReflToDotArea(solid, solid_targets, tint, tint_targets, paper.values, paper_targets,
                            weights, status, response, n_factor, area);
}
int pol_refl_to_dot_gain(const double *solid, const double *solid_targets, const double *tint,
                         const double *tint_targets, Optional paper, const double *paper_targets,
                         Weights weights, int status, int response, double n_factor, int nominal,
                         double *gain)
{
    return PolReflToDotGain(solid, solid_targets, tint, tint_targets, paper.values, paper_targets,
                            weights, status, response, n_factor, nominal, gain);
}
int pol_refl_to_print_contrast(const double *solid, const double *solid_targets, const double *tint,
                               const double *tint_targets, Optional paper,
                               const double *paper_targets, Weights weights, int status,
                               int response, double *contrast)
{
    return PolReflToPrintContrast(solid, solid_targets, tint, tint_targets, paper.values,
                                  paper_targets, weights, status, response, contrast);
}
int pol_refl_to_trap(const double *second, const double *second_targets, const double *first,
                     const double *first_targets, const double *overprint,
                     const double *overprint_targets, Optional paper, const double *paper_targets,
                     Weights weights, int status, int response, double *trap)
{
    return PolReflToTrap(second, second_targets, first, first_targets, overprint, overprint_targets,
                         paper.values, paper_targets, weights, status, response, trap);
}

// Sets of densities, peaks and windows of any length.

template <decltype(FindDensityMax) find>
int find_density(const DENSITYSTRUCT *densities, int include_visual, double *density, int *response)
{
    DENSITYSTRUCT set = *densities;
    *response = -1; // as it was where there is none
    double found = 0;
    find(&set, found, *response, include_visual);
    *density = found;
    return 1;
}

int find_max_density_points(const double *refl, double *densities, int *bands, int *count)
{
    DENSITYPOINT points[VANTREL_BANDS];
    if (!FindMaxDensityPoints(refl, points, count))
        return 0;
    for (int i = 0; i < VANTREL_BANDS; ++i) {
        densities[i] = i < *count ? points[i].density : refused<double>();
        bands[i] = i < *count ? points[i].band : -1;
    }
    return 1;
}

int choose_bp_wavelen(const double *refl, Count room, const int *bands, int count)
{
    DENSITYPOINT points[VANTREL_BANDS] = {};
    count = std::min({count, room.n, VANTREL_BANDS});
    for (int i = 0; i < count; ++i)
        points[i].band = bands[i];
    return ChooseBPWavelen(refl, points, count);
}

double calculate_special_density(const double *refl, int centre, Count width, const double *weights)
{
    double window[VANTREL_BANDS] = {};
    std::copy_n(weights, std::min(width.n, VANTREL_BANDS), window);
    return CalculateSpecialDensity(refl, centre, window, width.n);
}

bool is_chromatic(const double *refl, int illum_obs)
{
    return IsChromatic(refl, static_cast<uint8_t>(illum_obs < 0
                                                      ? NUM_ILLUM_OBS
                                                      : std::min<int>(illum_obs, NUM_ILLUM_OBS)));
}
bool is_chromatic_lch(const double *lch) { return IsChromaticLCH(lch); }

constexpr Row kRows[] = {
    RESULT(GetNumStatusResponses, "get_num_status_responses", "()->()"),
    ROW(GetNormalizedDensityWeights, "get_normalized_density_weights", "(),()->(31),(),(),()"),
    row<refl_to_density>("ReflToDensity", "refl_to_density", "(31),(p),(),()->()"),
    ROW(ReflToReflDensity, "refl_to_refl_density", "(31),(),()->()"),
    row<refl_to_densities>("ReflToDensities", "refl_to_densities", "(31),(p),()->(9)"),
    ROW(ReflToDensitiesNoPaper, "refl_to_densities_no_paper", "(31),()->(9)"),
    row<determine_density_response, Returns::result>(
        "DetermineDensityResponse", "determine_density_response", "(31),(),(p)->()"),
    RESULT(CalculateSpectralDensity, "calculate_spectral_density", "()->()"),
    ROW(AdjustForPaperRefls, "adjust_for_paper_refls", "(31),(31)->(31)"),
    row<find_density<FindDensityMax>>("FindDensityMax", "find_density_max", "(9),()->(),()"),
    row<find_density<FindDensityMin>>("FindDensityMin", "find_density_min", "(9),()->(),()"),
    row<calculate_ccr_densities>("CalculateCCRDensities", "calculate_ccr_densities",
                                 "(31),(p),()->(9)"),
    row<calculate_spectralx_density>("CalculateSpectralXDensity", "calculate_spectralx_density",
                                     "(31),(p),()->(),()"),
    row<find_max_density_points>("FindMaxDensityPoints", "find_max_density_points",
                                 "(31)->(31),(31),()"),
    row<choose_bp_wavelen, Returns::result>("ChooseBPWavelen", "choose_bp_wavelen",
                                            "(31),(n),()->()"),
    row<calculate_special_density, Returns::result>("CalculateSpecialDensity",
                                                    "calculate_special_density", "(31),(),(n)->()"),
    row<is_chromatic, Returns::result>("IsChromatic", "is_chromatic", "(31),()->()"),
    row<is_chromatic_lch, Returns::result>("IsChromaticLCH", "is_chromatic_lch", "(3)->()"),
    ROW(DensityToDotArea, "density_to_dot_area", "(),(),()->()"),
    ROW(DensityFromDotArea, "density_from_dot_area", "(),(),()->()"),
    row<refl_to_dot_area>("ReflToDotArea", "refl_to_dot_area", "(31),(31),(p),(),(),()->()"),
    row<refl_to_dot_gain>("ReflToDotGain", "refl_to_dot_gain", "(31),(31),(p),(),(),(),()->()"),
    ROW(DensityToPrintContrast, "density_to_print_contrast", "(),()->()"),
    row<refl_to_print_contrast>("ReflToPrintContrast", "refl_to_print_contrast",
                                "(31),(31),(p),(),()->()"),
    ROW(DensityToTrap, "density_to_trap", "(),(),()->()"),
    row<refl_to_trap>("ReflToTrap", "refl_to_trap", "(31),(31),(31),(p),(),()->()"),
    ROW(DensityToHueGray, "density_to_hue_gray", "(),(),()->(),()"),
    row<refl_to_hue_gray>("ReflToHueGray", "refl_to_hue_gray", "(31),(p),()->(),()"),
    ROW(DensitytoIntegratedRefl, "density_to_integrated_refl", "(),(),()->()"),
    ROW(ReflToPolIntercept, "refl_to_pol_intercept", "(31),(),(),()->()"),
    ROW(ColorAtEquivalentDensity, "color_at_equivalent_density", "(31),(31),()->(31)"),
    RESULT(DensityRatio, "density_ratio", "(31),(31),()->()"),
    ROW(PolReflAdjust, "pol_refl_adjust", "(31),(),(4),(4,31)->(31)"),
    ROW(PolReflAutoAdjust, "pol_refl_auto_adjust", "(31),(4),(4,31)->(31)"),
    row<pol_determine_density_response, Returns::result>("PolDetermineDensityResponse",
                                                         "pol_determine_density_response",
                                                         "(31),(4),(),(p),(4),(4,31)->()"),
    row<pol_refl_to_density>("PolReflToDensity", "pol_refl_to_density",
                             "(31),(4),(p),(4),(4,31),(),()->()"),
    row<pol_refl_to_densities>("PolReflToDensities", "pol_refl_to_densities",
                               "(31),(4),(p),(4),(4,31),()->(9)"),
    row<pol_refl_to_hue_gray>("PolReflToHueGray", "pol_refl_to_hue_gray",
                              "(31),(4),(p),(4),(4,31),()->(),()"),
    row<pol_refl_to_dot_area>("PolReflToDotArea", "pol_refl_to_dot_area",
                              "(31),(4),(31),(4),(p),(4),(4,31),(),(),()->()"),
    row<pol_refl_to_dot_gain>("PolReflToDotGain", "pol_refl_to_dot_gain",
                              "(31),(4),(31),(4),(p),(4),(4,31),(),(),(),()->()"),
    row<pol_refl_to_print_contrast>("PolReflToPrintContrast", "pol_refl_to_print_contrast",
                                    "(31),(4),(31),(4),(p),(4),(4,31),(),()->()"),
    row<pol_refl_to_trap>("PolReflToTrap", "pol_refl_to_trap",
                          "(31),(4),(31),(4),(31),(4),(p),(4),(4,31),(),()->()"),
};

} // namespace

std::span<const Row> density_rows() { return kRows; }
