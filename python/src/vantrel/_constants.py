"""What can be set, in this process, for all threads."""

import contextlib
import threading
from typing import Any, Callable, Dict, List

import numpy as np

from . import _ufuncs

den_weight = _ufuncs.den_weight


def get_num_illuminant_observers():
    """How many combinations of illuminant and observer there are.

    Returns
    -------
    count : int

    Examples
    --------
    >>> vantrel.get_num_illuminant_observers() == len(vantrel.IllumObs)
    True
    """
    return _ufuncs.get_num_illuminant_observers()


def get_num_statuses():
    """How many density statuses there are.

    Returns
    -------
    count : int

    Examples
    --------
    >>> vantrel.get_num_statuses() == len(vantrel.Status)
    True
    """
    return _ufuncs.get_num_statuses()


def get_num_responses():
    """How many density responses there are.

    Returns
    -------
    count : int

    Examples
    --------
    >>> vantrel.get_num_responses() == len(vantrel.Response)
    True
    """
    return _ufuncs.get_num_responses()


def _doubles(value, size, name):
    if value is None:
        return None
    array = np.array(value, dtype=np.float64, order="C")
    if array.shape != (size,):
        raise ValueError(f"{name}: {size} values are needed, not the shape {array.shape}")
    return array


def _read(getter, *sizes):
    arrays = [np.empty(size) for size in sizes]
    getter(*arrays)
    return tuple(arrays)


def _check_centres(centres):
    for centre in centres:
        if not 430 <= centre < 680:
            raise ValueError(f"wavelengths: a centre lies from 430 to below 680 nm, not at {centre:g}")


def _check_shape(shape, name):
    if not np.all(np.isfinite(shape) & (shape >= 0)):
        raise ValueError(f"{name}: weights are finite and not below 0, unlike {shape}")
    if np.any(shape) and not 1e-100 < np.max(shape) < 1e100:
        raise ValueError(f"{name}: {shape} cannot be scaled to weights that sum to 100 000")


def _place(setter, getter, wavelengths, shapes):
    """Places bands; the C function would leave the weights where they were without a shape."""
    if wavelengths is None:
        raise ValueError("wavelengths: None is not accepted")
    wavelengths = _doubles(wavelengths, len(shapes), "wavelengths")
    _check_centres(wavelengths)
    given = [_doubles(shape, 7, name) for name, shape in shapes.items()]
    for name, shape in zip(shapes, given):
        if shape is not None:
            _check_shape(shape, name)
    before, *had = getter()
    setter(wavelengths, *given)
    now = getter()[0]
    moved = (now != before) & [shape is None for shape in given]
    setter(now, *[shape if m and np.isfinite(shape).all() else None for m, shape in zip(moved, had)])


def set_hifi_constants(wavelengths, shape1=None, shape2=None, shape3=None):
    """Places the three HiFi bands and rebuilds their rows of `den_weight`.

    Parameters
    ----------
    wavelengths : array_like (3,)
        Centres in nm, from 430 to below 680, cut to their band.
    shape1, shape2, shape3 : array_like (7,), optional
        Relative weights around each centre in steps of 10 nm, not below 0; None takes the shape that
        the band has along to the new centre, 0 everywhere takes the filter away.

    Raises
    ------
    ValueError
        Where an argument has another shape, a centre lies elsewhere, or a weight is below 0 or not
        finite. (The C function leaves such a band as it was.)

    Examples
    --------
    >>> with vantrel.settings():
    ...     vantrel.set_hifi_constants([550, 600, 640])
    ...     print(vantrel.get_hifi_constants()[0])
    [550. 600. 640.]
    """
    shapes = {"shape1": shape1, "shape2": shape2, "shape3": shape3}
    _place(_ufuncs.set_hifi_constants, get_hifi_constants, wavelengths, shapes)


def get_hifi_constants():
    """The HiFi bands.

    Returns
    -------
    wavelengths : array (3,)
        Centres in nm.
    shape1, shape2, shape3 : array (7,)
        Weights around each, 1 in the centre.

    Examples
    --------
    >>> print(vantrel.get_hifi_constants()[0])
    [530. 630. 620.]
    """
    return _read(_ufuncs.get_hifi_constants, 3, 7, 7, 7)


def set_hexachrome_constants(wavelengths, shape1=None, shape2=None):
    """Places the two Hexachrome bands; as set_hifi_constants().

    Parameters
    ----------
    wavelengths : array_like (2,)
    shape1, shape2 : array_like (7,), optional

    Raises
    ------
    ValueError
        As set_hifi_constants().

    Examples
    --------
    >>> with vantrel.settings():
    ...     vantrel.set_hexachrome_constants([450, 620], shape2=[0, 0, 1, 1, 1, 0, 0])
    ...     print(vantrel.get_hexachrome_constants()[2].round(2))
    [0. 0. 1. 1. 1. 0. 0.]
    """
    shapes = {"shape1": shape1, "shape2": shape2}
    _place(_ufuncs.set_hexachrome_constants, get_hexachrome_constants, wavelengths, shapes)


def get_hexachrome_constants():
    """The Hexachrome bands.

    Returns
    -------
    wavelengths : array (2,)
        Centres in nm.
    shape1, shape2 : array (7,)
        Weights around each, 1 in the centre.

    Examples
    --------
    >>> print(vantrel.get_hexachrome_constants()[0])
    [440. 630.]
    """
    return _read(_ufuncs.get_hexachrome_constants, 2, 7, 7)


def _numbers(getter, count):
    return tuple(float(array[0]) for array in _read(getter, *[1] * count))


def _set(setter, getter, reason, **numbers):
    """Sets single numbers; the library takes all or none, which shows when they are read."""
    for name, number in numbers.items():
        if number is None or not np.isfinite(float(number)):
            raise ValueError(f"{name}: a finite number is needed, not {number}")
    values = tuple(map(float, numbers.values()))
    setter(*[np.array([value]) for value in values])
    if getter() != values:
        raise ValueError(reason)


def set_spectralx_constants(tolerance, reserved, centre, inner, outer):
    """Sets the SpectralX constants.

    Parameters
    ----------
    tolerance : float
        How far above the lowest windowed sum, in percent, a band still counts as a peak.
    reserved : float
    centre, inner, outer : float
        Weights of the window; that of the centre must be 1.

    Raises
    ------
    ValueError
        Where the weight of the centre is not 1, or a constant is not finite.

    Examples
    --------
    >>> with vantrel.settings():
    ...     vantrel.set_spectralx_constants(2, 84, 1, 0.4, 0.2)
    ...     print(*vantrel.get_spectralx_constants())
    2.0 84.0 1.0 0.4 0.2
    """
    _set(
        _ufuncs.set_spectralx_constants,
        get_spectralx_constants,
        "centre: the weight of the centre must be 1",
        tolerance=tolerance,
        reserved=reserved,
        centre=centre,
        inner=inner,
        outer=outer,
    )


def get_spectralx_constants():
    """The SpectralX constants.

    Returns
    -------
    tolerance, reserved, centre, inner, outer : float

    Examples
    --------
    >>> print(*vantrel.get_spectralx_constants())
    2.0 84.0 1.0 0.5 0.1
    """
    return _numbers(_ufuncs.get_spectralx_constants, 5)


def set_achromatic_constants(L1, L2, C1, C2):
    """Sets the line above which a colour is chromatic.

    Parameters
    ----------
    L1, L2, C1, C2 : float
        It goes through (L1, C1) and (L2, C2).

    Raises
    ------
    ValueError
        Where no finite line goes through these points.

    Examples
    --------
    >>> with vantrel.settings():
    ...     vantrel.set_achromatic_constants(90, 10, 2, 12)
    ...     print(*vantrel.get_achromatic_constants())
    90.0 10.0 2.0 12.0
    """
    _set(
        _ufuncs.set_achromatic_constants,
        get_achromatic_constants,
        "no finite line goes through these points",
        L1=L1,
        L2=L2,
        C1=C1,
        C2=C2,
    )


def get_achromatic_constants():
    """The line of is_chromatic().

    Returns
    -------
    L1, L2, C1, C2 : float

    Examples
    --------
    >>> print(*vantrel.get_achromatic_constants())
    84.0 14.0 3.0 11.0
    """
    return _numbers(_ufuncs.get_achromatic_constants, 4)


class _Entry:
    """A settings() that has not been left yet."""

    def __init__(self):
        self.thread = threading.get_ident()
        self.before = _ufuncs.get_settings()


_entries: List[_Entry] = []  # the first is the outermost
_entering = threading.Lock()


def _enter():
    with _entering:
        entry = _Entry()
        if any(outer.thread != entry.thread for outer in _entries):
            raise RuntimeError(
                "settings(): another thread is inside of settings(), and constants hold for all "
                "threads; enter it once, around the threads"
            )
        _entries.append(entry)
        return entry


def _leave(entry):
    """The one inside of an entry, of coroutines that take turns, restores what was before both."""
    with _entering:
        place = _entries.index(entry)
        del _entries[place]
        if place == len(_entries):
            _ufuncs.set_settings(entry.before)
        else:
            _entries[place].before = entry.before


@contextlib.contextmanager
def settings(*, hifi=None, hexachrome=None, spectralx=None, achromatic=None):
    """Sets constants for the calls inside of a `with`, and all as they were after it.

    They hold for all threads of the process, and for what Dask arrays are asked inside, wherever
    and whenever it is computed. `den_weight` is restored too. One thread at a time is inside; it may
    enter again.

    Parameters
    ----------
    hifi, hexachrome, spectralx, achromatic : tuple, optional
        The arguments of set_hifi_constants() and so on.

    Raises
    ------
    ValueError
        As the functions that set them.
    RuntimeError
        Where another thread is inside.

    Examples
    --------
    >>> with vantrel.settings(hifi=([480, 560, 620],)):
    ...     print(vantrel.refl_to_density(magenta, None, "HIFI", "HIFI2").round(3))
    0.922
    >>> print(vantrel.refl_to_density(magenta, None, "HIFI", "HIFI2").round(3))
    0.071
    """
    asked: Dict[Callable[..., None], Any] = {
        set_hifi_constants: hifi,
        set_hexachrome_constants: hexachrome,
        set_spectralx_constants: spectralx,
        set_achromatic_constants: achromatic,
    }
    entry = _enter()
    try:
        for set_constants, values in asked.items():
            if values is not None:
                set_constants(*values)
        yield
    finally:
        _leave(entry)
