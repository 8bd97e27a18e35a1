"""Readings as through a polarisation filter, which takes away what the surface of a film reflects.

A spectrum is scaled by one factor: a target reading of a channel over the reading that the spectrum
has. `targets` are four readings in the order red, green, blue, second blue, in the units of the sum
of weight times reflectance; `weights` are the four curves of 31 values. A mean factor above 1 is
refused: a filter adds no light.
"""

from ._function import function
from ._kinds import (
    HueStatus,
    Integers,
    Numbers,
    OptionalSpectra,
    OptionalTargets,
    Reading,
    ResponseName,
    Spectra,
    StatusName,
)


@function("refl")
def pol_refl_adjust(
    spectra: "Spectra", response: "ResponseName", targets: "Numbers", weights: "Numbers"
):
    """Spectra as the channel of a response adjusts them.

    >>> print(np.round(vantrel.pol_refl_adjust(magenta, "GREEN", [1000] * 4, np.ones((4,
    ...     31)))[[0, 15]], 2))
    [43.37  5.1 ]
    """


@function("refl")
def pol_refl_auto_adjust(spectra: "Spectra", targets: "Numbers", weights: "Numbers"):
    """pol_refl_adjust() in the response of determine_density_response() under E_STATUS.

    >>> print(np.round(vantrel.pol_refl_auto_adjust(magenta, [1000] * 4, np.ones((4,
    ...     31)))[[0, 15]], 2))
    [43.37  5.1 ]
    """


@function("response")
def pol_determine_density_response(
    spectra: "Spectra",
    targets: "Numbers",
    status: "StatusName",
    paper: "OptionalSpectra",
    paper_targets: "OptionalTargets",
    weights: "Numbers",
):
    """determine_density_response() of adjusted spectra over an adjusted paper.

    0, which is also the visual response, where an adjustment fails.

    >>> print(vantrel.pol_determine_density_response(magenta, [1000] * 4, "E", paper,
    ...     [2000] * 4, np.ones((4, 31))))
    2
    """


@function("density")
def pol_refl_to_density(
    spectra: "Spectra",
    targets: "Numbers",
    paper: "OptionalSpectra",
    paper_targets: "OptionalTargets",
    weights: "Numbers",
    status: "StatusName",
    response: "Reading",
):
    """refl_to_density() of spectra over the paper, each after pol_refl_auto_adjust().

    >>> print(np.round(vantrel.pol_refl_to_density(magenta, [1000] * 4, paper, [2000] * 4,
    ...     np.ones((4, 31)), "E", "GREEN"), 3))
    1.045
    """


@function("densities")
def pol_refl_to_densities(
    spectra: "Spectra",
    targets: "Numbers",
    paper: "OptionalSpectra",
    paper_targets: "OptionalTargets",
    weights: "Numbers",
    status: "StatusName",
):
    """refl_to_densities() with the spectrum adjusted for each response on its own.

    >>> print(np.round(vantrel.pol_refl_to_densities(magenta, [1000] * 4, paper,
    ...     [2000] * 4, np.ones((4, 31)), "E"), 2))
    [0.5  0.17 1.04 0.17 0.   0.   0.   0.   0.  ]
    """


@function("grayness", "hue_error")
def pol_refl_to_hue_gray(
    spectra: "Spectra",
    targets: "Numbers",
    paper: "OptionalSpectra",
    paper_targets: "OptionalTargets",
    weights: "Numbers",
    status: "HueStatus",
):
    """Grayness and hue error in percent of pol_refl_to_densities().

    >>> print(np.round(vantrel.pol_refl_to_hue_gray(magenta, [1000] * 4, paper, [2000] * 4,
    ...     np.ones((4, 31)), "E"), 1))
    [16.6  0.1]
    """


@function("dot_area")
def pol_refl_to_dot_area(
    solid: "Spectra",
    solid_targets: "Numbers",
    tint: "Spectra",
    tint_targets: "Numbers",
    paper: "OptionalSpectra",
    paper_targets: "OptionalTargets",
    weights: "Numbers",
    status: "StatusName",
    response: "Reading",
    n_factor: "Numbers" = 1,
):
    """refl_to_dot_area() in percent of spectra, each after pol_refl_auto_adjust().

    >>> print(np.round(vantrel.pol_refl_to_dot_area(magenta, [1000] * 4, tint, [1500] * 4,
    ...     paper, [2000] * 4, np.ones((4, 31)), "E", "GREEN"), 1))
    56.3
    """


@function("dot_gain")
def pol_refl_to_dot_gain(
    solid: "Spectra",
    solid_targets: "Numbers",
    tint: "Spectra",
    tint_targets: "Numbers",
    paper: "OptionalSpectra",
    paper_targets: "OptionalTargets",
    weights: "Numbers",
    status: "StatusName",
    response: "Reading",
    n_factor: "Numbers",
    nominal_dot_area: "Integers",
):
    """refl_to_dot_gain() in percent of spectra, each after pol_refl_auto_adjust().

    >>> print(np.round(vantrel.pol_refl_to_dot_gain(magenta, [1000] * 4, tint, [1500] * 4,
    ...     paper, [2000] * 4, np.ones((4, 31)), "E", "GREEN", 1, 40), 1))
    16.3
    """


@function("contrast")
def pol_refl_to_print_contrast(
    solid: "Spectra",
    solid_targets: "Numbers",
    tint: "Spectra",
    tint_targets: "Numbers",
    paper: "OptionalSpectra",
    paper_targets: "OptionalTargets",
    weights: "Numbers",
    status: "StatusName",
    response: "Reading",
):
    """refl_to_print_contrast() in percent of spectra, each after pol_refl_auto_adjust().

    >>> print(np.round(vantrel.pol_refl_to_print_contrast(magenta, [1000] * 4, tint,
    ...     [1500] * 4, paper, [2000] * 4, np.ones((4, 31)), "E", "GREEN"), 1))
    70.2
    """


@function("trap")
def pol_refl_to_trap(
    second: "Spectra",
    second_targets: "Numbers",
    first: "Spectra",
    first_targets: "Numbers",
    overprint: "Spectra",
    overprint_targets: "Numbers",
    paper: "OptionalSpectra",
    paper_targets: "OptionalTargets",
    weights: "Numbers",
    status: "StatusName",
    response: "Reading",
):
    """refl_to_trap() in percent of spectra, each after pol_refl_auto_adjust().

    >>> print(np.round(vantrel.pol_refl_to_trap(magenta, [1000] * 4, yellow, [1000] * 4,
    ...     np.minimum(magenta, yellow), [500] * 4, paper, [2000] * 4, np.ones((4, 31)), "E", "GREEN"), 1))
    95.1
    """
