"""Dask and xarray arrays go through the same calls."""

import subprocess
import sys

import dask.array as da
import numpy as np
import pytest
import xarray as xr

import vantrel

RANDOM = np.random.default_rng(8)
IMAGE = RANDOM.uniform(1, 99, (14, 10, 31))
PAPER = np.linspace(80, 90, 31)

CALLS = [
    lambda image: vantrel.refl_to_cielab(image, "D65_10DEG"),
    lambda image: vantrel.refl_to_density(image, PAPER, "E", "GREEN"),
    lambda image: vantrel.refl_to_density(image, None, "E", [0, 1, 2, 3, 0, 1, 2, 3, 0, 1]),
    lambda image: vantrel.refl_to_densities(image, None, "HIFI"),
    lambda image: vantrel.determine_density_response(image, "E"),
    lambda image: vantrel.refl_to_hue_gray(image, PAPER, "E", ok=True),
    lambda image: vantrel.verbal_color_difference(PAPER, image),
    lambda image: vantrel.lab_to_de2000(vantrel.refl_to_cielab(image), [50, 0, 0]),
    lambda image: vantrel.refl_to_white_e313_98(image, ok=True),
]


def as_tuple(result):
    return result if isinstance(result, tuple) else (result,)


@pytest.mark.parametrize("chunks", [(5, 10, 31), (14, 3, 8)], ids=["in rows", "through the bands"])
@pytest.mark.parametrize("call", CALLS)
def test_dask_gives_what_numpy_gives(call, chunks):
    lazy = as_tuple(call(da.from_array(IMAGE, chunks=chunks)))
    wanted = as_tuple(call(IMAGE))
    assert len(lazy) == len(wanted)
    for got, expected in zip(lazy, wanted):
        assert isinstance(got, da.Array) and got.dtype == expected.dtype
        computed = got.compute()
        assert computed.shape == got.shape
        assert np.array_equal(computed, expected, equal_nan=computed.dtype.kind == "f")


@pytest.mark.parametrize("chunks", [None, {"y": 5}], ids=["numpy", "dask"])
@pytest.mark.parametrize("call", CALLS)
def test_xarray_gives_what_numpy_gives(call, chunks):
    coordinates = {"nm": np.arange(400, 701, 10), "y": np.arange(14) * 0.1}
    image = xr.DataArray(IMAGE, coordinates, ("y", "x", "nm"))
    labelled = as_tuple(call(image.chunk(chunks) if chunks else image))
    wanted = as_tuple(call(IMAGE))
    assert len(labelled) == len(wanted)
    for got, expected in zip(labelled, wanted):
        assert got.dims[:2] == ("y", "x") and np.array_equal(got.y, image.y)
        values = got.compute().to_numpy()
        assert np.array_equal(values, expected, equal_nan=values.dtype.kind == "f")


def test_xarray_names_its_dimensions():
    image = xr.DataArray(IMAGE, dims=("y", "x", "nm"), coords={"nm": np.arange(400, 701, 10)})
    assert vantrel.refl_to_cielab(image).dims == ("y", "x", "lab")
    adjusted = vantrel.adjust_for_paper_refls(image, xr.DataArray(PAPER, dims="nm"))
    assert adjusted.dims == ("y", "x", "nm") and np.array_equal(adjusted.nm, image.nm)
    status, response = xr.DataArray([1, 3], dims="s"), xr.DataArray([1, 2, 3], dims="r")
    assert set(vantrel.refl_to_density(image, PAPER, status, response).dims) == set("yxsr")
    with pytest.raises(ValueError, match="3 is not from 391"):
        vantrel.refl_to_density(image, PAPER, xr.DataArray([1, 4, 4], dims="s"), response + 2)


def test_none_of_them_is_needed():
    code = (
        "import sys; sys.modules.update(dask=None, xarray=None); import vantrel;"
        "assert round(vantrel.refl_to_xyz([100] * 31)[1]) == 100"
    )
    for options in [], ["-OO"]:
        subprocess.run([sys.executable, *options, "-c", code], check=True)


def test_what_they_cannot_do_is_said():
    with pytest.raises(TypeError, match="out="):
        vantrel.refl_to_xyz(da.from_array(IMAGE), out=np.empty((14, 10, 3)))
    with pytest.raises(ValueError, match="integers"):
        vantrel.refl_to_xyz(IMAGE, da.from_array(np.full(10, 4.5)))
