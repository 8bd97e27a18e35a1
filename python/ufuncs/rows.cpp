// Colours, colour differences, paper and inks.
#include "rows.h"

#include "colorimetry/verbal.h"
#include "difference/cie76.h"
#include "difference/cmc.h"

#include <cwchar>

namespace {

// Text has no place in a ufunc: a number stands for it.
using vantrel::kWords;

int word_number(const wchar_t *word)
{
    int number = 0;
    while (std::wcscmp(kWords[number], word) != 0)
        ++number;
    return number;
}

int verbal_color_difference(const double *standard, const double *sample, ILLUM_OBS illum_obs,
                            int selector, int *lightness, int *colour1, int *colour2)
{
    wchar_t words[3][11] = {};
    if (!VerbalColorDifference(standard, sample, illum_obs, selector, words[0], words[1], words[2]))
        return 0;
    *lightness = word_number(words[0]);
    *colour1 = word_number(words[1]);
    *colour2 = word_number(words[2]);
    return 1;
}

// The same differences of a* and b* as they are, where the exported functions round them.

int lab_to_dh(const CIELABCOORD *first, const CIELABCOORD *second, int rounded, double *delta_h)
{
    if (rounded)
        return LabToDH(first, second, delta_h);
    *delta_h = vantrel::delta_h(*first, *second, false);
    return 1;
}
int lab_to_de_cmc(const CIELABCOORD *sample, const CIELABCOORD *reference, double l, double c,
                  int rounded, double *delta_e)
{
    if (rounded || l == 0 || c == 0)
        return LabToDEcmc(sample, reference, l, c, delta_e);
    *delta_e = vantrel::delta_e_cmc(*sample, *reference, l, c, false);
    return 1;
}

int unpack_rgb(int packed, int *rgb)
{
    if (packed < 0 || packed > 0xFFFFFF)
        return 0;
    for (int i = 0; i < 3; ++i)
        rgb[i] = packed >> 8 * i & 0xFF;
    return 1;
}

double ciede2000(const CIELABCOORD *first, const CIELABCOORD *second, double kL, double kC,
                 double kH)
{
    return CIEDE2000().Calculate(*first, *second, kL, kC, kH);
}
bool ciede2000_is_zero(double value, double tolerance)
{
    return CIEDE2000().IsZero(value, tolerance);
}
double ciede2000_to_degrees(double radians) { return CIEDE2000().ConvertToDegrees(radians); }
double ciede2000_to_radians(double degrees) { return CIEDE2000().ConvertToRadians(degrees); }

// The number of inks is that of their rows.
int estimate_refls(Count n, const double *inks, const int *percent, const double *paper,
                   double *refl)
{
    return EstimateRefls(n.n, inks, percent, paper, refl);
}
int estimate_refls_for_best_visual_color(Count n, const double *inks, const int *percent,
                                         const double *paper, double *refl)
{
    return EstimateReflsForBestVisualColor(n.n, inks, percent, paper, refl);
}
int estimate_color(Count n, const double *inks, const int *percent, const double *paper,
                   double *lab)
{
    return EstimateColor(n.n, inks, percent, paper, lab);
}
template <decltype(EstimateReflsEx) estimate>
int estimate_refls_ex(int n, const double *first, Optional second, Optional third,
                      const int *percent, const double *paper, double *refl)
{
    return estimate(n, first, second.values, third.values, percent, paper, refl);
}

constexpr Row kRows[] = {
    ROW(ReflToXYZ, "refl_to_xyz", "(31),()->(3)"),
    ROW(ReflToXYZs, "refl_to_xyzs", "(31),()->(31),(31),(31)"),
    ROW(ReflToCIELAB, "refl_to_cielab", "(31),()->(3)"),
    ROW(XYZToCIELab, "xyz_to_cielab", "(3),()->(3)"),
    ROW(ReflToCIELCH, "refl_to_cielch", "(31),()->(3)"),
    ROW(XYZToCIELCH, "xyz_to_cielch", "(3),()->(3)"),
    ROW(CIELabToCIELCH, "cielab_to_cielch", "(3)->(3)"),
    ROW(CIELabToCIELChEx, "cielab_to_cielch_ex", "(3),()->(3)"),
    ROW(CIELChToCIELab, "cielch_to_cielab", "(3)->(3)"),
    ROW(ReflToCIELUV, "refl_to_cieluv", "(31),()->(3)"),
    ROW(XYZToCIELUV, "xyz_to_cieluv", "(3),()->(3)"),
    ROW(ReflToCIEYxy, "refl_to_cie_yxy", "(31),()->(3)"),
    ROW(XYZToCIEYxy, "xyz_to_cie_yxy", "(3),()->(3)"),
    ROW(XYZToxyz, "xyz_to_xyz", "(3)->(),(),()"),
    ROW(ReflToHunterLAB, "refl_to_hunter_lab", "(31),()->(3)"),
    ROW(LabToXYZ, "lab_to_xyz", "(3),()->(3)"),
    ROW(ReflToRGB, "refl_to_rgb", "(31),()->()"),
    ROW(XYZtoRGB, "xyz_to_rgb", "(3)->()"),
    row<unpack_rgb>("", "unpack_rgb", "()->(3)"),
    ROW(CalcLabch, "calc_labch", "(31),()->(5)"),
    ROW(LabToDElab, "lab_to_de_lab", "(3),(3)->()"),
    row<lab_to_dh>("LabToDH", "lab_to_dh", "(3),(3),()->()"),
    ROW(LabToDE94, "lab_to_de94", "(3),(3),(),()->()"),
    ROW(CIELChToDE94, "cielch_to_de94", "(3),(3),(),()->()"),
    ROW(LabToDE2000, "lab_to_de2000", "(3),(3),(),()->()"),
    ROW(LabToDE2000Ex, "lab_to_de2000_ex", "(3),(3),(),(),()->()"),
    row<lab_to_de_cmc>("LabToDEcmc", "lab_to_de_cmc", "(3),(3),(),(),()->()"),
    ROW(ReflToDIN6172, "refl_to_din6172", "(31),(31),(),()->()"),
    row<verbal_color_difference>("VerbalColorDifference", "verbal_color_difference",
                                 "(31),(31),(),()->(),(),()"),
    row<ciede2000, Returns::result>("CIEDE2000::Calculate", "ciede2000_calculate",
                                    "(3),(3),(),(),()->()"),
    row<ciede2000_is_zero, Returns::result>("CIEDE2000::IsZero", "ciede2000_is_zero", "(),()->()"),
    row<ciede2000_to_degrees, Returns::result>("CIEDE2000::ConvertToDegrees",
                                               "ciede2000_convert_to_degrees", "()->()"),
    row<ciede2000_to_radians, Returns::result>("CIEDE2000::ConvertToRadians",
                                               "ciede2000_convert_to_radians", "()->()"),
    ROW(ReflToBrightness, "refl_to_brightness", "(31)->()"),
    ROW(Metamerism, "metamerism", "(31),(31),(),()->()"),
    ROW(ReflToWhiteE313_98, "refl_to_white_e313_98", "(31),()->()"),
    ROW(CIEYxyToWhiteE313_98, "cie_yxy_to_white_e313_98", "(3),()->()"),
    ROW(CombineInkColors, "combine_ink_colors", "(31),(31)->(31)"),
    ROW(Combine3InkColors, "combine_3_ink_colors", "(31),(31),(31)->(31)"),
    ROW(CombineInkColorsEx, "combine_ink_colors_ex", "(3),(3)->(3)"),
    ROW(Combine3InkColorsEx, "combine_3_ink_colors_ex", "(3),(3),(3)->(3)"),
    row<estimate_refls>("EstimateRefls", "estimate_refls", "(n,31),(n),(31)->(31)"),
    row<estimate_refls_for_best_visual_color>("EstimateReflsForBestVisualColor",
                                              "estimate_refls_for_best_visual_color",
                                              "(n,31),(n),(31)->(31)"),
    row<estimate_refls_ex<EstimateReflsEx>>("EstimateReflsEx", "estimate_refls_ex",
                                            "(),(31),(p),(q),(3),(31)->(31)"),
    row<estimate_refls_ex<EstimateReflsExForBestVisualColor>>(
        "EstimateReflsExForBestVisualColor", "estimate_refls_ex_for_best_visual_color",
        "(),(31),(p),(q),(3),(31)->(31)"),
    ROW(EstimateReflsForTintColor, "estimate_refls_for_tint_color", "(31),(),(31)->(31)"),
    ROW(EstimateReflsForTintColorForBestVisualColor,
        "estimate_refls_for_tint_color_for_best_visual_color", "(31),(),(31)->(31)"),
    ROW(EstimateReflsForThickness, "estimate_refls_for_thickness", "(31),(),(31)->(31)"),
    row<estimate_color>("EstimateColor", "estimate_color", "(n,3),(n),(3)->(3)"),
    ROW(EstimateTintColor, "estimate_tint_color", "(3),(),(3)->(3)"),
    ROW(CalculateTintColor, "calculate_tint_color", "(31),(31),(),()->()"),
    ROW(ReflToABErrorWeights, "refl_to_ab_error_weights", "(31),(31),()->(31),(31)"),
    RESULT(Saunderson, "saunderson", "(),(),()->()"),
    RESULT(UnSaunderson, "un_saunderson", "(),(),()->()"),
};

} // namespace

std::span<const Row> colour_rows() { return kRows; }
std::span<const wchar_t *const> difference_words() { return kWords; }
