// The exported functions of colorimetry.
#include "vantrel.h"

#include "base/require.h"
#include "colorimetry/display.h"
#include "colorimetry/illuminants.h"
#include "colorimetry/lab.h"
#include "colorimetry/spaces.h"
#include "colorimetry/tristimulus.h"
#include "colorimetry/verbal.h"

#include <cwchar>

using namespace vantrel;

int GetNumIlluminantObservers() { return NUM_ILLUM_OBS; }

int ReflToXYZ(const double *refl, ILLUM_OBS illumObs, double *xyz)
{
    VANTREL_REQUIRE(refl && xyz, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    store(xyz_from_spectrum(spectrum(refl), illumObs), xyz);
    return 1;
}

int ReflToXYZs(const double *refl, ILLUM_OBS illumObs, double *x, double *y, double *z)
{
    VANTREL_REQUIRE(refl && x && y && z, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    const auto bands = xyz_by_band(spectrum(refl), illumObs);
    for (int i = 0; i < kBands; ++i) {
        x[i] = bands[i].x;
        y[i] = bands[i].y;
        z[i] = bands[i].z;
    }
    return 1;
}

int ReflToCIELAB(const double *refl, ILLUM_OBS illumObs, double *lab)
{
    VANTREL_REQUIRE(refl && lab, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    store(lab_from_spectrum(spectrum(refl), illumObs), lab);
    return 1;
}

int XYZToCIELab(const double *xyz, ILLUM_OBS illumObs, double *lab)
{
    VANTREL_REQUIRE(xyz && lab, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    store(lab_from_xyz(xyz_of(xyz), white_point(illumObs)), lab);
    return 1;
}

int ReflToCIELCH(const double *refl, ILLUM_OBS illumObs, double *lch)
{
    VANTREL_REQUIRE(refl && lch, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    store(lch_from_spectrum(spectrum(refl), illumObs), lch);
    return 1;
}

int XYZToCIELCH(const double *xyz, ILLUM_OBS illumObs, double *lch)
{
    VANTREL_REQUIRE(xyz && lch, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    store(lch_from_lab(rounded(lab_from_xyz(xyz_of(xyz), white_point(illumObs)))), lch);
    return 1;
}

bool CIELabToCIELCh(CIELABCOORD *lab, CIELCHCOORD *lch, bool round)
{
    VANTREL_REQUIRE(lab && lch, "0");
    *lch = lch_from_lab(round ? rounded(*lab) : *lab);
    return true;
}

int CIELabToCIELCH(const double *lab, double *lch)
{
    VANTREL_REQUIRE(lab && lch, "0");
    store(lch_from_lab(rounded(lab_of(lab))), lch);
    return 1;
}

int CIELabToCIELChEx(const double *lab, double *lch, int round)
{
    VANTREL_REQUIRE(lab && lch, "0");
    store(lch_from_lab(round ? rounded(lab_of(lab)) : lab_of(lab)), lch);
    return 1;
}

int CIELChToCIELab(const double *lch, double *lab)
{
    VANTREL_REQUIRE(lch && lab, "0");
    store(lab_from_lch(lch_of(lch)), lab);
    return 1;
}

int ReflToCIELUV(const double *refl, ILLUM_OBS illumObs, double *luv)
{
    VANTREL_REQUIRE(refl && luv, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    store(luv_from_xyz(xyz_from_spectrum(spectrum(refl), illumObs), white_point(illumObs)), luv);
    return 1;
}

int XYZToCIELUV(const double *xyz, ILLUM_OBS illumObs, double *luv)
{
    VANTREL_REQUIRE(xyz && luv, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    store(luv_from_xyz(xyz_of(xyz), white_point(illumObs)), luv);
    return 1;
}

// Black has no chromaticity: zeros, and 0.
static int store_yxy(const Xyz &xyz, double *Yxy)
{
    const auto result = yxy_from_xyz(xyz);
    store(result.value_or(vantrel::Yxy{0, 0, 0}), Yxy);
    return result ? 1 : 0;
}

int ReflToCIEYxy(const double *refl, ILLUM_OBS illumObs, double *Yxy)
{
    VANTREL_REQUIRE(refl && Yxy, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    return store_yxy(xyz_from_spectrum(spectrum(refl), illumObs), Yxy);
}

int XYZToCIEYxy(const double *xyz, ILLUM_OBS illumObs, double *Yxy)
{
    VANTREL_REQUIRE(xyz && Yxy, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    return store_yxy(xyz_of(xyz), Yxy);
}

int XYZToxyz(const double *xyz, double *x, double *y, double *z)
{
    VANTREL_REQUIRE(xyz && x && y && z, "0");
    const auto result = chromaticity(xyz_of(xyz));
    const auto [cx, cy, cz] = result.value_or(Xyz{0, 0, 0});
    *x = cx;
    *y = cy;
    *z = cz;
    return result ? 1 : 0;
}

int ReflToHunterLAB(const double *refl, ILLUM_OBS illumObs, double *hunter)
{
    VANTREL_REQUIRE(refl && hunter, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    const auto result =
        hunter_from_xyz(xyz_from_spectrum(spectrum(refl), illumObs), illuminant(illumObs));
    if (!result)
        return 0;
    store(*result, hunter);
    return 1;
}

int LabToXYZ(const double *lab, ILLUM_OBS illumObs, double *xyz)
{
    VANTREL_REQUIRE(lab && xyz, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    store(xyz_from_lab(lab_of(lab), white_point(illumObs)), xyz);
    return 1;
}

int ReflToRGB(const double *refl, ILLUM_OBS illumObs, unsigned int *rgb)
{
    VANTREL_REQUIRE(refl && rgb, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    *rgb = rgb_from_xyz(xyz_from_spectrum(spectrum(refl), illumObs));
    return 1;
}

int XYZtoRGB(const double *xyz, unsigned int *rgb)
{
    VANTREL_REQUIRE(xyz && rgb, "0");
    *rgb = rgb_from_xyz(xyz_of(xyz));
    return 1;
}

int CalcLabch(const double *refl, ILLUM_OBS illumObs, float *labch)
{
    VANTREL_REQUIRE(refl && labch, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    const auto [L, a, b, C, h] = labch_from_spectrum(spectrum(refl), illumObs);
    labch[0] = L;
    labch[1] = a;
    labch[2] = b;
    labch[3] = C;
    labch[4] = h;
    return 1;
}

int VerbalColorDifference(const double *standard, const double *sample, ILLUM_OBS illumObs,
                          int selector, wchar_t *lightness, wchar_t *colour1, wchar_t *colour2)
{
    const bool words_colour = selector == 0 || selector == 1;
    VANTREL_REQUIRE(standard && sample, "0");
    VANTREL_REQUIRE(is_illum_obs(illumObs), "0");
    VANTREL_REQUIRE(lightness && (!words_colour || (colour1 && colour2)), "0");
    const Labch reference = labch_from_spectrum(spectrum(standard), illumObs);
    const Labch measured = labch_from_spectrum(spectrum(sample), illumObs);
    const auto write = [](wchar_t *out, Word word) {
        std::wcscpy(out, kWords[static_cast<int>(word)]);
    };
    write(lightness, lightness_word(reference, measured));
    if (words_colour) {
        const bool polar = selector == 1;
        write(colour1,
              polar ? chroma_word(reference, measured) : red_green_word(reference, measured));
        write(colour2,
              polar ? hue_word(reference, measured) : yellow_blue_word(reference, measured));
    }
    return 1;
}
