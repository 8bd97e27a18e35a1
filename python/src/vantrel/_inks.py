"""What inks will measure over one another and as tints, before they are printed.

Percentages run from 0 (bare paper) to 100 (the ink as measured); an overprint lists the inks in the
order of printing. Spectra are in percent.
"""

from ._function import function
from ._kinds import Colours, Illuminant, Inks, Integers, Numbers, OptionalSpectra, Spectra


@function("refl")
def combine_ink_colors(spectra1: "Spectra", spectra2: "Spectra"):
    """Spectra of two inks over one another; the inks commute.

    In each band the density of the denser ink and a share of the other's where that is above 0.6.

    >>> print(np.round(vantrel.combine_ink_colors(magenta, yellow)[[0, 15, 30]], 2))
    [10. 10. 85.]
    """


@function("refl")
def combine_3_ink_colors(spectra1: "Spectra", spectra2: "Spectra", spectra3: "Spectra"):
    """Spectra of three inks: combine_ink_colors() of the first two, then of the third.

    >>> print(np.round(vantrel.combine_3_ink_colors(cyan, magenta, yellow)[[0, 15, 30]], 2))
    [10. 10. 10.]
    """


@function("lab")
def combine_ink_colors_ex(lab1: "Colours", lab2: "Colours"):
    """Mean of two L*a*b*, in place of an overprint.

    >>> print(np.round(vantrel.combine_ink_colors_ex([50, 70, 0], [90, 0, 90]), 2))
    [70. 35. 45.]
    """


@function("lab")
def combine_3_ink_colors_ex(lab1: "Colours", lab2: "Colours", lab3: "Colours"):
    """Sum of three L*a*b* times 0.3333333 each, in place of an overprint.

    >>> print(np.round(vantrel.combine_3_ink_colors_ex([50, -30, -50], [50, 70, 0], [90, 0,
    ...     90]), 2))
    [63.33 13.33 13.33]
    """


@function("refl")
def estimate_refls(inks: "Inks", percent: "Integers", paper: "Spectra"):
    """Spectra of one to three inks as halftone tints over one another.

    `inks` holds the solids on the paper (..., n, 31), `percent` the tint of each (..., n), 0 to
    100; a percentage out of range is refused. Tints mix ink and paper by area (Murray-Davies).

    >>> print(np.round(vantrel.estimate_refls([magenta, yellow], [50, 100], paper)[[0, 15,
    ...     30]], 2))
    [10.  47.5 85. ]
    """


@function("refl")
def estimate_refls_for_best_visual_color(inks: "Inks", percent: "Integers", paper: "Spectra"):
    """As estimate_refls(), with tints as thinner films: estimate_refls_for_thickness().

    >>> print(np.round(vantrel.estimate_refls_for_best_visual_color([magenta, yellow], [50,
    ...     100], paper)[[0, 15, 30]], 2))
    [10.  24.7 85. ]
    """


@function("refl")
def estimate_refls_ex(
    n: "Integers",
    first: "Spectra",
    second: "OptionalSpectra",
    third: "OptionalSpectra",
    percent: "Integers",
    paper: "Spectra",
):
    """estimate_refls() of inks in arrays of their own, of which the first n count.

    Three percentages always; an ink that n asks for but that is None reflects nothing.

    >>> print(np.round(vantrel.estimate_refls_ex(2, magenta, yellow, None, [50, 100, 0],
    ...     paper)[[0, 15, 30]], 2))
    [10.  47.5 85. ]
    """


@function("refl")
def estimate_refls_ex_for_best_visual_color(
    n: "Integers",
    first: "Spectra",
    second: "OptionalSpectra",
    third: "OptionalSpectra",
    percent: "Integers",
    paper: "Spectra",
):
    """estimate_refls_for_best_visual_color() of inks in arrays of their own.

    >>> print(np.round(vantrel.estimate_refls_ex_for_best_visual_color(2, magenta, yellow,
    ...     None, [50, 100, 0], paper)[[0, 15, 30]], 2))
    [10.  24.7 85. ]
    """


@function("refl")
def estimate_refls_for_tint_color(ink: "Spectra", percent: "Integers", paper: "Spectra"):
    """Spectra of halftone tints: ink and paper mixed by area (Murray-Davies), any percentage.

    >>> print(np.round(vantrel.estimate_refls_for_tint_color(magenta, 50, paper)[[0, 15,
    ...     30]], 2))
    [85.  47.5 85. ]
    """


@function("refl")
def estimate_refls_for_tint_color_for_best_visual_color(
    ink: "Spectra", percent: "Integers", paper: "Spectra"
):
    """Tints as films: estimate_refls_for_thickness() with a thickness of percent / 100.

    >>> print(np.round(vantrel.estimate_refls_for_tint_color_for_best_visual_color(magenta,
    ...     50, paper)[[0, 15, 30]], 2))
    [85.  24.7 85. ]
    """


@function("refl")
def estimate_refls_for_thickness(ink: "Spectra", thickness: "Numbers", paper: "Spectra"):
    """Spectra of inks printed as thinner or thicker films: thickness 0 is the paper, 1 the solid.

    Beer-Lambert between Saunderson corrections with k1 = 0 and k2 = 0.6.

    >>> print(np.round(vantrel.estimate_refls_for_thickness(magenta, 0.8, paper)[[0, 15,
    ...     30]], 2))
    [85.  14.1 85. ]
    """


@function("lab")
def estimate_color(inks: "Inks", percent: "Integers", paper: "Colours"):
    """L*a*b* of one to three inks from their L*a*b* alone.

    `inks` holds the solids (..., n, 3), `percent` the tint of each (..., n), 0 to 100. Three tints
    without a solid among them are predicted as a neutral.

    >>> print(np.round(vantrel.estimate_color([[50, 70, 0], [90, 0, 90]], [50, 100], [93,
    ...     0, -3]), 2))
    [80.75 17.5  44.25]
    """


@function("lab")
def estimate_tint_color(ink: "Colours", percent: "Integers", paper: "Colours"):
    """L*a*b* of tints: ink and paper mixed. A percentage outside 0 to 100 is refused.

    >>> print(np.round(vantrel.estimate_tint_color([50, 70, 0], 50, [93, 0, -3]), 2))
    [71.5 35.  -1.5]
    """


@function("rgb")
def calculate_tint_color(
    ink: "Spectra", paper: "Spectra", percent: "Integers", illum_obs: "Illuminant" = "D50_2DEG"
):
    """Screen preview (see xyz_to_rgb()) of tints: lightness mixed, a* and b* of the ink.

    >>> print(vantrel.calculate_tint_color(magenta, paper, 50))
    16747519
    """


@function("a", "b")
def refl_to_ab_error_weights(
    spectra1: "Spectra", spectra2: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"
):
    """Where along the spectrum the a* and the b* difference comes from: (a, b).

    31 weights each, the largest magnitude 100, positive where the second is redder (yellower).

    >>> a, b = vantrel.refl_to_ab_error_weights(paper, tint)
    >>> print(nm[a.argmax()], nm[abs(b).argmax()])
    530 550
    """


@function("refl")
def saunderson(refl: "Numbers", k1: "Numbers", k2: "Numbers"):
    """Internal reflectance in percent of a layer (Saunderson, J. Opt. Soc. Am. 32, 1942, 727).

    k1 and k2 are the fractions that the surface reflects outside and inside.

    >>> print(np.round(vantrel.saunderson(50, 0.04, 0.6), 2))
    69.7
    """


@function("refl")
def un_saunderson(refl: "Numbers", k1: "Numbers", k2: "Numbers"):
    """Measured reflectance in percent of an internal one: saunderson() backwards.

    >>> print(np.round(vantrel.un_saunderson(70, 0.04, 0.6), 2))
    50.34
    """
