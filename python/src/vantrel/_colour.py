"""From spectra to colours, and from one colour space to another.

XYZ has Y = 100 for the perfect white; angles are in degrees.
"""

from ._function import function
from ._kinds import Colours, Illuminant, Integers, Spectra


@function("xyz")
def refl_to_xyz(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE XYZ of spectra in percent; Y is 100 for the perfect white.

    Weighted sums with the 10 nm weights of ASTM E308 (F12: its own table).

    >>> print(np.round(vantrel.refl_to_xyz(paper), 2))
    [81.96 85.   70.15]
    """


@function("x", "y", "z")
def refl_to_xyzs(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """What each band contributes to X, Y and Z: (x, y, z), which sum to refl_to_xyz().

    >>> print([part.shape for part in vantrel.refl_to_xyzs(paper)])
    [(31,), (31,), (31,)]
    """


@function("lab")
def refl_to_cielab(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE 1976 L*a*b* (CIE 15) of spectra in percent.

    >>> print(np.round(vantrel.refl_to_cielab(magenta), 2))
    [ 65.08  74.96 -45.95]
    """


@function("lab")
def xyz_to_cielab(xyz: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE 1976 L*a*b* (CIE 15) of XYZ, relative to the white point of the combination.

    >>> print(np.round(vantrel.xyz_to_cielab([40, 30, 25]), 2))
    [61.65 38.19 -0.44]
    """


@function("lch")
def refl_to_cielch(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """L*C*h (h in degrees) of spectra in percent.

    a* and b* are rounded to two decimals first; a neutral has C* = 0.000001 and h = 0.

    >>> print(np.round(vantrel.refl_to_cielch(magenta), 2))
    [ 65.08  87.92 328.49]
    """


@function("lch")
def xyz_to_cielch(xyz: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """L*C*h (h in degrees) of XYZ, rounded as refl_to_cielch() does.

    >>> print(np.round(vantrel.xyz_to_cielch([40, 30, 25]), 2))
    [ 61.65  38.19 359.34]
    """


@function("lch")
def cielab_to_cielch(lab: "Colours"):
    """L*C*h (h in degrees) of L*a*b*, rounded as refl_to_cielch() does.

    >>> print(np.round(vantrel.cielab_to_cielch([50, 3, 4]), 2))
    [50.    5.   53.13]
    """


@function("lch")
def cielab_to_cielch_ex(lab: "Colours", round: "Integers"):
    """L*C*h of L*a*b*; a* and b* are rounded to two decimals when `round` is not 0.

    An a* of 0 counts as 0.000001 either way.

    >>> print(np.round(vantrel.cielab_to_cielch_ex([50, 3, 4.001], 0), 4))
    [50.      5.0008 53.137 ]
    """


@function("lab")
def cielch_to_cielab(lch: "Colours"):
    """L*a*b* of L*C*h, without rounding.

    >>> print(np.round(vantrel.cielch_to_cielab([50, 5, 90]), 2))
    [50.  0.  5.]
    """


@function("luv")
def refl_to_cieluv(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE 1976 L*u*v* (CIE 15) of spectra in percent; black has u* = v* = 0.

    >>> print(np.round(vantrel.refl_to_cieluv(magenta), 2))
    [ 65.08  82.43 -75.03]
    """


@function("luv")
def xyz_to_cieluv(xyz: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """CIE 1976 L*u*v* (CIE 15) of XYZ; u* = v* = 0 where X + 15 Y + 3 Z is 0.

    >>> print(np.round(vantrel.xyz_to_cieluv([40, 30, 25]), 2))
    [61.65 59.33 -8.17]
    """


@function("Yxy")
def refl_to_cie_yxy(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """Y, x, y (CIE 15) of spectra in percent. Black, X + Y + Z = 0, is refused.

    >>> print(np.round(vantrel.refl_to_cie_yxy(magenta), 4))
    [34.1422  0.3704  0.2144]
    """


@function("Yxy")
def xyz_to_cie_yxy(xyz: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """Y, x, y (CIE 15) of XYZ. X + Y + Z = 0 is refused; the combination plays no part.

    >>> print(np.round(vantrel.xyz_to_cie_yxy([40, 30, 30]), 4))
    [30.   0.4  0.3]
    """


@function("x", "y", "z")
def xyz_to_xyz(xyz: "Colours"):
    """Chromaticity coordinates (x, y, z) of XYZ, one array each. X + Y + Z = 0 is refused.

    >>> print(np.round(vantrel.xyz_to_xyz([40, 30, 30]), 4))
    [0.4 0.3 0.3]
    """


@function("hunter")
def refl_to_hunter_lab(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """Hunter L, a, b of spectra in percent, with the Ka and Kb of the combination.

    X + Y + Z = 0 is refused.

    >>> print(np.round(vantrel.refl_to_hunter_lab(magenta), 2))
    [ 58.43  80.24 -45.99]
    """


@function("xyz")
def lab_to_xyz(lab: "Colours", illum_obs: "Illuminant" = "D50_2DEG"):
    """XYZ of L*a*b*, with the ratios to the white point rounded to six decimals.

    >>> print(np.round(vantrel.lab_to_xyz([50, 20, -10]), 2))
    [21.77 18.42 19.57]
    """


@function("rgb")
def refl_to_rgb(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """Screen preview of spectra: red | green << 8 | blue << 16 of one fixed display, clipped.

    >>> print(vantrel.refl_to_rgb(magenta, "D65_2DEG"))
    16732927
    """


@function("rgb")
def xyz_to_rgb(xyz: "Colours"):
    """Screen preview of XYZ: red | green << 8 | blue << 16 of one fixed display, clipped.

    >>> print(vantrel.xyz_to_rgb([40, 30, 30]))
    11112959
    """


@function("rgb")
def unpack_rgb(packed: "Integers"):
    """Red, green and blue, 0 to 255 each, of packed colours such as refl_to_rgb() gives.

    >>> print(vantrel.unpack_rgb(vantrel.refl_to_rgb(magenta, "D65_2DEG")))
    [255  82 255]
    """


@function("labch")
def calc_labch(spectra: "Spectra", illum_obs: "Illuminant" = "D50_2DEG"):
    """L*, a*, b*, C*, h of spectra in single precision; C* and h as refl_to_cielch().

    >>> print(np.round(vantrel.calc_labch(magenta), 2))
    [ 65.08  74.96 -45.95  87.92 328.49]
    """
