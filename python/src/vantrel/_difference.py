"""Colour differences."""

from ._function import function
from ._kinds import Colours, Illuminant, Integers, Numbers, Spectra


@function("delta_e")
def lab_to_de_lab(lab1: "Colours", lab2: "Colours"):
    """CIE 1976 colour difference of two L*a*b* (CIE 15).

    >>> print(np.round(vantrel.lab_to_de_lab([50, 0, 0], [50, 3, 4]), 2))
    5.0
    """


@function("delta_h")
def lab_to_dh(lab1: "Colours", lab2: "Colours", rounded: "Integers" = True):
    """Signed CIE 1976 hue difference (CIE 15).

    Positive when the second hue lies from 0 up to and including 180 degrees counter-clockwise of
    the first. Chroma and hue are those of cielab_to_cielch(), of a* and b* rounded to two decimals,
    which moves the difference of close colours by up to 0.23; with `rounded=False` of a* and b* as
    they are.

    >>> print(np.round(vantrel.lab_to_dh([50, 30, 0], [50, 30, 2]), 3))
    1.999
    """


@function("delta_e")
def lab_to_de94(sample: "Colours", reference: "Colours", kL: "Numbers" = 1, kC: "Numbers" = 1):
    """CIE94 (CIE 116), kH = 1; the weights follow the chroma of the reference alone.

    >>> print(np.round(vantrel.lab_to_de94([50, 30, 0], [52, 30, 2]), 3))
    2.429
    """


@function("delta_e")
def cielch_to_de94(sample: "Colours", reference: "Colours", kL: "Numbers" = 1, kC: "Numbers" = 1):
    """CIE94 of two L*C*h; as lab_to_de94() of their L*a*b*.

    >>> print(np.round(vantrel.cielch_to_de94([50, 30, 0], [52, 30, 4]), 3))
    2.467
    """


@function("delta_e")
def lab_to_de2000(lab1: "Colours", lab2: "Colours", kL: "Numbers" = 1, kC: "Numbers" = 1):
    """CIEDE2000 (CIE 142, ISO/CIE 11664-6) with kH = 1.

    >>> print(np.round(vantrel.lab_to_de2000([50, 30, 0], [52, 30, 2]), 3))
    2.347
    """


@function("delta_e")
def lab_to_de2000_ex(
    lab1: "Colours",
    lab2: "Colours",
    kL: "Numbers" = 1,
    kC: "Numbers" = 1,
    kH: "Numbers" = 1,
):
    """CIEDE2000 (CIE 142, ISO/CIE 11664-6) with all three parametric factors.

    >>> print(np.round(vantrel.lab_to_de2000_ex([50, 30, 0], [52, 30, 2]), 3))
    2.347
    """


@function("delta_e")
def lab_to_de_cmc(
    sample: "Colours",
    reference: "Colours",
    l: "Numbers" = 2,
    c: "Numbers" = 1,
    rounded: "Integers" = True,
):
    """CMC(l:c) (ISO 105-J03); every weight follows the reference alone.

    2:1 is for acceptability, 1:1 for perceptibility. A weight of 0 is refused. Chroma and hue are
    those of a* and b* rounded to two decimals; with `rounded=False` of a* and b* as they are.

    >>> print(np.round(vantrel.lab_to_de_cmc([50, 30, 0], [52, 30, 2]), 3))
    1.73
    """


@function("index")
def refl_to_din6172(
    spectra1: "Spectra",
    spectra2: "Spectra",
    illum_obs1: "Illuminant",
    illum_obs2: "Illuminant",
):
    """DIN 6172 metamerism index: how far the L*a*b* difference of a pair moves with the light.

    >>> print(np.round(vantrel.refl_to_din6172(magenta, tint, "D50_2DEG", "A_2DEG"), 3))
    10.638
    """


@function("lightness", "colour1", "colour2")
def verbal_color_difference(
    standard: "Spectra",
    sample: "Spectra",
    illum_obs: "Illuminant" = "D50_2DEG",
    selector: "Integers" = 0,
):
    """How samples differ from their standard, in words: (lightness, colour1, colour2).

    Arrays of str, or str for a single pair. A coordinate that differs by no more than 0.5 is "On
    Target"; the lightness is "Too Dark" or "Too Light". Selector 0 words a* and b* ("Too Green",
    "Too Red"; "Too Blue", "Too Yellow"), 1 chroma and hue ("Too Dull", "Too Bright"; the hue that
    the sample leans to, 359 to 1 degrees being 358 clockwise); any other words the lightness alone
    and leaves the colours "".

    >>> print(vantrel.verbal_color_difference(paper, tint))
    ('Too Dark', 'Too Red', 'Too Blue')
    """


@function("delta_e")
def ciede2000_calculate(
    lab1: "Colours", lab2: "Colours", kL: "Numbers" = 1, kC: "Numbers" = 1, kH: "Numbers" = 1
):
    """lab_to_de2000_ex() in other words.

    >>> print(np.round(vantrel.CIEDE2000.calculate([50, 30, 0], [52, 30, 2]), 3))
    2.347
    """


@function("zero")
def ciede2000_is_zero(value: "Numbers", tolerance: "Numbers"):
    """Whether the magnitude is at most the tolerance; NaN counts as zero.

    >>> print(vantrel.CIEDE2000.is_zero(1e-9, 1e-6))
    True
    """


@function("degrees")
def ciede2000_convert_to_degrees(radians: "Numbers"):
    """Angles in radians as degrees, negative ones counted from 360 downward.

    >>> print(np.round(vantrel.CIEDE2000.convert_to_degrees(-np.pi / 2), 1))
    270.0
    """


@function("radians")
def ciede2000_convert_to_radians(degrees: "Numbers"):
    """Angles in degrees as radians.

    >>> print(np.round(vantrel.CIEDE2000.convert_to_radians(180), 4))
    3.1416
    """


class CIEDE2000:
    """The CIEDE2000 formula and its helpers (CIE 142), under the names of the C++ class."""

    calculate = staticmethod(ciede2000_calculate)
    is_zero = staticmethod(ciede2000_is_zero)
    convert_to_degrees = staticmethod(ciede2000_convert_to_degrees)
    convert_to_radians = staticmethod(ciede2000_convert_to_radians)
