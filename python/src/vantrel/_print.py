"""How a print shows its inks.

What is computed from densities follows ANSI CGATS.4. Functions of spectra in percent measure every
patch in one status and response as refl_to_density() does, over the paper or, with None, absolutely.
"""

from ._function import function
from ._kinds import (
    HueStatus,
    InkResponse,
    Integers,
    Numbers,
    OptionalSpectra,
    Reading,
    Spectra,
    StatusName,
)


@function("dot_area")
def density_to_dot_area(solid_density: "Numbers", tint_density: "Numbers", n_factor: "Numbers" = 1):
    """Dot area of tints in percent (Yule and Nielsen 1951; n = 1: Murray and Davies 1936).

    Not clamped; 100 for a solid of density 0. An n-factor of 0 is refused.

    >>> print(np.round(vantrel.density_to_dot_area(1.5, [0.1, 0.3, 0.8]), 1))
    [21.2 51.5 86.9]
    """


@function("tint_density")
def density_from_dot_area(solid_density: "Numbers", dot_area: "Numbers", n_factor: "Numbers" = 1):
    """Density of tints of a dot area in percent: density_to_dot_area() backwards, to 7 digits.

    >>> print(np.round(vantrel.density_from_dot_area(1.5, [20, 50]), 3))
    [0.093 0.288]
    """


@function("dot_area")
def refl_to_dot_area(
    solid: "Spectra",
    tint: "Spectra",
    paper: "OptionalSpectra",
    status: "StatusName",
    response: "Reading",
    n_factor: "Numbers" = 1,
):
    """Dot area in percent of measured tints; as density_to_dot_area().

    >>> print(np.round(vantrel.refl_to_dot_area(magenta, tint, paper, "E", "GREEN"), 1))
    50.0
    """


@function("dot_gain")
def refl_to_dot_gain(
    solid: "Spectra",
    tint: "Spectra",
    paper: "OptionalSpectra",
    status: "StatusName",
    response: "Reading",
    n_factor: "Numbers",
    nominal_dot_area: "Integers",
):
    """Dot gain: how many percent the dot area has over the nominal one, at least 0.

    >>> print(np.round(vantrel.refl_to_dot_gain(magenta, tint, paper, "E", "GREEN", 1, 40), 1))
    10.0
    """


@function("contrast")
def density_to_print_contrast(solid_density: "Numbers", tint_density: "Numbers"):
    """Print contrast 100 (Ds - Dt) / Ds in percent. A solid density of 0 is refused.

    >>> print(np.round(vantrel.density_to_print_contrast(1.5, 1.0), 1))
    33.3
    """


@function("contrast")
def refl_to_print_contrast(
    solid: "Spectra",
    tint: "Spectra",
    paper: "OptionalSpectra",
    status: "StatusName",
    response: "Reading",
):
    """Print contrast in percent of a measured solid and shadow tint.

    >>> print(np.round(vantrel.refl_to_print_contrast(magenta, tint, paper, "E", "GREEN"), 1))
    71.8
    """


@function("trap")
def density_to_trap(
    overprint_density: "Numbers", second_density: "Numbers", first_density: "Numbers"
):
    """Apparent trap 100 (Dop - D1) / D2 in percent (Preucil 1958).

    How much of the second-down ink an overprint has taken up; a second density of 0 is refused.

    >>> print(np.round(vantrel.density_to_trap(1.6, 1.2, 0.5), 1))
    91.7
    """


@function("trap")
def refl_to_trap(
    second: "Spectra",
    first: "Spectra",
    overprint: "Spectra",
    paper: "OptionalSpectra",
    status: "StatusName",
    response: "Reading",
):
    """Apparent trap in percent of measured patches: second-down ink, first-down ink, overprint.

    >>> print(np.round(vantrel.refl_to_trap(magenta, yellow, np.minimum(magenta, yellow),
    ...     paper, "E", "GREEN"), 1))
    100.5
    """


@function("grayness", "hue_error")
def density_to_hue_gray(red_density: "Numbers", green_density: "Numbers", blue_density: "Numbers"):
    """Grayness 100 L / H and hue error 100 (M - L) / (H - L) in percent (GATF colour diagram).

    L, M and H are the lowest, middle and highest of the three densities.

    >>> print(np.round(vantrel.density_to_hue_gray(0.1, 1.4, 0.6), 1))
    [ 7.1 38.5]
    """


@function("grayness", "hue_error")
def refl_to_hue_gray(spectra: "Spectra", paper: "OptionalSpectra", status: "HueStatus"):
    """Grayness and hue error in percent of measured inks, under any status but SPECTRALX_STATUS.

    >>> print(np.round(vantrel.refl_to_hue_gray(magenta, paper, "E"), 1))
    [0.1 0.1]
    """


@function("refl")
def density_to_integrated_refl(density: "Numbers", status: "HueStatus", response: "InkResponse"):
    """Reflectance in percent times bands under the response curve: 10^7 / (peak weight 10^D).

    A density of 0 or less is refused.

    >>> print(np.round(vantrel.density_to_integrated_refl(1.2, "E", "GREEN"), 3))
    33.515
    """


@function("intercept")
def refl_to_pol_intercept(
    spectra: "Spectra", red_density: "Numbers", green_density: "Numbers", blue_density: "Numbers"
):
    """How far spectra lie above three densities read through a polarisation filter.

    In hundredths of a percent of Status E reflectance, in the spectrum's own response.

    >>> print(np.round(vantrel.refl_to_pol_intercept(magenta, 0.1, 1.4, 0.6), 1))
    743.0
    """


@function("refl")
def color_at_equivalent_density(reference: "Spectra", sample: "Spectra", status: "StatusName"):
    """Spectra of a sample printed at the density of a reference.

    K/S divided by density_ratio() in every band (Kubelka and Munk 1931, opaque layer).

    >>> print(np.round(vantrel.color_at_equivalent_density(magenta, tint, "E")[[0, 15]], 2))
    [75.6  29.11]
    """


@function("ratio")
def density_ratio(reference: "Spectra", sample: "Spectra", status: "StatusName"):
    """Density of a sample in percent of that of a reference, in the response of the reference.

    At most 1000.

    >>> print(np.round(vantrel.density_ratio(magenta, tint, "E"), 1))
    33.6
    """
