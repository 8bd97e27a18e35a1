"""Spectra at wavelengths of their own, for those who measure so."""

import numpy as np

from ._arguments import as_array, warn_of_fractions
from ._wavelengths import to_bands


def resample(values, wavelengths):
    """Spectra at 400, 410, ... 700 nm out of values at wavelengths of their own.

    The wavelengths, in nm and in any order, are evenly spaced, 10 nm apart or finer, from 400 to
    700 nm at least. Of steps of 10 nm a band is the value itself. Of finer steps it is what read()
    makes of a file: the mean of the values less than 10 nm away, weighted by a triangle, the passband
    of spectral data at 10 nm (ISO 13655), corrected for its width by -0.083, 1.166, -0.083 of the
    neighbouring bands (Stearns and Stearns 1988); where the range ends too early for that, the value
    at the band's own wavelength. Files may have steps of 20 nm and begin at 410 or end at 680 nm, which
    read() tells in `source`; arrays may not.

    Parameters
    ----------
    values : array_like (..., n)
        Spectra, in percent.
    wavelengths : array_like (n,)
        Where they lie, in nm.

    Returns
    -------
    spectra : array (..., 31)

    Raises
    ------
    ValueError
        Where the wavelengths do not give every band.

    Examples
    --------
    >>> vantrel.resample(np.arange(36.0), np.arange(380, 731, 10))[:3]
    array([2., 3., 4.])
    """
    array = as_array(values, "values")
    array = to_bands(array if hasattr(array, "shape") else np.asarray(array), wavelengths, "values")
    warn_of_fractions({"values": array}, 3)
    return array
