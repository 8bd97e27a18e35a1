"""The kinds of arguments: what each holds, for type hints and for the documentation.

A declaration names the kind of an argument as its annotation.
"""

from typing import Annotated, Sequence, Union

from numpy.typing import ArrayLike

_NAMES = Union[str, int, Sequence[Union[str, int]], ArrayLike]

Spectra = Annotated[ArrayLike, "Reflectance in percent at 400, 410, ... 700 nm."]
OptionalSpectra = Annotated[
    Union[ArrayLike, None], "Reflectance in percent at 400, 410, ... 700 nm, or None: there is none."
]
Inks = Annotated[ArrayLike, "One to three solids, in the order of printing."]
Colours = Annotated[ArrayLike, "Coordinates of colours."]
Numbers = Annotated[ArrayLike, "Numbers."]
OptionalTargets = Annotated[Union[ArrayLike, None], "Numbers, or None where there is no paper."]
Integers = Annotated[ArrayLike, "Whole numbers."]
Illuminant = Annotated[_NAMES, "Members of IllumObs, their names or numbers."]
WhitenessIlluminant = Annotated[_NAMES, "Members of IllumObs with illuminant C, D50 or D65."]
StatusName = Annotated[_NAMES, "Members of Status, their names or numbers."]
CCRStatus = Annotated[_NAMES, "CCR1_STATUS or CCR2_STATUS."]
HueStatus = Annotated[_NAMES, "Members of Status but SPECTRALX_STATUS, their names or numbers."]
ResponseName = Annotated[_NAMES, "Members of Response, their names or numbers."]
InkResponse = Annotated[_NAMES, "Members of Response but VISUAL_RESPONSE."]
Reading = Annotated[
    _NAMES,
    "Members of Response, their names or numbers; a wavelength of 391 to 709 nm under "
    "SPECTRAL_STATUS, a band under SPECTRALX_STATUS.",
]


def meaning_of(kind):
    return globals()[kind].__metadata__[0]
