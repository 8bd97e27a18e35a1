"""Spectra at wavelengths of their own, brought to 400, 410, ... 700 nm."""

import functools
import re

import numpy as np

from ._extension import extension

NM = np.arange(400.0, 701.0, 10.0)
_WIDEST = 10  # step, in nm
_TOLERANCE = 0.001  # of a wavelength, in nm
_NAMES = {"nm", "wavelength", "wavelengths", "wl", "lambda", "band", "bands"}
_LABEL = re.compile(r"(?<![\d.])\d{3,4}(?:\.\d+)?(?![\d.])")


@functools.lru_cache(maxsize=64)
def _weights(wavelengths):
    """Which of the values at wavelengths make the bands, and what each band takes of them."""
    nm = np.frombuffer(wavelengths)
    if not np.all(np.isfinite(nm)):
        raise ValueError("a wavelength is not a number")
    weights = np.frombuffer(extension().bands(wavelengths)).reshape(-1, 31)
    ascending = np.sort(nm)
    wide = np.diff(ascending) > _WIDEST + _TOLERANCE
    if np.any(wide):  # of files too: the cubics between steps of 20 nm
        first, last = ascending[:-1][wide][0], ascending[1:][wide][0]
        raise ValueError(f"no value between {first:g} and {last:g} nm")
    if ascending[0] > 400 + _TOLERANCE or ascending[-1] < 700 - _TOLERANCE:
        raise ValueError("the range is too short")
    taken = np.flatnonzero(weights.any(-1))
    return taken, weights[taken]


def _unit_hint(nm):
    """What is to be done with wavelengths in micrometres or metres."""
    for longest, unit, factor in (2e-6, "m", "1e9"), (2, "µm", "1000"):
        if 0 < np.max(nm, initial=0) < longest:
            return f"; wavelengths are in nm: multiply those in {unit} by {factor}"
    return ""


def to_bands(values, wavelengths, name):
    """The bands of an array whose last dimension lies at these wavelengths."""
    nm = np.ascontiguousarray(wavelengths, dtype=np.float64)
    if nm.ndim != 1:
        raise ValueError(f"{name}: wavelengths are a list of numbers, not of shape {nm.shape}")
    if np.shape(values)[-1:] != nm.shape:
        raise ValueError(
            f"{name}: {np.shape(values)[-1:]} values do not lie at {nm.size} wavelengths"
        )
    try:
        taken, weights = _weights(nm.tobytes())
    except ValueError as error:
        reason = str(error).partition(" in spectra of ")[0]
        raise ValueError(
            f"{name}: {reason}, of {nm.size} wavelengths; every 10 nm from 400 to 700 is needed, or "
            f"finer steps{_unit_hint(nm)}"
        ) from None
    return values[..., taken] @ weights


def wavelengths_of(labels):
    """The wavelengths in nm that labels carry: numbers, "R400", "refl[400]", ("refl", 400); or None.

    0, 1, 2, ... are places, and no wavelengths. Of several numbers in each label it is the last that
    differs from label to label.
    """
    labels = np.asarray(labels)
    if labels.ndim != 1 or not labels.size:
        return None
    if labels.dtype.kind in "OUT":
        numbers = [_LABEL.findall(str(label)) for label in labels]
        for along in zip(*(found[::-1] for found in numbers)):
            if len(set(along)) == len(labels):
                return np.array(along, dtype=np.float64)
        return None
    if labels.dtype.kind not in "fiu" or np.array_equal(labels, np.arange(labels.size)):
        return None
    return labels.astype(np.float64)


def _is_named(name):
    """Whether a name is one of wavelengths: "wavelength_nm", "Wavelength [nm]"."""
    return not _NAMES.isdisjoint(re.split("[^a-z]+", str(name).lower()))


def _is_spectral(name, labels):
    nm = None if labels is None else wavelengths_of(labels)
    spectral = nm is not None and nm.size > 1 and 300 <= nm.min() and 600 < nm.max() <= 1100
    return spectral or _is_named(name)


def _refuse_turned(dims, last, name):
    """Spectra that lie along another dimension than the last one."""
    if not _is_spectral(*last):
        for dim, labels in dims:
            if _is_spectral(dim, labels):
                raise ValueError(
                    f"{name}: the wavelengths lie along {dim!r}; spectra are the last dimension: "
                    "transpose the array"
                )


def _labels_along(value, dim):
    """The labels of a dimension: its wavelengths, should another coordinate along it hold these.

    Along patches numbers may look like wavelengths; there the name counts.
    """
    for name, coordinate in value.coords.items():
        known = dim == value.dims[-1] or _is_named(name)
        if known and coordinate.dims == (dim,) and _is_spectral(None, coordinate.values):
            return coordinate.values
    return value.coords[dim].values if dim in value.coords else None


def bands_of_xarray(value, name):
    """A labelled array of spectra, at 400, 410, ... 700 nm where it has wavelengths."""
    labels = [(d, _labels_along(value, d)) for d in value.dims]
    if not labels:
        return value
    _refuse_turned(labels[:-1], labels[-1], name)
    dim, last = labels[-1]
    nm = None if last is None else wavelengths_of(last)
    if nm is None or np.array_equal(nm, NM):
        return value
    kept = {c: v for c, v in value.coords.items() if dim not in v.dims}
    bands = to_bands(value.variable.data, nm, name)
    return type(value)(bands, {**kept, dim: NM}, value.dims, name=value.name)


def bands_of_pandas(value, name):
    """The array of a table whose columns, or of a series whose index, may be wavelengths."""
    axes = value.axes
    _refuse_turned([("index", axis) for axis in axes[:-1]], ("columns", axes[-1]), name)
    nm = wavelengths_of(axes[-1])
    array = numbers_of_pandas(value)
    return array if nm is None or np.array_equal(nm, NM) else to_bands(array, nm, name)


def numbers_of_pandas(value):
    array = np.asarray(value)
    if array.dtype.kind != "O":
        return array
    try:
        return value.to_numpy(dtype=np.float64, na_value=np.nan)  # of the types with missing values
    except (TypeError, ValueError):
        return array
