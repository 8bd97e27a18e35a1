"""What a paper looks like, and how far a pair moves apart with the light."""

from ._function import function
from ._kinds import Colours, Illuminant, Spectra, WhitenessIlluminant


@function("brightness")
def refl_to_brightness(spectra: "Spectra"):
    """Blue-weighted brightness in percent, 400 to 520 nm, in the manner of the R457 of ISO 2470."""


@function("metamerism")
def metamerism(
    standard: "Spectra",
    sample: "Spectra",
    illum_obs1: "Illuminant",
    illum_obs2: "Illuminant",
):
    """The CIE 1976 difference of a pair under one illuminant plus that under another.

    refl_to_din6172() tells how far the difference moves.
    """


@function("whiteness")
def refl_to_white_e313_98(spectra: "Spectra", illum_obs: "WhitenessIlluminant" = "D50_2DEG"):
    """Whiteness index of ASTM E313-98, for illuminants C, D50 and D65.

    Refused: a whiteness W outside 40 < W < 5 Y - 280, which describes no white, and black.
    """


@function("whiteness")
def cie_yxy_to_white_e313_98(Yxy: "Colours", illum_obs: "WhitenessIlluminant" = "D50_2DEG"):
    """Whiteness of Y, x, y as refl_to_cie_yxy() gives them; as refl_to_white_e313_98()."""
