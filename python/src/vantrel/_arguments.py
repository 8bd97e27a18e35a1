"""What each kind of argument accepts, and how it is handed to a ufunc.

A declaration names the kind of an argument as its annotation. Arrays of other libraries are handed
on as they are; what has not been computed yet is not looked into.
"""

import numpy as np

from ._enums import IllumObs, Response, Status

BANDS = 31


def library_of(value):
    return type(value).__module__.partition(".")[0]


def is_lazy(value):
    """Whether the numbers of an array are yet to be computed."""
    return hasattr(value, "__dask_graph__") and value.__dask_graph__() is not None


def as_array(value, name):
    """An array of numbers; a list, say, becomes one of NumPy."""
    if isinstance(value, (int, float)):
        return value
    if not hasattr(value, "__array_ufunc__"):
        value = np.asarray(value)
    if value.dtype.kind not in "fiub":
        raise ValueError(f"{name}: numbers are needed, not {value.dtype}")
    return value


def as_integers(value, name):
    value = as_array(value, name)
    kind = value.dtype.kind if hasattr(value, "dtype") else np.asarray(value).dtype.kind
    if kind in "iub":
        return value
    if kind != "f" or not (is_lazy(value) or np.all(np.trunc(value) == value)):
        raise ValueError(f"{name}: whole numbers are needed")
    return value.astype(np.int64) if hasattr(value, "astype") else int(value)


class Index:
    """A member of an enumeration, its name, its number, or an array of these."""

    def __init__(self, enumeration, allowed=None):
        self.members = enumeration
        self.allowed = frozenset(enumeration if allowed is None else allowed)
        self.numbers = {member.name: int(member) for member in enumeration}
        for name, number in list(self.numbers.items()):
            self.numbers.setdefault(name.removesuffix("_STATUS").removesuffix("_RESPONSE"), number)

    def number(self, text, name):
        try:
            return self.numbers[text]
        except KeyError:
            known = ", ".join(member.name for member in self.members)
            raise ValueError(f"{name}: there is no {text!r} among {known}") from None

    def convert(self, value, name):
        if isinstance(value, str):
            return self.number(value, name)
        if isinstance(value, (int, np.integer)):
            return int(value)
        if not hasattr(value, "__array_ufunc__"):
            value = np.asarray(value)
        if isinstance(value, np.ndarray) and value.dtype.kind in "UO":
            numbers = [x if isinstance(x, int) else self.number(x, name) for x in value.flat]
            value = np.array(numbers, dtype=np.int64).reshape(value.shape)
        return as_integers(value, name)

    def check(self, value, name):
        if isinstance(value, int):
            unknown = value not in self.allowed
            wrong = value
        else:
            numbers = np.asarray(value)
            bad = ~np.isin(numbers, list(self.allowed))
            unknown = bad.any()
            wrong = numbers[bad].flat[0] if unknown else None
        if unknown:
            members = [str(int(member)) for member in sorted(self.allowed)]
            raise ValueError(f"{name}: {wrong} is not one of {', '.join(members)}")


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
_READINGS = np.array([[0, len(Response) - 1]] * len(Status))
_READINGS[Status.SPECTRAL_STATUS] = 391, 709
_READINGS[Status.SPECTRALX_STATUS] = 0, BANDS - 1
_READINGS[Status.CCR2_STATUS] = 0, BANDS - 1


def check_reading(status, response, name):
    """The range of a response depends on the status: a filter, a wavelength or a band."""
    status, response = np.asarray(status), np.asarray(response)
    low, high = _READINGS[status, 0], _READINGS[status, 1]
    bad = (response < low) | (response > high)
    if bad.any():
        # a bare number says most; pick the first of an array
        response, low, high, status = np.broadcast_arrays(response, low, high, status)
        i = tuple(np.argwhere(bad)[0])
        raise ValueError(
            f"{name}: {response[i]} is not from {low[i]} to {high[i]}, "
            f"as {Status(status[i]).name} takes it"
        )


def check_inks(value, name):
    if np.ndim(value) >= 2 and not 1 <= value.shape[-2] <= 3:
        raise ValueError(f"{name}: one to three inks are needed, not {value.shape[-2]}")


def convert(kind, value, name):
    """An argument as its ufunc takes it."""
    if value is None:
        if kind == "OptionalSpectra":
            return np.empty(0)  # a core of no values
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
    value = as_array(value, name)
    if kind == "Inks":
        check_inks(value, name)
    return value


_MEANING = {BANDS: " bands (400 to 700 nm in steps of 10 nm)"}


def check_core(value, core, kind, name):
    """The last dimensions of an array against those of its ufunc."""
    shape = np.shape(value)
    if kind == "OptionalSpectra" and shape == (0,):
        return
    sizes = [BANDS if kind == "OptionalSpectra" else int(c) if c.isdigit() else None for c in core]
    if len(shape) < len(sizes):
        raise ValueError(f"{name}: {len(sizes)} dimensions are needed at least, not {len(shape)}")
    for size, got in zip(reversed(sizes), reversed(shape)):
        if size not in (None, got):
            meaning = _MEANING.get(size, " values")
            raise ValueError(f"{name}: the last dimension must hold {size}{meaning}, not {got}")
