"""Which filters a status has. Where it has none, the C functions answer 5, 0 or infinity."""

import numpy as np

from . import _ufuncs
from ._enums import Response, Status

OWN_READINGS = Status.SPECTRAL_STATUS, Status.SPECTRALX_STATUS  # a wavelength, a band


_ALL = np.array([[*Status]]).T, np.array([*Response])


def has_filter(status, response, is_reading):
    """Whether statuses have the filters of responses, under the settings of this thread."""
    *_, there = _ufuncs.get_normalized_density_weights_ok(*_ALL)
    if is_reading:
        there[[*OWN_READINGS]] = True
    last = np.subtract(there.shape, 1)  # what lies beyond is refused by the C functions
    return there[np.clip(status, 0, last[0]), np.clip(response, 0, last[1])]


def check_filter(status, response, is_reading, name):
    """One status and one response; of several, without_filter() tells the rows apart."""
    if np.ndim(status) or np.ndim(response) or has_filter(status, response, is_reading):
        return
    filters = has_filter(status, _ALL[1], False)
    known = ", ".join(r.name for r, there in zip(Response, filters) if there) or "none"
    wanted = Response(int(response)).name if response < len(Response) else int(response)
    raise ValueError(f"{name}: {Status(int(status)).name} has no filter for {wanted}, but {known}")


def without_filter(results, status, response, is_reading):
    """Results of a ufunc, missing in the rows whose status has no such filter."""
    if isinstance(status, int) and isinstance(response, int):  # check_filter() has seen them
        return results
    missing = ~has_filter(status, response, is_reading)
    if not np.any(missing):
        return results
    several = results if isinstance(results, tuple) else (results,)
    marks = [False if r.dtype.kind == "b" else r.dtype.type(np.nan) for r in several]
    if not np.ndim(several[0]):
        return tuple(marks) if isinstance(results, tuple) else marks[0]
    for result, mark in zip(several, marks):
        np.copyto(result, mark, where=missing)
    return results
