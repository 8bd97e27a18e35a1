"""From spectra to colours, and from one colour space to another.

XYZ has Y = 100 for the perfect white; angles are in degrees.
"""

from ._function import function
from ._kinds import Colours, Illuminant, Integers, Spectra


@function("xyz")
def refl_to_xyz(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE XYZ of spectra in percent; Y is 100 for the perfect white.

    Weighted sums with the 10 nm weights of ASTM E308 (F12: its own table).
    """


@function("x", "y", "z")
def refl_to_xyzs(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """What each band contributes to X, Y and Z: (x, y, z), which sum to refl_to_xyz()."""


@function("lab")
def refl_to_cielab(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE 1976 L*a*b* (CIE 15) of spectra in percent."""


@function("lab")
def xyz_to_cielab(xyz: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE 1976 L*a*b* (CIE 15) of XYZ, relative to the white point of the combination."""


@function("lch")
def refl_to_cielch(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """L*C*h (h in degrees) of spectra in percent.

    a* and b* are rounded to two decimals first; a neutral has C* = 0.000001 and h = 0.
    """


@function("lch")
def xyz_to_cielch(xyz: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """L*C*h (h in degrees) of XYZ, rounded as refl_to_cielch() does."""


@function("lch")
def cielab_to_cielch(lab: "Colours"):
    """L*C*h (h in degrees) of L*a*b*, rounded as refl_to_cielch() does."""


@function("lch")
def cielab_to_cielch_ex(lab: "Colours", round: "Integers"):
    """L*C*h of L*a*b*; a* and b* are rounded to two decimals when `round` is not 0.

    An a* of 0 counts as 0.000001 either way.
    """


@function("lab")
def cielch_to_cielab(lch: "Colours"):
    """L*a*b* of L*C*h, without rounding."""


@function("luv")
def refl_to_cieluv(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE 1976 L*u*v* (CIE 15) of spectra in percent; black has u* = v* = 0."""


@function("luv")
def xyz_to_cieluv(xyz: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE 1976 L*u*v* (CIE 15) of XYZ; u* = v* = 0 where X + 15 Y + 3 Z is 0."""


@function("Yxy")
def refl_to_cie_yxy(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """Y, x, y (CIE 15) of spectra in percent. Black, X + Y + Z = 0, is refused."""


@function("Yxy")
def xyz_to_cie_yxy(xyz: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """Y, x, y (CIE 15) of XYZ. X + Y + Z = 0 is refused; the combination plays no part."""


@function("x", "y", "z")
def xyz_to_xyz(xyz: "Colours"):
    """Chromaticity coordinates (x, y, z) of XYZ, one array each. X + Y + Z = 0 is refused."""


@function("hunter")
def refl_to_hunter_lab(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """Hunter L, a, b of spectra in percent, with the Ka and Kb of the combination.

    X + Y + Z = 0 is refused.
    """


@function("xyz")
def lab_to_xyz(lab: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """XYZ of L*a*b*, with the ratios to the white point rounded to six decimals."""


@function("rgb")
def refl_to_rgb(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """Screen preview of spectra: red | green << 8 | blue << 16 of one fixed display, clipped."""


@function("rgb")
def xyz_to_rgb(xyz: "Colours"):
    """Screen preview of XYZ: red | green << 8 | blue << 16 of one fixed display, clipped."""


@function("rgb")
def unpack_rgb(packed: "Integers"):
    """Red, green and blue, 0 to 255 each, of packed colours such as refl_to_rgb() gives."""


@function("labch")
def calc_labch(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """L*, a*, b*, C*, h of spectra in single precision; C* and h as refl_to_cielch()."""
