/**
 * @file vantrel.h
 * Vantrel: colour measurement for the graphic arts.
 *
 * A host program hands over measured reflectance spectra and gets what press operators,
 * prepress staff and quality engineers act on. The shortest way to a result:
 *
 *     double lab[3];
 *     if (ReflToCIELAB(spectrum, D50_2DEG, lab))
 *         printf("L* %.2f  a* %.2f  b* %.2f\n", lab[0], lab[1], lab[2]);
 *
 * What holds for every function:
 *
 * - A **spectrum** is 31 doubles, the reflectance at 400, 410, … 700 nm in percent (100 is the
 *   perfect white). Any double is legal; values below 0 and above 100 are used as they are. An
 *   instrument that reads 36 bands, 380 to 730 nm, has them as bands 2 to 32 of its own: hand over
 *   `reading + 2`. The weights at 400 and 700 nm stand for what lies beyond.
 * - A **not-a-number** is no reading. A sum over the bands that meets one is not a number, and what
 *   is formed from it; the call succeeds all the same. No comparison with one holds, so that a
 *   choice hides it: the spectrum counts as neutral (#VISUAL_RESPONSE), a display level and a dot
 *   gain are 0, and a whiteness is refused. Look for them before a call.
 * - Graphic arts (ISO 13655) measure under **D50 with the 2-degree observer**: where nothing speaks
 *   for another combination, it is D50_2DEG.
 * - **XYZ** is three doubles with Y = 100 for the perfect white; **L\*a\*b\*** and **L\*C\*h** are
 *   three doubles each (h in degrees, counter-clockwise from the +a\* axis).
 * - Inputs are only read; results go to memory of the caller, who owns everything. An output may
 *   be the input array where both hold the same kind of record.
 * - A function returns 1 when it succeeded. A null pointer, or an index out of range, makes it
 *   return 0 with every output left as it was; exceptions to this are named where they occur.
 * - No function allocates, throws, or keeps a pointer. All of them may be called from any number
 *   of threads at once, as long as no thread calls a `Set…Constants` function (or writes
 *   #den_weight) meanwhile.
 * - Arithmetic runs in the rounding mode of the caller and changes neither the mode nor what is
 *   trapped. Under another mode than to nearest, results agree to ten places (ΔE00 and ΔE CMC to
 *   1e-8, single precision to six places, a polarisation intercept to eight), and a value that is
 *   rounded, cut or compared may fall to the other side. Where subnormal numbers are flushed to
 *   zero, results below 1e-150 alone may change. Infinities and not-a-numbers come out of
 *   divisions by zero, logarithms of zero and overflows on purpose: a host that has these
 *   exceptions trapped must mask them around a call.
 * - A host may define functions with these names itself: the library calls none of its own by an
 *   exported name.
 *
 * Plain names have C linkage, from C99 on; what takes typed records or references stands in the
 * C++ groups at the end, from C++11 on.
 */
#ifndef VANTREL_H
#define VANTREL_H

#include <stddef.h>
#include <stdint.h>

/** @name Version of this header
 *  @{ */
#define VANTREL_VERSION_MAJOR 0 /**< rises when an exported name goes away or changes */
#define VANTREL_VERSION_MINOR 1 /**< rises with what is new */
#define VANTREL_VERSION_PATCH 0 /**< rises with what is mended */
/** @} */

/**
 * Marks what the library exports. Who links the static library defines VANTREL_STATIC, as the CMake
 * target and pkg-config do; VANTREL_BUILD is defined while the shared library itself is compiled.
 */
#if defined(VANTREL_STATIC)
#define VANTREL_API
#elif defined(_WIN32) && defined(VANTREL_BUILD)
#define VANTREL_API __declspec(dllexport)
#elif defined(_WIN32)
#define VANTREL_API __declspec(dllimport)
#elif defined(__GNUC__)
#define VANTREL_API __attribute__((visibility("default")))
#else
#define VANTREL_API
#endif

/** Number of bands in a spectrum: 400 nm to 700 nm in steps of 10 nm. */
#define VANTREL_BANDS 31

/**
 * Illuminant and observer: a CIE illuminant with the 1931 2-degree or the 1964 10-degree standard
 * observer. D50_2DEG is the usual choice of the graphic arts. Passed as a signed int in C and C++.
 *
 * The weights are those of ASTM E308, within 0.06 of its tables of 2022 for A, C, D50, D65 and D75,
 * within 0.4 for F2 and F7 and 0.8 for F11. F12, a three-narrow-band lamp of 3000 K, is a table of
 * our own: single weights differ by up to 3.3 from those of ASTM E308, the colours of real patches
 * by up to 0.7 to 1.9 ΔE\*ab.
 */
#ifdef __cplusplus
enum ILLUM_OBS : int {
#else
typedef int ILLUM_OBS;
enum ILLUM_OBS {
#endif
    A_2DEG = 0,
    A_10DEG = 1,
    C_2DEG = 2,
    C_10DEG = 3,
    D50_2DEG = 4,
    D50_10DEG = 5,
    D65_2DEG = 6,
    D65_10DEG = 7,
    F2_2DEG = 8,
    F2_10DEG = 9,
    F7_2DEG = 10,
    F7_10DEG = 11,
    F11_2DEG = 12,
    F11_10DEG = 13,
    F12_2DEG = 14,
    F12_10DEG = 15,
    D75_2DEG = 16,
    D75_10DEG = 17,
    NUM_ILLUM_OBS = 18 /**< how many there are; not a combination itself */
};

/** CIE 1976 L\*a\*b\*; interchangeable with an array of three doubles. */
typedef struct CIELABCOORD {
    double L; /**< lightness L\* */
    double a; /**< a\*, green to red */
    double b; /**< b\*, blue to yellow */
} CIELABCOORD;

/** CIE 1976 L\*C\*h; interchangeable with an array of three doubles. */
typedef struct CIELCHCOORD {
    double L; /**< lightness L\* */
    double C; /**< chroma C\*ab */
    double h; /**< hue angle hab in degrees, 0 ≤ h < 360 */
} CIELCHCOORD;

/** Density status: a family of filters. ISO 5-3 Statuses A, E, I and T, and six more. */
enum {
    A_STATUS = 0,          /**< medium bands at 620, 530 and 440 nm */
    E_STATUS = 1,          /**< wide bands at 600, 530 and 440 nm */
    I_STATUS = 2,          /**< narrow bands at 625, 535 and 430 nm */
    T_STATUS = 3,          /**< Status E with a wider blue at 460 nm */
    SPECTRAL_STATUS = 4,   /**< one wavelength; the response is that wavelength in nm */
    SPECTRALX_STATUS = 5,  /**< a five-band window where the ink absorbs; the response is a band */
    HIFI_STATUS = 6,       /**< Status E and three settable bands */
    HEXACHROME_STATUS = 7, /**< Status E and two settable bands */
    CCR1_STATUS = 8,       /**< densities corrected for the overlap of the filters */
    CCR2_STATUS = 9,       /**< the same with a second set of coefficients */
    NUM_STATUSES = 10      /**< how many there are; not a status itself */
};

/** Density response: one filter of a status, and the index of its density in a set. */
enum {
    VISUAL_RESPONSE = 0,      /**< reads black and neutrals */
    RED_RESPONSE = 1,         /**< reads cyan ink */
    GREEN_RESPONSE = 2,       /**< reads magenta ink */
    BLUE_RESPONSE = 3,        /**< reads yellow ink */
    HIFI1_RESPONSE = 4,       /**< settable, see SetHiFiConstants() */
    HIFI2_RESPONSE = 5,       /**< settable */
    HIFI3_RESPONSE = 6,       /**< settable */
    HEXACHROME1_RESPONSE = 7, /**< settable, see SetHexachromeConstants() */
    HEXACHROME2_RESPONSE = 8, /**< settable */
    NUM_RESPONSES = 9         /**< how many there are; as an answer: none could be found */
};

/** A density set: one density for each response, 0 where the status does not have it. */
typedef struct DENSITYSTRUCT {
    double density[NUM_RESPONSES]; /**< in the order of the responses */
} DENSITYSTRUCT;

/** The channels of a polarisation adjustment: four weighting curves of 31 values, one per band. */
typedef struct POLWEIGHTSTRUCT {
    const double *RedWeights;   /**< #RED_RESPONSE */
    const double *GreenWeights; /**< #GREEN_RESPONSE */
    const double *BlueWeights;  /**< #BLUE_RESPONSE, first curve */
    const double *BlueWeights2; /**< #BLUE_RESPONSE, second curve */
} POLWEIGHTSTRUCT;

/** An absorption peak of a spectrum. */
typedef struct DENSITYPOINT {
    double density; /**< density of the five-band window at the band */
    int band;       /**< band index, 400 + 10 band nm */
} DENSITYPOINT;

#ifdef __cplusplus
extern "C" {
#endif

/** @name Tristimulus values
 *  Weighted sums over the bands with the 10 nm weights of ASTM E308 (F12: its own table).
 *  @{ */

/** The number of illuminant/observer combinations. @return 18. */
VANTREL_API int GetNumIlluminantObservers(void);

/**
 * CIE XYZ of a spectrum.
 * @param[in]  refl      spectrum, 31 values in percent
 * @param[in]  illumObs  illuminant and observer
 * @param[out] xyz       X, Y, Z; Y is 100 for the perfect white
 * @return 1; 0 for a null pointer or an unknown combination.
 */
VANTREL_API int ReflToXYZ(const double *refl, ILLUM_OBS illumObs, double *xyz);

/**
 * What each band contributes to X, Y and Z; each array sums to the value of ReflToXYZ().
 * @param[in]  refl      spectrum, 31 values in percent
 * @param[in]  illumObs  illuminant and observer
 * @param[out] x,y,z     31 contributions each
 * @return 1; 0 for a null pointer or an unknown combination.
 */
VANTREL_API int ReflToXYZs(const double *refl, ILLUM_OBS illumObs, double *x, double *y, double *z);

/** @} */

/** @name CIELAB and L\*C\*h
 *  CIE 15: the CIE 1976 (L\*a\*b\*) space. Every L\*C\*h that is derived from a spectrum or from
 * XYZ is computed from a\* and b\* rounded to two decimals (halves away from zero), with 0.000001
 * in place of an a\* of 0, so that a neutral has C\* = 0.000001 and h = 0.
 *  @{ */

/**
 * L\*a\*b\* of a spectrum.
 * @param[in]  refl      spectrum, 31 values in percent
 * @param[in]  illumObs  illuminant and observer
 * @param[out] lab       L\*, a\*, b\*
 * @return 1; 0 for a null pointer or an unknown combination.
 */
VANTREL_API int ReflToCIELAB(const double *refl, ILLUM_OBS illumObs, double *lab);

/** L\*a\*b\* of XYZ, relative to the white point of the combination.
 * @return 1; 0 for a null pointer or an unknown combination. */
VANTREL_API int XYZToCIELab(const double *xyz, ILLUM_OBS illumObs, double *lab);

/** L\*C\*h of a spectrum, rounded as described above.
 * @return 1; 0 for a null pointer or an unknown combination. */
VANTREL_API int ReflToCIELCH(const double *refl, ILLUM_OBS illumObs, double *lch);

/** L\*C\*h of XYZ, rounded as described above.
 * @return 1; 0 for a null pointer or an unknown combination. */
VANTREL_API int XYZToCIELCH(const double *xyz, ILLUM_OBS illumObs, double *lch);

/** L\*C\*h of L\*a\*b\* (three doubles each), rounded as described above.
 * @return 1; 0 for a null pointer. */
VANTREL_API int CIELabToCIELCH(const double *lab, double *lch);

/** L\*C\*h of L\*a\*b\*; a\* and b\* are rounded to two decimals when `round` is not 0, and an a\*
 * of 0 counts as 0.000001 either way. Without rounding, a hue a hair below 0 comes out as 360.
 * @return 1; 0 for a null pointer. */
VANTREL_API int CIELabToCIELChEx(const double *lab, double *lch, int round);

/** L\*a\*b\* of L\*C\*h (three doubles each), without rounding.
 * @return 1; 0 for a null pointer. */
VANTREL_API int CIELChToCIELab(const double *lch, double *lab);

/** @} */

/** @name Other colour spaces
 *  @{ */

/**
 * CIE 1976 L\*u\*v\* (CIE 15) of a spectrum.
 * @param[in]  refl      spectrum, 31 values in percent
 * @param[in]  illumObs  illuminant and observer
 * @param[out] luv       L\*, u\*, v\*; u\* = v\* = 0 where X + 15 Y + 3 Z is 0 (black)
 * @return 1; 0 for a null pointer or an unknown combination.
 */
VANTREL_API int ReflToCIELUV(const double *refl, ILLUM_OBS illumObs, double *luv);

/** CIE 1976 L\*u\*v\* of XYZ; as ReflToCIELUV().
 * @return 1; 0 for a null pointer or an unknown combination. */
VANTREL_API int XYZToCIELUV(const double *xyz, ILLUM_OBS illumObs, double *luv);

/**
 * Luminance and chromaticity (CIE 15) of a spectrum.
 * @param[in]  refl      spectrum, 31 values in percent
 * @param[in]  illumObs  illuminant and observer
 * @param[out] Yxy       Y, x, y in this order
 * @return 1; 0 for a null pointer or an unknown combination; 0 with Y = x = y = 0 written where
 *         X + Y + Z is 0 (black has no chromaticity).
 */
VANTREL_API int ReflToCIEYxy(const double *refl, ILLUM_OBS illumObs, double *Yxy);

/** Luminance and chromaticity of XYZ. The combination is checked, not used.
 * @return as ReflToCIEYxy(). */
VANTREL_API int XYZToCIEYxy(const double *xyz, ILLUM_OBS illumObs, double *Yxy);

/**
 * Chromaticity coordinates of XYZ.
 * @return 1; 0 for a null pointer; 0 with x = y = z = 0 written where X + Y + Z is 0.
 */
VANTREL_API int XYZToxyz(const double *xyz, double *x, double *y, double *z);

/**
 * Hunter L, a, b of a spectrum, with the Ka and Kb of the combination.
 * @param[in]  refl      spectrum, 31 values in percent
 * @param[in]  illumObs  illuminant and observer
 * @param[out] hunter    L, a, b; zeros where only Y is 0
 * @return 1; 0 for a null pointer, an unknown combination, or a spectrum with X + Y + Z = 0.
 */
VANTREL_API int ReflToHunterLAB(const double *refl, ILLUM_OBS illumObs, double *hunter);

/**
 * XYZ of L\*a\*b\*: the inverse of XYZToCIELab(), with the ratios X/Xn, Y/Yn, Z/Zn rounded to six
 * decimals; a round trip therefore agrees to about 0.001, in dark colours to 0.004.
 * @return 1; 0 for a null pointer or an unknown combination.
 */
VANTREL_API int LabToXYZ(const double *lab, ILLUM_OBS illumObs, double *xyz);

/** @} */

/** @name Screen preview
 *  The colour as 8-bit drive levels of one fixed display: red | green << 8 | blue << 16. What lies
 *  outside the display's gamut is clipped channel by channel. The display is not sRGB: its
 *  primaries have the chromaticities (0.6106, 0.3503), (0.3014, 0.5885) and (0.1501, 0.0701), its
 *  white (0.2861, 0.3164) and its own drive curve. Colours are not adapted to that white: the
 *  perfect white of every combination is clipped.
 *  @{ */

/** Display value of a spectrum. @return 1; 0 for a null pointer or an unknown combination. */
VANTREL_API int ReflToRGB(const double *refl, ILLUM_OBS illumObs, unsigned int *rgb);

/** Display value of XYZ. A channel that is not a number has level 0.
 * @return 1; 0 for a null pointer. */
VANTREL_API int XYZtoRGB(const double *xyz, unsigned int *rgb);

/** @} */

/** @name Colour differences
 *  Zero weights are not refused unless stated: the division gives what IEEE arithmetic gives.
 *  @{ */

/** CIE 1976 ΔE\*ab (CIE 15) of two L\*a\*b\* records. @return 1; 0 for a null pointer. */
VANTREL_API int LabToDElab(const CIELABCOORD *first, const CIELABCOORD *second, double *deltaE);

/**
 * Signed CIE 1976 hue difference ΔH\*ab (CIE 15): positive when the second hue lies from 0 up to
 * and including 180 degrees counter-clockwise of the first. Chroma and hue are those of
 * CIELabToCIELCH().
 * @return 1; 0 for a null pointer.
 */
VANTREL_API int LabToDH(const CIELABCOORD *first, const CIELABCOORD *second, double *deltaH);

/**
 * CIE94 ΔE\*94 (CIE 116), kH = 1. The chroma and hue weights follow the chroma of `reference`
 * alone, so the two records do not commute.
 * @param[in]  sample,reference  L\*a\*b\*
 * @param[in]  kL,kC             parametric factors (1, 1 for the reference conditions)
 * @param[out] deltaE            ΔE\*94
 * @return 1; 0 for a null pointer.
 */
VANTREL_API int LabToDE94(const CIELABCOORD *sample, const CIELABCOORD *reference, double kL,
                          double kC, double *deltaE);

/** CIE94 of two L\*C\*h records; as LabToDE94() of their L\*a\*b\*.
 * @return 1; 0 for a null pointer. */
VANTREL_API int CIELChToDE94(const CIELCHCOORD *sample, const CIELCHCOORD *reference, double kL,
                             double kC, double *deltaE);

/** CIEDE2000 ΔE00 (CIE 142, ISO/CIE 11664-6) with kH = 1; symmetric in the two records.
 * @return 1; 0 for a null pointer. */
VANTREL_API int LabToDE2000(const CIELABCOORD *first, const CIELABCOORD *second, double kL,
                            double kC, double *deltaE);

/** CIEDE2000 ΔE00 with all three parametric factors. @return 1; 0 for a null pointer. */
VANTREL_API int LabToDE2000Ex(const CIELABCOORD *first, const CIELABCOORD *second, double kL,
                              double kC, double kH, double *deltaE);

/**
 * CMC(l:c) (ISO 105-J03). Every weight follows `reference` alone; chroma and hue are those of
 * CIELabToCIELCH().
 * @param[in]  sample,reference  L\*a\*b\*
 * @param[in]  l,c               lightness and chroma weight (2, 1 for acceptability; 1, 1 for
 *                               perceptibility)
 * @param[out] deltaE            ΔE CMC
 * @return 1; 0 for a null pointer; 0 with 999 written when l or c is exactly 0.
 */
VANTREL_API int LabToDEcmc(const CIELABCOORD *sample, const CIELABCOORD *reference, double l,
                           double c, double *deltaE);

/**
 * DIN 6172 metamerism index of a pair of spectra under a change of illuminant/observer: the length
 * of the difference between the pair's two L\*a\*b\* difference vectors.
 * @param[in]  first,second            spectra, 31 values in percent
 * @param[in]  illumObs1,illumObs2     the two ILLUM_OBS combinations
 * @param[out] index                   metamerism index in CIELAB units
 * @return 1; 0 for a null pointer or an unknown combination.
 */
VANTREL_API int ReflToDIN6172(const double *first, const double *second, int illumObs1,
                              int illumObs2, double *index);

/**
 * How a sample differs from its standard, in words. A coordinate that differs by no more than 0.5
 * is "On Target".
 * @param[in]  standard,sample  spectra, 31 values in percent
 * @param[in]  illumObs         illuminant and observer
 * @param[in]  selector         0 words the colour along a\* and b\*; 1 as chroma and hue; any other
 *                              value words the lightness alone
 * @param[out] lightness        "On Target", "Too Dark", "Too Light"
 * @param[out] colour1          selector 0: "Too Green", "Too Red"; selector 1: "Too Dull",
 *                              "Too Bright"; or "On Target"
 * @param[out] colour2          selector 0: "Too Blue", "Too Yellow"; selector 1: the hue that the
 *                              sample leans to; or "On Target". Hue angles are subtracted as they
 *                              are: from 359 to 1 degrees is 358 clockwise, "Too Blue"
 * @return 1; 0 for a null spectrum, an unknown combination, or a null text buffer that the selector
 *         needs. Every buffer holds at least 11 wide characters.
 */
VANTREL_API int VerbalColorDifference(const double *standard, const double *sample,
                                      ILLUM_OBS illumObs, int selector, wchar_t *lightness,
                                      wchar_t *colour1, wchar_t *colour2);

/** @} */

/** @name Density statuses and weights
 *  @{ */

/**
 * The filters: the weight of each band for every status and response. A row of a filter sums to
 * 100 000 within rounding; a row that a status does not have is zero. Densities read it at the
 * moment of the call; SetHiFiConstants() and SetHexachromeConstants() rewrite rows of it. A program
 * that defines a den_weight of its own puts it in place of this one.
 */
extern VANTREL_API int64_t den_weight[NUM_STATUSES][NUM_RESPONSES][VANTREL_BANDS];

/** The number of density statuses. @return 10. */
VANTREL_API int GetNumStatuses(void);

/** The number of density responses. @return 9. */
VANTREL_API int GetNumResponses(void);

/** How many responses a status measures.
 * @return 4, or 7 for HiFi, 6 for Hexachrome, 0 for the two spectral statuses and for an unknown
 *         status. */
VANTREL_API int GetNumStatusResponses(int status);

/**
 * A filter scaled to a peak of 100.
 * @param[in]  status,response  which filter
 * @param[out] weights          31 weights
 * @param[out] first,peak,last  wavelengths in nm of the first non-zero weight, of the largest (the
 *                              shortest wavelength wins a tie) and of the last; each may be null
 * @return 1; 0 for a null `weights`, an unknown status or response; 0 with `first` and `last`
 *         written (0 where every weight is 0) and the rest untouched for a filter without a
 *         positive weight.
 */
VANTREL_API int GetNormalizedDensityWeights(int status, int response, double *weights,
                                            double *first, double *peak, double *last);

/** @} */

/** @name Densities
 *  ISO 5-3 and ISO 5-4: D = -log10 of the filter-weighted reflectance factor, floored at 0.00001
 *  (D = 5). A paper spectrum may be null; where it is given, its own density is subtracted.
 *  @{ */

/**
 * The density of a spectrum. Of the corrected densities of CalculateCCRDensities() only those of
 * #CCR2_STATUS are given here; #CCR1_STATUS is read without the correction.
 * @param[in]  refl      spectrum, 31 values in percent
 * @param[in]  paper     spectrum of the paper, or null
 * @param[in]  status    density status
 * @param[in]  response  0 to 8; for #SPECTRAL_STATUS a wavelength of 391 to 709 nm (cut toward
 *                       400 nm to its band; the paper plays no part); for #SPECTRALX_STATUS
 *                       a request of 0 to 30 as in CalculateSpectralXDensity()
 * @param[out] density   density; 0 to 5 for the two spectral statuses. A response that the status
 *                       does not measure has 5, or 0 over a paper; under #CCR2_STATUS, which takes
 *                       4 to 30 for such, always 0
 * @return 1; 0 for a null `refl` or `density`, an unknown status, a response out of range.
 */
VANTREL_API int ReflToDensity(const double *refl, const double *paper, int status, int response,
                              double *density);

/**
 * Filter-weighted reflectance in percent, at least 0.00099999993. The weights are scaled by 0.00001
 * in single precision: a perfect white has 99.9999975.
 * @return 1; 0 for a null pointer, an unknown status or a response outside 0 to 8.
 */
VANTREL_API int ReflToReflDensity(const double *refl, int status, int response,
                                  double *weightedRefl);

/**
 * The density set of a spectrum: every response that the status measures, 0 for the others; for the
 * CCR statuses that of CalculateCCRDensities(). The two spectral statuses give nine times the same
 * density, #SPECTRAL_STATUS at the wavelength that DetermineDensityResponse() chooses,
 * #SPECTRALX_STATUS the visual density of Status T.
 * @return 1; 0 for a null `refl` or `densities` or an unknown status.
 */
VANTREL_API int ReflToDensities(const double *refl, const double *paper, int status,
                                DENSITYSTRUCT *densities);

/** ReflToDensities() without a paper.
 * @return 1; 0 for a null pointer or an unknown status. */
VANTREL_API int ReflToDensitiesNoPaper(const double *refl, int status, DENSITYSTRUCT *densities);

/**
 * Which response reads this ink: the visual one for what IsChromatic() under D65_10DEG calls
 * neutral, else the one of the largest density. The third HiFi ink is told from cyan by a hue error
 * above 39.5 %, the Hexachrome inks from yellow by one above 30 %, and from one another by their
 * hue (the second between 90 and 270 degrees). With a paper the spectrum is first sharpened by
 * AdjustForPaperRefls(). Note the order of the parameters.
 * @param[in] refl    spectrum, 31 values in percent
 * @param[in] status  density status
 * @param[in] paper   spectrum of the paper, or null
 * @return a response; for #SPECTRAL_STATUS, neutral or not, a wavelength (420, 440, … 700 nm); for
 * #SPECTRALX_STATUS a band (2 to 28), or 0 for a neutral; 9 where the density set cannot be
 * computed; 0 for a null `refl` or an unknown status.
 */
VANTREL_API int DetermineDensityResponse(const double *refl, int status, const double *paper);

/** @} */

/** @name Corrected densities and settable bands
 *  @{ */

/**
 * The CCR density set: red, green and blue corrected by the ratios of their reflectances, the more
 * the darker the sample, and a visual density formed from green and red.
 * @param[in]  refl       spectrum, 31 values in percent
 * @param[in]  paper      spectrum of the paper, or null
 * @param[in]  status     #CCR1_STATUS or #CCR2_STATUS
 * @param[out] densities  nine doubles: visual, red, green, blue, and five zeros
 * @return 1; 0 for a null `refl` or `densities` or another status.
 */
VANTREL_API int CalculateCCRDensities(const double *refl, const double *paper, int status,
                                      double *densities);

/**
 * Places the three HiFi bands and rebuilds their rows of #den_weight, so that each sums to exactly
 * 100 000. Lasts until the library is unloaded.
 * @param[in] wavelengths           three centres in nm, cut to their band; one outside 430 to
 *                                  below 680, or not a number, leaves its band as it was
 * @param[in] shape1,shape2,shape3  seven relative weights around each centre, in steps of 10 nm;
 *                                  null moves the centre alone. A shape that sums to 0 makes an
 *                                  empty row; one that is not finite, or too small or too large
 *                                  to be scaled, leaves the row as it was.
 */
VANTREL_API void SetHiFiConstants(const double *wavelengths, const double *shape1,
                                  const double *shape2, const double *shape3);

/** The three HiFi centres in nm and the rows around them, scaled to 1 in the centre (an empty row
 * gives what the division gives). Each may be null. */
VANTREL_API void GetHiFiConstants(double *wavelengths, double *shape1, double *shape2,
                                  double *shape3);

/** Places the two Hexachrome bands; as SetHiFiConstants(). */
VANTREL_API void SetHexachromeConstants(const double *wavelengths, const double *shape1,
                                        const double *shape2);

/** The two Hexachrome centres and shapes; as GetHiFiConstants(). */
VANTREL_API void GetHexachromeConstants(double *wavelengths, double *shape1, double *shape2);

/** @} */

/** @name SpectralX
 *  The density of a symmetric five-band window (0.1, 0.5, 1, 0.5, 0.1 unless set otherwise) at the
 *  band where the ink absorbs.
 *  @{ */

/**
 * The windowed density at a band, not clamped; 5 for a window of 0 or less.
 * @param[in]  refl     spectrum, 31 values in percent
 * @param[in]  paper    spectrum of the paper, or null; its density at the same band is subtracted
 * @param[in]  request  2 to 28: that band; 0: the visual density of Status T; any other: the
 *                      absorption peak that borders the brightest stretch of the spectrum
 * @param[out] density  density, or null (not for request 0)
 * @param[out] band     the band read, or null; not written for request 0
 * @return 1; 0 for a null `refl`, or a null `density` with request 0.
 */
VANTREL_API int CalculateSpectralXDensity(const double *refl, const double *paper, int request,
                                          double *density, int *band);

/**
 * The absorption peaks of a spectrum in order of wavelength, from 420 nm (or the first crest of a
 * rising blue end, up to 490 nm) to 680 nm.
 * @param[in]  refl    spectrum, 31 values in percent
 * @param[out] points  room for 31 peaks
 * @param[out] count   how many were found, at least 1
 * @return 1; 0 for a null pointer.
 */
VANTREL_API int FindMaxDensityPoints(const double *refl, DENSITYPOINT *points, int *count);

/** Chooses the peak that borders the brightest stretch of the spectrum, on the side nearer to the
 * crest of that stretch.
 * @return its index; 0 for a null pointer, no peaks, or a band outside 0 to 30. */
VANTREL_API int ChooseBPWavelen(const double *refl, const DENSITYPOINT *points, int count);

/**
 * Sets the SpectralX constants, all five or, for a null pointer or a centre weight other than 1,
 * none.
 * @param[in] tolerance  how far above the lowest windowed sum (percent, not normalised) a band
 *                       still counts as a peak; 2
 * @param[in] reserved   kept and returned; 84
 * @param[in] centre     weight of the centre, 1
 * @param[in] inner      weight of the two bands next to it; 0.5
 * @param[in] outer      weight of the two outer bands; 0.1
 */
VANTREL_API void SetSpectralXConstants(const double *tolerance, const double *reserved,
                                       const double *centre, const double *inner,
                                       const double *outer);

/** The SpectralX constants. Each may be null. */
VANTREL_API void GetSpectralXConstants(double *tolerance, double *reserved, double *centre,
                                       double *inner, double *outer);

/** @} */

/** @name Achromatic test
 *  A colour is chromatic when its C\* lies above a straight line over L\*, from (L\*, C\*) = (84,
 * 3) to (14, 11) unless set otherwise.
 *  @{ */

/** Whether the spectrum is chromatic under the ILLUM_OBS, with a\* and b\* rounded to two decimals.
 * @return 1 where it is, else 0; 0 for a null pointer or an unknown combination. */
VANTREL_API int IsChromatic(const double *refl, uint8_t illumObs);

/** Whether the L\*C\*h (three doubles) is chromatic. @return 1 where it is, else 0; 0 for a null
 * pointer. */
VANTREL_API int IsChromaticLCH(const double *lch);

/** Sets the two points of the line; a null pointer, or points through which no finite line
 * goes (two equal L\*, a value that is not finite), change nothing. */
VANTREL_API void SetAChromaticConstants(const double *L1, const double *L2, const double *C1,
                                        const double *C2);

/** The two points of the line; nothing for a null pointer. */
VANTREL_API void GetAChromaticConstants(double *L1, double *L2, double *C1, double *C2);

/** @} */

/** @name Print attributes
 *  How a print shows its inks; what is computed from densities follows ANSI CGATS.4. The Refl…
 *  functions measure every patch in one status and response with ReflToDensity(), over the paper
 *  where there is one (null: absolute densities). Doubles are used as they are: a density, n-factor
 *  or area without physical sense gives what IEEE arithmetic gives. A failure leaves every output
 *  as it was.
 *  @{ */

/**
 * Effective dot area of a halftone tint (Yule and Nielsen 1951; with n = 1 Murray and Davies 1936).
 * @param[in]  solidDensity,tintDensity  densities of the solid and of the tint of the same ink
 * @param[in]  nFactor                   n, any number but 0; from some 1e8 on places are lost, and
 *                                       the limit 100 Dt / Ds is nearer
 * @param[out] dotArea                   percent, not clamped; 100 for a solid of density 0
 * @return 1; 0 for a null pointer or an n-factor of 0.
 */
VANTREL_API int DensityToDotArea(double solidDensity, double tintDensity, double nFactor,
                                 double *dotArea);

/** The tint density of a dot area in percent, the inverse of DensityToDotArea() to seven digits;
 * infinite or not a number for a dot area beyond what any density can have.
 * @return 1; 0 for a null pointer or an n-factor of 0. */
VANTREL_API int DensityFromDotArea(double solidDensity, double dotArea, double nFactor,
                                   double *tintDensity);

/**
 * Dot area of a measured tint, as DensityToDotArea().
 * @param[in]  solid,tint,paper  spectra, 31 values in percent; the paper may be null
 * @param[in]  status,response   as ReflToDensity() takes them
 * @param[in]  nFactor           n, any number but 0
 * @param[out] dotArea           percent
 * @return 1; 0 for another null pointer, an unknown status or response, or an n-factor of 0.
 */
VANTREL_API int ReflToDotArea(const double *solid, const double *tint, const double *paper,
                              int status, int response, double nFactor, double *dotArea);

/** Dot gain: how many percent the dot area of ReflToDotArea() has over the nominal one, at least 0.
 * @return 1; 0 as ReflToDotArea(). */
VANTREL_API int ReflToDotGain(const double *solid, const double *tint, const double *paper,
                              int status, int response, double nFactor, int nominalDotArea,
                              double *dotGain);

/** Print contrast 100 (Ds - Dt) / Ds in percent of a solid and a shadow tint.
 * @return 1; 0 for a null pointer or a solid density of 0. */
VANTREL_API int DensityToPrintContrast(double solidDensity, double tintDensity, double *contrast);

/** Print contrast of measured patches.
 * @return 1; 0 for a null pointer (but the paper), an unknown status or response, or a solid
 *         density of 0. */
VANTREL_API int ReflToPrintContrast(const double *solid, const double *tint, const double *paper,
                                    int status, int response, double *contrast);

/** Apparent trap 100 (Dop - D1) / D2 in percent (Preucil 1958): how much of the second-down ink an
 * overprint has taken up.
 * @return 1; 0 for a null pointer or a second-down density of 0. */
VANTREL_API int DensityToTrap(double overprintDensity, double secondDensity, double firstDensity,
                              double *trap);

/** Trap of measured patches: the second-down ink, the first-down ink, the overprint, in this order.
 * @return 1; 0 for a null pointer (but the paper), an unknown status or response, or a second-down
 *         density of 0. */
VANTREL_API int ReflToTrap(const double *second, const double *first, const double *overprint,
                           const double *paper, int status, int response, double *trap);

/**
 * Grayness 100 L / H and hue error 100 (M - L) / (H - L) of the GATF colour diagram, from the
 * lowest, middle and highest of three densities. A density of exactly 0 is not taken as the lowest;
 * H = 0 has grayness 100, and H = L has hue error 100. H is at least 0, and a missing L is 100:
 * three densities of 0 have hue error 200.
 * @param[in]  redDensity,greenDensity,blueDensity  densities
 * @param[out] grayness,hueError                    percent, not clamped
 * @return 1; 0 for a null pointer.
 */
VANTREL_API int DensityToHueGray(double redDensity, double greenDensity, double blueDensity,
                                 double *grayness, double *hueError);

/**
 * Grayness and hue error of a measured ink. #HIFI_STATUS and #HEXACHROME_STATUS are measured as
 * #E_STATUS; the one density of #SPECTRAL_STATUS, where above 0, has 100 and 100.
 * @param[in]  refl,paper         spectra, 31 values in percent; the paper may be null
 * @param[in]  status             any but #SPECTRALX_STATUS
 * @param[out] grayness,hueError  percent
 * @return 1; 0 for another null pointer or status; 9 where ReflToDensities() fails.
 */
VANTREL_API int ReflToHueGray(const double *refl, const double *paper, int status, double *grayness,
                              double *hueError);

/**
 * The reflectance in percent times bands, integrated under the response curve normalised to a peak
 * of 1 (GetNormalizedDensityWeights() divided by 100), that has a density: 10^7 / (peak weight
 * 10^D). Infinite for a response that the status does not have.
 * @param[in]  density          above 0
 * @param[in]  status,response  any status but #SPECTRALX_STATUS, any response but #VISUAL_RESPONSE
 * @param[out] refl             integrated reflectance
 * @return 1; 0 for a null pointer or an argument outside these ranges.
 */
VANTREL_API int DensitytoIntegratedRefl(double density, int status, int response, double *refl);

/**
 * How far a spectrum measured without a polarisation filter lies above three densities read through
 * one, in hundredths of a percent of Status E reflectance: in the response that
 * DetermineDensityResponse() gives, the mean of the three where that is #VISUAL_RESPONSE.
 * @param[in]  refl                                 spectrum, 31 values in percent
 * @param[in]  redDensity,greenDensity,blueDensity  densities
 * @param[out] intercept                            hundredths of a percent
 * @return 1; 0 for a null pointer.
 */
VANTREL_API int ReflToPolIntercept(const double *refl, double redDensity, double greenDensity,
                                   double blueDensity, double *intercept);

/**
 * The spectrum of a sample printed at the density of a reference: K/S divided by DensityRatio() in
 * every band (Kubelka and Munk 1931, opaque layer), as it is for a ratio of 0 or less.
 * @param[in]  reference,sample  spectra, 31 values in percent
 * @param[in]  status            density status
 * @param[out] refl              31 values in percent
 * @return 1. No pointer is checked: none may be null.
 */
VANTREL_API int ColorAtEquivalentDensity(const double *reference, const double *sample, int status,
                                         double *refl);

/** @} */

/** @name Readings through a polarisation filter
 *  A polarisation filter takes away the light that the surface of an ink film reflects. The reading
 *  is emulated: a spectrum is scaled by one factor, a target reading of a channel over the reading
 *  that the spectrum has. Every spectrum comes with four targets, in the order of the members of
 *  POLWEIGHTSTRUCT and in the units of Σ weight · reflectance; #VISUAL_RESPONSE takes the mean of
 *  all four factors, #BLUE_RESPONSE that of its two, a HiFi or Hexachrome response 1. A reading of
 *  0 counts as a factor of 1, and so does a mean of 0. A mean above 1 is a failure: a filter adds
 *  no light.
 *
 *  Spectra, targets and weights (with all four curves) are the caller's duty: null is only checked
 *  where stated, and allowed only for a paper spectrum, whose targets are then not read.
 *  @{ */

/**
 * The spectrum as the channel of a response adjusts it.
 * @param[in]  refl      spectrum, 31 values in percent
 * @param[in]  response  any value
 * @param[in]  targets   4 values
 * @param[out] adjusted  31 values in percent; may be `refl`
 * @param[in]  weights   the channels
 * @return 1; 0 with nothing written for a mean factor above 1.
 */
VANTREL_API int PolReflAdjust(const double *refl, int response, const double *targets,
                              double *adjusted, const POLWEIGHTSTRUCT *weights);

/** PolReflAdjust() in the response that DetermineDensityResponse() gives under #E_STATUS.
 * @return 1; 0 with nothing written for a mean factor above 1. */
VANTREL_API int PolReflAutoAdjust(const double *refl, const double *targets, double *adjusted,
                                  const POLWEIGHTSTRUCT *weights);

/** DetermineDensityResponse() of the spectrum over the paper, each after PolReflAutoAdjust().
 * @return as there; 0, which is also #VISUAL_RESPONSE, where one of them fails and for an unknown
 *         status. */
VANTREL_API int PolDetermineDensityResponse(const double *refl, const double *targets, int status,
                                            const double *paper, const double *paperTargets,
                                            const POLWEIGHTSTRUCT *weights);

/** ReflToDensity() of the spectrum over the paper, each after PolReflAutoAdjust().
 * @return 1; 0 with nothing written where one of them fails, and for a null output. */
VANTREL_API int PolReflToDensity(const double *refl, const double *targets, const double *paper,
                                 const double *paperTargets, const POLWEIGHTSTRUCT *weights,
                                 int status, int response, double *density);

/**
 * ReflToDensities() with the spectrum adjusted for each response on its own: the visual, red, green
 * and blue ones in themselves, HIFI1 in green, HIFI2, HIFI3 and HEXACHROME2 in red, HEXACHROME1 in
 * blue. #SPECTRAL_STATUS and #SPECTRALX_STATUS use PolReflAutoAdjust(), as the paper does.
 * #CCR1_STATUS has the uncorrected densities of ReflToDensity().
 * @return 1; 0 for a null spectrum or set or an unknown status; 0 with nine densities of 0 where an
 *         adjustment fails.
 */
VANTREL_API int PolReflToDensities(const double *refl, const double *targets, const double *paper,
                                   const double *paperTargets, const POLWEIGHTSTRUCT *weights,
                                   int status, DENSITYSTRUCT *densities);

/**
 * Grayness and hue error (ReflToHueGray()) of PolReflToDensities() over a paper that is adjusted
 * before it is handed there. The factor of the paper's second adjustment may exceed 1 by 1e-12.
 * @return 1; 0 for a null spectrum or output, an unknown status, #SPECTRALX_STATUS, or where the
 *         paper cannot be adjusted; 9 where the density set cannot be computed.
 */
VANTREL_API int PolReflToHueGray(const double *refl, const double *targets, const double *paper,
                                 const double *paperTargets, const POLWEIGHTSTRUCT *weights,
                                 int status, double *grayness, double *hueError);

/** ReflToDotArea() of the spectra, each after PolReflAutoAdjust().
 * @return 1; 0 with nothing written where one of them fails, and for a null output. */
VANTREL_API int PolReflToDotArea(const double *solid, const double *solidTargets,
                                 const double *tint, const double *tintTargets, const double *paper,
                                 const double *paperTargets, const POLWEIGHTSTRUCT *weights,
                                 int status, int response, double nFactor, double *dotArea);

/** ReflToDotGain() in the same way. @return as PolReflToDotArea(). */
VANTREL_API int PolReflToDotGain(const double *solid, const double *solidTargets,
                                 const double *tint, const double *tintTargets, const double *paper,
                                 const double *paperTargets, const POLWEIGHTSTRUCT *weights,
                                 int status, int response, double nFactor, int nominalDotArea,
                                 double *dotGain);

/** ReflToPrintContrast() in the same way. @return as PolReflToDotArea(). */
VANTREL_API int PolReflToPrintContrast(const double *solid, const double *solidTargets,
                                       const double *tint, const double *tintTargets,
                                       const double *paper, const double *paperTargets,
                                       const POLWEIGHTSTRUCT *weights, int status, int response,
                                       double *contrast);

/** ReflToTrap() in the same way: the second-down ink, the first-down ink, the overprint.
 * @return as PolReflToDotArea(). */
VANTREL_API int PolReflToTrap(const double *second, const double *secondTargets,
                              const double *first, const double *firstTargets,
                              const double *overprint, const double *overprintTargets,
                              const double *paper, const double *paperTargets,
                              const POLWEIGHTSTRUCT *weights, int status, int response,
                              double *trap);

/** @} */

/** @name Paper
 *  How white a substrate is, and how it holds its colour from light to light.
 *  @{ */

/**
 * Blue-weighted brightness: 13 weights from 400 to 520 nm with their maximum at 460 nm, in the
 * manner of the R457 of ISO 2470. A flat spectrum of v has 0.99999 v.
 * @param[in]  refl        spectrum, 31 values in percent
 * @param[out] brightness  percent
 * @return 1; 0 for a null pointer.
 */
VANTREL_API int ReflToBrightness(const double *refl, double *brightness);

/**
 * The ΔE\*ab of a sample from its standard under one illuminant/observer plus that under another:
 * a pair that differs alike under both reports twice the difference. ReflToDIN6172() tells how far
 * the difference moves.
 * @param[in]  standard,sample      spectra, 31 values in percent
 * @param[in]  illumObs1,illumObs2  the two combinations, which may be equal
 * @param[out] metamerism           sum of the two ΔE\*ab
 * @return 1; 0 for a null pointer or an unknown combination.
 */
VANTREL_API int Metamerism(const double *standard, const double *sample, ILLUM_OBS illumObs1,
                           ILLUM_OBS illumObs2, double *metamerism);

/**
 * Whiteness index of ASTM E313-98, for illuminants C, D50 and D65:
 * W = Y + 800 (xn − x) + 1700 (yn − y), which describes a white while 40 < W < 5 Y − 280.
 * @param[in]  refl       spectrum, 31 values in percent
 * @param[in]  illumObs   C_2DEG … D65_10DEG
 * @param[out] whiteness  W, or −999
 * @return 1; 0 with −999 written where W is outside its limits or the combination, though known,
 *         has no whiteness; 0 for a null pointer, an unknown combination, or a spectrum with
 *         X + Y + Z = 0.
 */
VANTREL_API int ReflToWhiteE313_98(const double *refl, ILLUM_OBS illumObs, double *whiteness);

/** Whiteness of Y, x, y as ReflToCIEYxy() writes them. @return as ReflToWhiteE313_98(). */
VANTREL_API int CIEYxyToWhiteE313_98(const double *Yxy, ILLUM_OBS illumObs, double *whiteness);

/** @} */

/** @name Inks
 *  What inks will measure over one another and as tints, before they are printed. Percentages run
 *  from 0 (bare paper) to 100 (the ink as measured); an overprint lists the inks in the order of
 *  printing.
 *  @{ */

/**
 * Spectrum of two inks over one another: in each band the density of the denser ink and, where the
 * other one is above 0.6, a share of its density that is 0.5 in the band where it is largest. The
 * inks commute. A reading of exactly 0 has density 999 (where both inks have one, that band scales
 * the shares of all others); a band in which a reading is below 0 or not a number is not a number.
 * @param[in]  first,second  spectra of the solids, 31 values in percent
 * @param[out] refl          spectrum of the overprint
 * @return 1; 0 for a null pointer.
 */
VANTREL_API int CombineInkColors(const double *first, const double *second, double *refl);

/** Spectrum of three inks: the first two as CombineInkColors(), then the third over the result.
 * @return 1; 0 for a null pointer. */
VANTREL_API int Combine3InkColors(const double *first, const double *second, const double *third,
                                  double *refl);

/** Mean of two L\*a\*b\* (three doubles each), in place of an overprint.
 * @return 1; 0 for a null pointer. */
VANTREL_API int CombineInkColorsEx(const double *first, const double *second, double *lab);

/** Sum of three L\*a\*b\* times 0.3333333 each. @return 1; 0 for a null pointer. */
VANTREL_API int Combine3InkColorsEx(const double *first, const double *second, const double *third,
                                    double *lab);

/**
 * Spectrum of up to three inks, each a solid or a halftone tint as EstimateReflsForTintColor(),
 * over one another as CombineInkColors().
 * @param[in]  n        number of inks, 1 to 3
 * @param[in]  inks     spectra of the solids on the paper, one after the other: 31 n values
 * @param[in]  percent  tint of each ink, n values from 0 to 100
 * @param[in]  paper    spectrum of the paper
 * @param[out] refl     predicted spectrum
 * @return 1; 0 for a null pointer, or a number or percentage out of range.
 */
VANTREL_API int EstimateRefls(int n, const double *inks, const int *percent, const double *paper,
                              double *refl);

/** As EstimateRefls(), with tints as thinner films: EstimateReflsForThickness().
 * @return 1; 0 for a null pointer, or a number or percentage out of range. */
VANTREL_API int EstimateReflsForBestVisualColor(int n, const double *inks, const int *percent,
                                                const double *paper, double *refl);

/**
 * EstimateRefls() of inks in arrays of their own. Of the three only the first n are read; a null
 * `second` or `third` that n asks for reflects nothing.
 * @return 1; 0 for another null pointer, or a number or percentage out of range.
 */
VANTREL_API int EstimateReflsEx(int n, const double *first, const double *second,
                                const double *third, const int *percent, const double *paper,
                                double *refl);

/** EstimateReflsForBestVisualColor() of inks in arrays of their own.
 * @return as EstimateReflsEx(). */
VANTREL_API int EstimateReflsExForBestVisualColor(int n, const double *first, const double *second,
                                                  const double *third, const int *percent,
                                                  const double *paper, double *refl);

/**
 * Spectrum of a halftone tint: ink and paper mixed by area (Murray-Davies), for any percentage.
 * Pointers are not checked.
 * @param[in]  ink,paper  spectra, 31 values in percent
 * @param[in]  percent    area of the ink
 * @param[out] refl       spectrum of the tint
 */
VANTREL_API void EstimateReflsForTintColor(const double *ink, int percent, const double *paper,
                                           double *refl);

/**
 * L\*a\*b\* of up to three inks from their L\*a\*b\* alone: tints as EstimateTintColor(),
 * overprints as CombineInkColorsEx(). Three inks without a solid among them are predicted as a
 * neutral, a\* = b\* = 0.
 * @param[in]  n        number of inks, 1 to 3
 * @param[in]  inks     L\*a\*b\* of the solids, one after the other: 3 n values
 * @param[in]  percent  tint of each ink, n values from 0 to 100
 * @param[in]  paper    L\*a\*b\* of the paper
 * @param[out] lab      predicted L\*a\*b\*
 * @return 1; 0 for a null pointer, or a number or percentage out of range.
 */
VANTREL_API int EstimateColor(int n, const double *inks, const int *percent, const double *paper,
                              double *lab);

/** L\*a\*b\* of a tint: ink and paper mixed.
 * @return 1; 0 for a null pointer or a percentage outside 0 to 100. */
VANTREL_API int EstimateTintColor(const double *ink, int percent, const double *paper, double *lab);

/**
 * Display value (see XYZtoRGB()) of a tint: the lightnesses of ink and paper mixed, a\* and b\* of
 * the ink. Any percentage is taken as it is.
 * @return 1; 0 for a null pointer or an unknown combination.
 */
VANTREL_API int CalculateTintColor(const double *ink, const double *paper, int percent,
                                   int illumObs, unsigned int *rgb);

/**
 * Where along the spectrum the a\* and the b\* difference of two spectra comes from: per band the
 * signed cube root of its difference in X/Xn − Y/Yn (in Y/Yn − Z/Zn), scaled so that the largest
 * magnitude is 100. Positive where the second spectrum is redder (yellower).
 * @param[in]  first,second  spectra, 31 values in percent
 * @param[in]  illumObs      illuminant and observer
 * @param[out] a,b           31 weights each, all 0 without a difference; either may be null
 * @return 1; 0 for a null spectrum, two null outputs, or an unknown combination.
 */
VANTREL_API int ReflToABErrorWeights(const double *first, const double *second, int illumObs,
                                     double *a, double *b);

/** @} */

#ifdef __cplusplus
} /* extern "C" */

/** @name Typed records (C++)
 *  @{ */

/** L\*C\*h of L\*a\*b\*; a\* and b\* are rounded to two decimals when `round`.
 * @return true; false for a null pointer. */
VANTREL_API bool CIELabToCIELCh(CIELABCOORD *lab, CIELCHCOORD *lch, bool round);

/**
 * L\*, a\*, b\*, C\*, h (five floats) of a spectrum in single precision; C\* and h as
 * ReflToCIELCH().
 * @return 1; 0 for a null pointer or an unknown combination.
 */
VANTREL_API int CalcLabch(const double *refl, ILLUM_OBS illumObs, float *labch);

/** The CIEDE2000 formula and its helpers (CIE 142); LabToDE2000Ex() in other words. */
class VANTREL_API CIEDE2000 {
public:
    CIEDE2000();
    ~CIEDE2000();

    /** Compares L\*a\*b\* records. @return ΔE00 with the parametric factors kL, kC, kH. */
    double Calculate(const CIELABCOORD &first, const CIELABCOORD &second, double kL, double kC,
                     double kH);
    /** A not-a-number counts as zero. @return whether the magnitude is at most the tolerance. */
    bool IsZero(double value, double tolerance);
    /** Radians to degrees. @return the angle, a negative one counted from 360 downward. */
    double ConvertToDegrees(double radians);
    /** Degrees to radians. @return the angle. */
    double ConvertToRadians(double degrees);

private:
    double pow25To7;
};

/** @} */

/** @name Densities (C++)
 *  Pointers are not checked, except by CalculateSpecialDensity().
 *  @{ */

/** The density of a reflectance in percent. @return -log10 of it, floored at 0.00001 % (D = 7). */
VANTREL_API double CalculateSpectralDensity(double refl);

/**
 * A spectrum with its contrast against the paper exaggerated: in every band the density above the
 * paper is tripled, or doubled where it is more than 0.5. An exact 0 counts as density 100.
 * @param[in]  refl,paper  spectra, 31 values in percent
 * @param[out] adjusted    31 values in percent
 */
VANTREL_API void AdjustForPaperRefls(const double *refl, const double *paper, double *adjusted);

/** The largest density above 0 of a set and its response, the lowest response on a tie; 0 and
 * `response` as it was where there is none. The visual density counts when `includeVisual` is not
 * 0. */
VANTREL_API void FindDensityMax(DENSITYSTRUCT *densities, double &density, int &response,
                                int includeVisual);

/** The smallest density below 100 of a set that is not exactly 0; 100 and `response` as it was
 * where there is none. Otherwise as FindDensityMax(). */
VANTREL_API void FindDensityMin(DENSITYSTRUCT *densities, double &density, int &response,
                                int includeVisual);

/**
 * The density of any window.
 * @param[in] refl     spectrum, 31 values in percent
 * @param[in] centre   band under weights[width / 2]
 * @param[in] weights  `width` weights
 * @param[in] width    number of bands
 * @return the density; 5 where the windowed sum is 0 or less; 0 for a null pointer or a window that
 *         reaches outside the spectrum.
 */
VANTREL_API double CalculateSpecialDensity(const double *refl, int centre, double *weights,
                                           int width);

/** @} */

/** @name Print attributes (C++)
 *  @{ */

/**
 * The density of a sample in percent of that of a reference, both absolute and in the response that
 * DetermineDensityResponse() gives for the reference.
 * @param[in] reference,sample  spectra, 31 values in percent; not checked, neither may be null
 * @param[in] status            density status
 * @return the ratio, at most 1000. A density that cannot be measured counts as 0; over a reference
 *         of density 0 the ratio is 1000 for a sample above 0 and otherwise 0.
 */
VANTREL_API double DensityRatio(const double *reference, const double *sample, int status);

/** @} */

/** @name Ink films (C++)
 *  Pointers are not checked.
 *  @{ */

/**
 * Saunderson's correction (J. Opt. Soc. Am. 32, 1942, 727): the internal reflectance of a layer.
 * @param refl  measured reflectance in percent
 * @param k1    fraction that the surface reflects outside
 * @param k2    fraction that the surface reflects inside
 * @return (r − k1) / (1 − k1 − k2 + k2 r) with r of 1, in percent.
 */
VANTREL_API double Saunderson(double refl, double k1, double k2);

/** The inverse of Saunderson(). Like it, it divides as IEEE arithmetic does where k1 and k2 make a
 * denominator 0.
 * @return the measured reflectance of an internal one; one below 0.0001 as it is. */
VANTREL_API double UnSaunderson(double refl, double k1, double k2);

/**
 * Spectrum of an ink printed as a thinner or thicker film: Beer-Lambert between Saunderson
 * corrections with k1 = 0 and k2 = 0.6. Where the ink is lighter than the paper the result is the
 * paper; a band in which the ink is below 0.0001 keeps the value of the ink, and over a paper of 0
 * a band is 0.
 * @param[in]  ink        spectrum of the solid on the paper, 31 values in percent
 * @param[in]  thickness  relative to the solid: 0 is the paper, 1 the solid
 * @param[in]  paper      spectrum of the paper
 * @param[out] refl       spectrum of the film
 */
VANTREL_API void EstimateReflsForThickness(const double *ink, double thickness, const double *paper,
                                           double *refl);

/** A tint as a film: EstimateReflsForThickness() with a thickness of percent / 100. */
VANTREL_API void EstimateReflsForTintColorForBestVisualColor(const double *ink, int percent,
                                                             const double *paper, double *refl);

/** @} */
#endif

#endif
