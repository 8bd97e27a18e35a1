"""What each kind of argument accepts, and how it is handed to a ufunc.

Arrays of other libraries are handed on as they are; what has not been computed yet is not looked
into.
"""

import difflib
import warnings
from enum import IntEnum
from typing import Any

import numpy as np

from ._enums import IllumObs, Response, Status
from ._wavelengths import bands_of_pandas, bands_of_xarray, numbers_of_pandas

BANDS = 31
MISSING = np.empty(0)  # what a ufunc takes for a spectrum that is not there


def library_of(value):
    return type(value).__module__.partition(".")[0]


def is_lazy(value):
    """Whether the numbers of an array are yet to be computed."""
    return hasattr(value, "__dask_graph__") and value.__dask_graph__() is not None


def as_numpy(value):
    """A list, say, and a table of pandas as an array of NumPy."""
    if library_of(value) == "pandas" or not hasattr(value, "__array_ufunc__"):
        return np.asarray(value)
    return value


def as_array(value, name):
    """An array of numbers."""
    if isinstance(value, (int, float)):
        return value
    if library_of(value) == "pint":
        raise ValueError(
            f"{name}: quantities with units are not taken; hand over their magnitude, of spectra "
            "in percent: quantity.to('percent').magnitude"
        )
    value = numbers_of_pandas(value) if library_of(value) == "pandas" else as_numpy(value)
    dtype: Any = getattr(value, "dtype", type(value).__name__)
    if getattr(dtype, "kind", None) not in tuple("fiub"):
        raise ValueError(f"{name}: numbers are needed, not {dtype}")
    inside = value.variable.data if library_of(value) == "xarray" else value
    if isinstance(getattr(inside, "_meta", inside), np.ma.MaskedArray):
        if is_lazy(value) or np.ma.is_masked(value):
            raise ValueError(f"{name}: masked values have no result; fill them first")
        value = value.data
    return value.astype(np.float64) if dtype.itemsize > 8 else value


def as_integers(value, name):
    value = as_array(value, name)
    lazy = is_lazy(value)
    numbers = value if lazy else np.asarray(value)
    if np.can_cast(numbers.dtype, np.int64):
        return value
    if lazy:
        raise ValueError(f"{name}: integers are needed, not {numbers.dtype} yet to be computed")
    fits = abs(numbers) < 2.0**63
    if numbers.dtype.kind == "O" or not np.all(fits & (np.trunc(numbers) == numbers)):
        raise ValueError(f"{name}: whole numbers are needed")
    return value.astype(np.int64) if hasattr(value, "astype") else int(value)


FRACTION = 1.5  # paper with optical brightener reads up to 1.4


def _reaches(values):
    """Whether any value is above what fractions are; looks at a few first."""
    some = values.flat[:4096], values.flat[-1:]
    return any(np.any(v > FRACTION) for v in (*some, values)) or not np.any(values > 0)


def _has_colour(values):
    """Whether a spectrum is neither flat nor next to nothing, as fractions of a colour are."""
    high = values.max(-1)
    return np.any((high > 0.3) & (values.min(-1) < high / 4))


def look_like_fractions(values, name):
    """Whether the spectra of an argument do, whatever the others are: paper is never so dark, and
    what is as dark in percent is black."""
    if values.size == BANDS:  # of one spectrum, without the overhead of NumPy
        reads = values.ravel().tolist()
        high = max(reads)
        return 0 < high <= FRACTION and (name == "paper" or 0.3 < high > 4 * min(reads))
    return not _reaches(values) and bool(name == "paper" or _has_colour(values))


def warn_of_fractions(spectra, level):
    """Where the spectra of an argument look like fractions of 1, or all of a call are so small."""
    given = {name: s for name, s in spectra.items() if s is not MISSING}
    known = {name: np.asarray(s) for name, s in given.items() if not is_lazy(s)}
    wrong = [name for name, values in known.items() if look_like_fractions(values, name)]
    if len(known) == len(given) and not any(map(_reaches, known.values())):
        wrong = list(known)
    if wrong:
        warnings.warn(
            f"{', '.join(wrong)}: all reflectances are at most {FRACTION}: they are in percent here; "
            "multiply fractions by 100",
            stacklevel=level,
        )


# The response that reads an ink.
_INKS = {"CYAN": "RED", "MAGENTA": "GREEN", "YELLOW": "BLUE", "BLACK": "VISUAL", "KEY": "VISUAL"}


class Index:
    """A member of an enumeration, its name, its number, or an array of these."""

    def __init__(self, enumeration, allowed=None):
        self.members = enumeration
        self.allowed = sorted(enumeration if allowed is None else allowed)
        self.numbers = {member.name: int(member) for member in enumeration}
        for name, number in list(self.numbers.items()):
            self.numbers.setdefault(name.removesuffix("_STATUS").removesuffix("_RESPONSE"), number)

    def hint(self, item):
        """The name that was meant, where that is plain."""
        word = str(item).strip().upper().replace("-", "_").replace(" ", "_")
        if word in self.numbers:
            return f"; {word!r} is meant?"
        if self.members is Response and word in _INKS:
            return f"; {word.lower()} is read through {_INKS[word]!r}"
        begun = [m.name for m in self.members if word and m.name.startswith(word + "_")]
        close = begun or difflib.get_close_matches(word, self.numbers, 2)
        return f"; {' or '.join(map(repr, close))} is meant?" if close else ""

    def number(self, item, name):
        if isinstance(item, str) and item in self.numbers:
            return self.numbers[item]
        foreign = isinstance(item, IntEnum) and not isinstance(item, self.members)
        number = isinstance(item, (int, np.integer)) or isinstance(item, float) and item % 1 == 0
        if number and not foreign and not isinstance(item, (bool, np.bool_)):
            return int(item)
        hint = self.hint(item) if isinstance(item, str) else ""
        known = ", ".join(self.members(number).name for number in self.allowed)
        raise ValueError(f"{name}: there is no {item!r}{hint} among {known}")

    def convert(self, value, name):
        if isinstance(value, (str, int, np.integer, np.bool_)):
            return self.number(value, name)
        if library_of(value) == "xarray" and value.dtype.kind in "UTO" and not is_lazy(value.data):
            return value.copy(data=self.convert(value.values, name))
        # what is in a list keeps its type: a member of another enumeration, say
        array = as_numpy(value) if hasattr(value, "dtype") else np.array(value, dtype=object)
        if isinstance(array, np.ndarray) and array.dtype.kind in "UTOb":
            items = array.ravel().tolist()
            if {*map(type, items)} <= {str, self.members}:  # unlike 1 and True, these are all distinct
                found = {item: self.number(item, name) for item in dict.fromkeys(items)}
                numbers = (found[item] for item in items)
            else:
                numbers = (self.number(item, name) for item in items)
            array = np.fromiter(numbers, np.int64, len(items)).reshape(array.shape)
        return as_integers(array, name)

    def check(self, value, name):
        numbers = np.asarray(value)
        bad = ~np.isin(numbers, self.allowed)
        if bad.any():
            known = ", ".join(f"{self.members(number).name} ({number})" for number in self.allowed)
            raise ValueError(f"{name}: {numbers[bad].flat[0]} is not one of {known}")


RESPONSES = Index(Response)

INDICES = {
    "Illuminant": Index(IllumObs),
    # illuminants C, D50 and D65 have a whiteness
    "WhitenessIlluminant": Index(IllumObs, range(IllumObs.C_2DEG, IllumObs.D65_10DEG + 1)),
    "StatusName": Index(Status),
    "CCRStatus": Index(Status, {Status.CCR1_STATUS, Status.CCR2_STATUS}),
    "HueStatus": Index(Status, set(Status) - {Status.SPECTRALX_STATUS}),
    "ResponseName": RESPONSES,
    "InkResponse": Index(Response, set(Response) - {Response.VISUAL_RESPONSE}),
    "Reading": RESPONSES,
}

# What a response may be under each status: [lowest, highest].
_READINGS = [(0, len(Response) - 1)] * len(Status)
_READINGS[Status.SPECTRAL_STATUS] = 391, 709
_READINGS[Status.SPECTRALX_STATUS] = 0, BANDS - 1
_READINGS[Status.CCR2_STATUS] = 0, BANDS - 1


def check_reading(status, response, name):
    """The range of a response depends on the status: a filter, a wavelength or a band."""
    for number in [status] if isinstance(status, int) else np.unique(status):
        low, high = _READINGS[int(number)]
        bad = (status == number) & ((response < low) | (response > high))
        if np.any(bad):
            wrong = response
            if not isinstance(response, int):
                wrong = np.asarray(0 * bad + response)[np.asarray(bad)].flat[0]
            raise ValueError(
                f"{name}: {wrong} is not from {low} to {high}, "
                f"as {Status(number).name} takes it"
            )


def check_inks(value, name):
    if np.ndim(value) >= 2 and not 1 <= value.shape[-2] <= 3:
        raise ValueError(f"{name}: one to three inks are needed, not {value.shape[-2]}")


def _is_labelled(value):
    return library_of(value) in ("pandas", "xarray") or isinstance(value, np.ma.MaskedArray)


def is_spectral(kind, core):
    return kind in ("Spectra", "OptionalSpectra") or kind == "Inks" and core[-1] == str(BANDS)


def convert(kind, core, value, name):
    """An argument as its ufunc takes it."""
    if value is None:
        if kind == "OptionalSpectra":
            return MISSING
        if kind == "OptionalTargets":
            return np.zeros(4)  # not read without a paper
        raise ValueError(f"{name}: None is not accepted")
    if kind in INDICES:
        value = INDICES[kind].convert(value, name)
        if kind != "Reading" and not is_lazy(value):
            INDICES[kind].check(value, name)
        return value
    if kind == "Integers":
        return as_integers(value, name)
    if is_spectral(kind, core):
        if isinstance(value, (list, tuple)) and any(map(_is_labelled, value)):
            raise ValueError(
                f"{name}: labels and masks of arrays are lost in a list; make one array of them, by "
                "pandas.DataFrame, xarray.concat or numpy.ma.stack"
            )
        by_wavelength = {"xarray": bands_of_xarray, "pandas": bands_of_pandas}
        bands = by_wavelength.get(library_of(value))
        value = bands(value, name) if bands else value
    value = as_array(value, name)
    if kind == "Inks":
        check_inks(value, name)
    return value


_MEANING = {BANDS: " bands (400 to 700 nm in steps of 10 nm)"}


def check_core(value, core, kind, name):
    """The last dimensions of an array against those of its ufunc."""
    if value is MISSING:
        return
    shape = np.shape(value)
    sizes = [BANDS if kind == "OptionalSpectra" else int(c) if c.isdigit() else None for c in core]
    if len(shape) < len(sizes):
        raise ValueError(f"{name}: {len(sizes)} dimensions are needed at least, not {len(shape)}")
    for size, got in zip(reversed(sizes), reversed(shape)):
        if size not in (None, got):
            meaning = _MEANING.get(size, " values")
            raise ValueError(f"{name}: the last dimension must hold {size}{meaning}, not {got}")
