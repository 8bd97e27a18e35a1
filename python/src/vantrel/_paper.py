"""What a paper looks like, and how far a pair moves apart with the light."""

from ._function import function
from ._kinds import Colours, Illuminant, Spectra, WhitenessIlluminant


@function("brightness")
def refl_to_brightness(spectra: "Spectra"):
    """Blue-weighted brightness in percent, 400 to 520 nm, in the manner of the R457 of ISO 2470.

    >>> print(np.round(vantrel.refl_to_brightness(paper), 2))
    85.0
    """


@function("metamerism")
def metamerism(
    standard: "Spectra",
    sample: "Spectra",
    illum_obs1: "Illuminant",
    illum_obs2: "Illuminant",
):
    """The CIE 1976 difference of a pair under one illuminant plus that under another.

    refl_to_din6172() tells how far the difference moves.

    >>> print(np.round(vantrel.metamerism(magenta, tint, "D50_2DEG", "A_2DEG"), 2))
    99.56
    """


@function("whiteness")
def refl_to_white_e313_98(spectra: "Spectra", illum_obs: "WhitenessIlluminant" = "D50_2DEG"):
    """Whiteness index of ASTM E313-98, for illuminants C, D50 and D65.

    Refused: a whiteness W outside 40 < W < 5 Y - 280, which describes no white, and black.

    >>> print(np.round(vantrel.refl_to_white_e313_98(paper), 2))
    85.05
    """


@function("whiteness")
def cie_yxy_to_white_e313_98(Yxy: "Colours", illum_obs: "WhitenessIlluminant" = "D50_2DEG"):
    """Whiteness of Y, x, y as refl_to_cie_yxy() gives them; as refl_to_white_e313_98().

    >>> print(np.round(vantrel.cie_yxy_to_white_e313_98([85, 0.3457, 0.3585]), 2))
    85.0
    """
