"""Input that would give figures that look right: refused, brought into order, or without a result."""

import warnings
from concurrent.futures import ThreadPoolExecutor
from typing import get_type_hints

import dask.array as da
import numpy as np
import pandas as pd
import pytest
import xarray as xr

import vantrel

RANDOM = np.random.default_rng(9)
SPECTRA = RANDOM.uniform(5, 95, (6, 31))
LAB = vantrel.refl_to_cielab(SPECTRA)
PAPER = np.linspace(80, 90, 31)
NM = np.arange(400, 701, 10)


@pytest.mark.parametrize("rows", [6, 1600], ids=["a few", "many"])
@pytest.mark.parametrize("bad", [np.nan, np.inf, -np.inf])
def test_what_is_no_reading_has_no_result(bad, rows):
    spectra = np.resize(SPECTRA, (rows, 31))
    spectra[rows - 2, 30] = bad
    backwards = spectra[:, ::-1].copy()[:, ::-1]
    for given in spectra, backwards, np.asfortranarray(spectra):
        gain, ok = vantrel.refl_to_dot_gain(PAPER / 9, given, PAPER, "E", "GREEN", 1, 50, ok=True)
        assert np.flatnonzero(np.isnan(gain)).tolist() == [rows - 2]
        assert np.flatnonzero(~ok).tolist() == [rows - 2]
        assert vantrel.verbal_color_difference(PAPER, given)[0][rows - 2] == ""
        response = vantrel.determine_density_response(given, "E")
        assert response[rows - 2] == -1 and (response >= 0).sum() == rows - 1
        assert vantrel.refl_to_rgb(given)[rows - 2] == 2**32 - 1
        density, band = vantrel.calculate_spectralx_density(given, None, 10)
        assert np.isnan(density[rows - 2]) and band[rows - 2] == -1 and np.isnan(density).sum() == 1
        grayness, hue_error = vantrel.refl_to_hue_gray(given, None, "E")
        assert np.isnan([grayness[rows - 2], hue_error[rows - 2]]).all()
    worse = np.where(np.arange(31) == 12, bad, PAPER)
    for all_bad in (
        vantrel.refl_to_density(SPECTRA, worse, "E", [[1], [2]]),
        vantrel.refl_to_densities(SPECTRA, worse, "E")[:, [0, 1]].T,
        vantrel.refl_to_dot_gain(worse, SPECTRA, PAPER, "E", "GREEN", [[1], [2]], 50),
        vantrel.refl_to_dot_area(PAPER / 9, SPECTRA, PAPER, "E", "GREEN", [[bad], [bad]]),
    ):
        assert not np.isfinite(all_bad).any() and all_bad.shape == (2, len(SPECTRA))
    inplace = np.array([3.0, bad, 40.0])
    vantrel.saunderson(inplace, 0.04, 0.6, out=inplace)
    assert np.array_equal(np.isfinite(inplace), [True, False, True])


def test_wavelengths_count():
    assert np.array_equal(vantrel.resample(SPECTRA, NM), SPECTRA)
    wide = np.arange(380, 731, 10)
    fine = np.arange(380, 731, 5)
    ramp = np.interp(fine, NM, PAPER)
    for nm in fine, fine[4:-6], np.arange(396, 703, 3), np.arange(720, 379, -1):
        wave = 50 + 40 * np.sin(nm / 17) + 30 * (nm == 505)
        text = f"name,{','.join(map(str, nm))}\nwave,{','.join(map(repr, wave.tolist()))}\n"
        in_file = vantrel.reads(text.encode())["wave"]
        assert np.allclose(vantrel.resample(wave, nm), in_file, rtol=1e-14, atol=0)
    expected = vantrel.refl_to_density(SPECTRA, None, "E", "GREEN")
    padded = np.pad(SPECTRA, ((0, 0), (2, 3)), constant_values=1e9)
    for values, nm in (SPECTRA, NM), (SPECTRA[:, ::-1], NM[::-1]), (padded, wide):
        labelled = xr.DataArray(values, {"nm": nm}, ("patch", "nm"), attrs={"units": "%"})
        beside = xr.DataArray(values, {"wl": ("bands", nm), "line": ("patch", 400 + np.arange(len(values)))},
                              ("patch", "bands"))
        frame = pd.DataFrame(values, columns=[f"SPECTRAL_NM{w}" for w in nm])
        for given in labelled, beside, labelled.chunk({"patch": 2}), frame, frame.astype("Float64"):
            density = vantrel.refl_to_density(given, None, "E", "GREEN")
            assert np.array_equal(density, expected) and not getattr(density, "attrs", None)
    for label in "R_{}_nm", "refl[{}]", "{}nm", "nm{}", "R1 {}.0 nm", "2024: {} nm", "{} nm, 2024":
        turned = pd.DataFrame(SPECTRA[:, ::-1], columns=[label.format(w) for w in NM[::-1]])
        assert np.array_equal(vantrel.refl_to_density(turned, None, "E", "GREEN"), expected)
    turned.columns = pd.MultiIndex.from_product([["refl"], NM[::-1]], names=["kind", "nm"])
    assert np.array_equal(vantrel.refl_to_density(turned, None, "E", "GREEN"), expected)
    halves = np.arange(380, 731, 2.5)
    waves = pd.DataFrame([50 + 40 * np.sin(halves / 20)], columns=[f"R{w}" for w in halves])
    at_bands = vantrel.resample(waves.to_numpy(), halves)
    assert np.array_equal(vantrel.refl_to_xyz(waves), vantrel.refl_to_xyz(at_bands))
    numbered = xr.DataArray(SPECTRA, {"band": np.arange(31)}, ("patch", "band"), name="refl")
    assert vantrel.refl_to_density(numbered, None, "E", "GREEN").name == "density"


SQUARE = np.resize(SPECTRA, (31, 31))


@pytest.mark.parametrize(
    "given, reason",
    [
        (xr.DataArray(SQUARE, dims=("nm", "patch")), "along 'nm'.*transpose"),
        (xr.DataArray(SQUARE, dims=("Wavelength [nm]", "patch")), "along 'Wavel.*transpose"),
        (xr.DataArray(SQUARE, dims=("wavelength_nm", "patch")), "along 'wavel.*transpose"),
        (xr.DataArray(SQUARE, {"f": NM}, ("f", "patch")), "along 'f'.*transpose"),
        (pd.DataFrame(SQUARE, index=NM), "along 'index'.*transpose"),
        (xr.DataArray(SPECTRA, {"nm": NM + 10}, ("patch", "nm")), "range is too short"),
        (xr.DataArray(SPECTRA, {"wl": ("b", NM + 10)}, ("patch", "b")), "range is too short"),
        (xr.DataArray(SQUARE, {"wl": ("f", NM)}, ("f", "patch")), "along 'f'.*transpose"),
        (xr.DataArray(SPECTRA[:, :16], {"nm": NM[:16] * 2 - 400}, ("p", "nm")), "between 400 and 4"),
        (pd.DataFrame(SPECTRA, columns=NM - 5), "at 395 and 405"),
        (pd.DataFrame(SPECTRA, columns=NM / 1e3), "in nm: multiply those in µm by 1000"),
        (pd.DataFrame(np.resize(SPECTRA, (2, 32)), columns=np.arange(395, 706, 10)), "at 395 and 405"),
        (pd.DataFrame(np.resize(SPECTRA, (2, 46)), columns=[*range(400, 550, 5), *NM[15:]]), "5 to 10"),
        (da.from_array(np.ma.masked_greater(SPECTRA, 90), chunks=3), "masked"),
        ([pd.Series(SPECTRA[0], NM[::-1])], "labels and masks .* are lost"),
        ((np.ma.masked_greater(SPECTRA[0], 90), SPECTRA[1]), "labels and masks .* are lost"),
        (type("Quantity", (), {"__module__": "pint.registry"})(), "magnitude"),
    ],
)
def test_spectra_that_do_not_lie_as_they_should_are_refused(given, reason):
    with pytest.raises(ValueError, match="spectra: .*" + reason):
        vantrel.refl_to_cielab(given)


def test_fractions_are_warned_of():
    black, fractions = np.linspace(0.6, 1.4, 31), SPECTRA / 100
    solid = fractions[0]
    for names, call in (
        ("spectra", lambda: vantrel.refl_to_xyz(fractions)),
        ("spectra", lambda: vantrel.refl_to_xyz(fractions.tolist())),
        ("values", lambda: vantrel.resample(fractions, NM)),
        ("spectra", lambda: vantrel.refl_to_density(black, None, "E", 1)),
        ("spectra", lambda: vantrel.refl_to_density(fractions, PAPER, "E", 1)),
        ("paper", lambda: vantrel.refl_to_density(da.from_array(SPECTRA, chunks=3), PAPER / 100, "E", 1)),
        ("paper", lambda: vantrel.refl_to_density(SPECTRA[0], PAPER / 100, "E", 1)),
        ("solid", lambda: vantrel.refl_to_dot_area(solid, PAPER / 2, PAPER, "E", "GREEN", 1.0)),
        ("spectra1, spectra2", lambda: vantrel.combine_ink_colors(black, black)),
    ):
        for _ in range(2):
            with pytest.warns(UserWarning, match=f"^{names}: .*multiply fractions by 100") as caught:
                call()
            assert caught[0].filename == __file__
    with warnings.catch_warnings():
        warnings.simplefilter("error")
        vantrel.refl_to_xyz(np.zeros(31))
        vantrel.refl_to_density(black, PAPER, "E", 1)
        vantrel.refl_to_density([black, black], PAPER, "E", 1)


def test_whole_numbers_that_an_int_does_not_hold_have_no_result():
    percent = np.array([50, 2**32 + 50, -(2**40), 0])
    for call in (
        lambda percent: vantrel.estimate_refls_for_tint_color(SPECTRA[0], percent, PAPER, ok=True),
        lambda percent: vantrel.estimate_refls(SPECTRA[:1], percent[..., None], PAPER, ok=True),
        lambda percent: vantrel.refl_to_dot_gain(*SPECTRA[:2], PAPER, "E", "GREEN", 1.0, percent, ok=True),
    ):
        refl, ok = call(percent)
        assert ok.tolist() == [True, False, False, True]
        assert np.isnan(refl.reshape(4, -1)).all(-1).tolist() == [False, True, True, False]
        assert np.isnan(call(percent[1])[0]).all() and not call(percent[1])[1]


def test_any_name_of_a_dimension_will_do():
    image = SPECTRA.reshape(2, 3, 31)
    expected = vantrel.refl_to_density(image, PAPER, [["E"], ["T"]], "GREEN")
    for dim in "p", "31", "density", 7:
        labelled = xr.DataArray(image, dims=(dim, "q", "nm"))
        for paper in PAPER, xr.DataArray(PAPER, dims="nm"):
            density = vantrel.refl_to_density(labelled, paper, [["E"], ["T"]], "GREEN")
            assert density.dims == (dim, "q") and np.array_equal(density, expected)
    named = xr.DataArray(["E", "T"], dims="p")
    by_name = vantrel.refl_to_density(xr.DataArray(SPECTRA[:2], dims=("p", "nm")), None, named, "GREEN")
    assert np.array_equal(by_name, vantrel.refl_to_density(SPECTRA[:2], None, ["E", "T"], "GREEN"))
    lab = vantrel.refl_to_cielab(xr.DataArray(SPECTRA, dims=("lab", "nm")))
    assert lab.dims == ("lab", "lab_")
    expected = vantrel.refl_to_density(SPECTRA, PAPER, [["E"], ["T"]], "GREEN")
    one = xr.DataArray(SPECTRA[0], dims="nm")
    assert np.array_equal(vantrel.refl_to_density(one, PAPER, [["E"], ["T"]], 2), expected[:, :1])
    stack = vantrel.refl_to_density(xr.DataArray(SPECTRA, dims=("p", "nm")), PAPER, [[1], [3]], 2)
    assert stack.dims == ("dim_0", "p") and np.array_equal(stack, expected)


@pytest.mark.parametrize(
    "status, response, reason",
    [
        ("e", 1, "no 'e'; 'E' is meant"),
        (["E", vantrel.Response.RED_RESPONSE], 1, "no <Response.RED_RESPONSE: 1> among A_STATUS"),
        ([True, True], 1, "no True"),
        (np.array([True, False]), 1, "no True"),
        ("E", "CYAN", "cyan is read through 'RED'"),
        ("E", ["RED", "GREN"], "no 'GREN'; 'GREEN.*' is meant"),
        ("E", 9, "9 is not from 0 to 8"),
    ],
)
def test_a_wrong_name_is_told_the_right_one(status, response, reason):
    with pytest.raises(ValueError, match=reason):
        vantrel.refl_to_density(SPECTRA[:2], None, status, response)
    with pytest.raises(ValueError, match="'D50_2DEG' or 'D50_10DEG' is meant"):
        vantrel.refl_to_xyz(SPECTRA, "D50")
    with pytest.raises(ValueError, match=r"0 is not one of C_2DEG \(2\), .*D65_10DEG \(7\)$"):
        vantrel.refl_to_white_e313_98(SPECTRA, "A_2DEG")


def test_a_filter_that_a_status_does_not_have_has_no_reading():
    through_filters = [
        lambda status, response, **ok: vantrel.refl_to_density(SPECTRA[:2], PAPER, status, response, **ok),
        lambda *read, **ok: vantrel.refl_to_refl_density(SPECTRA[:2], *read, **ok),
        lambda *read, **ok: vantrel.density_to_integrated_refl([1.2, 1.3], *read, **ok),
        lambda *read, **ok: vantrel.refl_to_dot_area(PAPER / 9, SPECTRA[:2], PAPER, *read, **ok),
        lambda *read, **ok: vantrel.refl_to_dot_gain(PAPER / 9, SPECTRA[:2], PAPER, *read, 1, 50, **ok),
        lambda *read, **ok: vantrel.refl_to_print_contrast(PAPER / 9, SPECTRA[:2], PAPER, *read, **ok),
        lambda *read, **ok: vantrel.refl_to_trap(PAPER / 9, PAPER / 5, SPECTRA[:2], PAPER, *read, **ok),
        lambda *read, **ok: vantrel.pol_refl_to_density(
            SPECTRA[:2], np.ones(4), None, None, np.ones((4, 31)), *read, **ok
        ),
        lambda *read, **ok: vantrel.get_normalized_density_weights(*read, **ok)[-2:],
    ]
    for function in through_filters:
        with pytest.raises(ValueError, match="response: E_STATUS has no filter for HIFI1.*, but VISUAL_"):
            function("E", "HIFI1")
        values, ok = function(["E", "CCR2"], ["GREEN", "HEXACHROME2"], ok=True)
        assert np.isfinite(values).tolist() == ok.tolist() == [True, False]
        with vantrel.settings():  # a filter of one's own
            vantrel.den_weight[1, 4] = vantrel.den_weight[1, 3]
            assert np.array_equal(function("E", "HIFI1"), function("E", "BLUE"))
    lazy = vantrel.refl_to_density(da.from_array(SPECTRA, chunks=3), None, da.from_array([1, 6] * 3), 5)
    assert np.isfinite(lazy.compute()).tolist() == [False, True] * 3
    assert np.isfinite(vantrel.refl_to_density(SPECTRA[:2], None, ["SPECTRAL", "HIFI"], [550, 6])).all()


def hifi(spectra):
    return vantrel.refl_to_density(spectra, None, "HIFI", "HIFI1")


def test_settings_travel_with_the_blocks():
    image = np.resize(SPECTRA, (40, 31))
    default = hifi(image)
    blocks = da.from_array(image, chunks=(10, 31))
    lazy_default = hifi(blocks)
    with vantrel.settings(hifi=([480, 560, 620],), spectralx=(2, 84, 1, 0.4, 0.2)):
        changed, lazy = hifi(image), hifi(blocks)
        assert vantrel.get_spectralx_constants()[3] == 0.4
        assert np.array_equal(lazy_default.compute(), default)
    assert vantrel.get_spectralx_constants()[3] == 0.5 and np.array_equal(hifi(image), default)
    assert not np.allclose(changed, default) and lazy.name != lazy_default.name
    assert np.array_equal(lazy.compute(scheduler="synchronous"), changed)
    assert np.array_equal(hifi(image), default)
    # both at once, in threads, beside calls that no block stands behind
    with ThreadPoolExecutor(4) as pool:
        direct = [pool.submit(hifi, image) for _ in range(50)]
        both = da.stack([lazy, lazy_default, lazy]).compute(scheduler="threads", num_workers=4)
    assert all(np.array_equal(d.result(), default) for d in direct)
    assert np.array_equal(both, [changed, default, changed])


def test_settings_of_two_threads_do_not_overlap():
    before = vantrel.get_hifi_constants()[0].tolist()
    outer, inner = vantrel.settings(hifi=([480, 560, 620],)), vantrel.settings(hifi=([500, 560, 620],))
    with ThreadPoolExecutor(1) as other, vantrel.settings():
        with pytest.raises(RuntimeError, match="another thread is inside"):
            other.submit(inner.__enter__).result()
        outer.__enter__()
        inner = vantrel.settings(hifi=([500, 560, 620],))
        inner.__enter__()  # as coroutines do, which take turns
        outer.__exit__(None, None, None)
        assert vantrel.get_hifi_constants()[0][0] == 500
        inner.__exit__(None, None, None)
        assert vantrel.get_hifi_constants()[0].tolist() == before


def test_a_centre_takes_its_shape_along():
    with vantrel.settings():
        _, shape, *_ = vantrel.get_hifi_constants()
        row = vantrel.den_weight[vantrel.Status.HIFI_STATUS, vantrel.Response.HIFI1_RESPONSE].copy()
        vantrel.set_hifi_constants([550, 600, 640])
        centres, moved, *_ = vantrel.get_hifi_constants()
        assert centres.tolist() == [550, 600, 640] and np.allclose(moved, shape, atol=1e-4)
        now = vantrel.den_weight[vantrel.Status.HIFI_STATUS, vantrel.Response.HIFI1_RESPONSE]
        assert now.argmax() == 15 != row.argmax() and now.sum() == row.sum()


@pytest.mark.parametrize(
    "reason, constants",
    [
        ("wavelengths: .* not at nan", {"hifi": ([np.nan, 550, 600],)}),
        ("wavelengths: .* not at 680", {"hifi": ([480, 550, 680],)}),
        ("wavelengths: .* not at -inf", {"hexachrome": ([480, -np.inf],)}),
        ("shape2: .* below 0", {"hexachrome": ([480, 620], [1] * 7, [-0.1] + [1] * 6)}),
        ("shape3: .* finite", {"hifi": ([480, 550, 620], None, None, [np.inf] * 7)}),
        ("shape1: .* scaled", {"hifi": ([480, 550, 620], [1e-320] * 7)}),
        ("inner: .* not inf", {"spectralx": (2, 84, 1, np.inf, 0.1)}),
        ("centre: .* must be 1", {"spectralx": (2, 84, 2, 0.5, 0.1)}),
        ("C1: .* not nan", {"achromatic": (84, 14, np.nan, 11)}),
    ],
)
def test_wrong_constants_change_nothing(reason, constants):
    before = vantrel.ufuncs.get_settings()
    with pytest.raises(ValueError, match=reason), vantrel.settings(**constants):
        pass
    assert vantrel.ufuncs.get_settings() == before


def test_unrounded_differences():
    first, second = np.array([50, 3.004, 1.006]), np.array([50, 3.006, 1.004])
    delta_h = vantrel.lab_to_dh(first, second, rounded=False)
    (_, C1, h1), (_, C2, h2) = vantrel.cielab_to_cielch_ex([first, second], 0)
    assert delta_h == pytest.approx(2 * np.sqrt(C1 * C2) * np.sin(np.radians(h2 - h1) / 2))
    assert abs(vantrel.lab_to_dh(first, second)) > 2 * abs(delta_h)
    near, same = np.array([50.0, 40, 0.004]), [50.0, 40, 0]
    assert vantrel.lab_to_de_cmc(near, same, rounded=False) == pytest.approx(0.002515, abs=1e-6)
    assert vantrel.lab_to_de_cmc(LAB[0], LAB[1]) == pytest.approx(
        vantrel.lab_to_de_cmc(LAB[0], LAB[1], rounded=False), abs=0.02
    )


def test_packed_colours_unpack():
    packed = vantrel.refl_to_rgb([SPECTRA[0], SPECTRA[1] * np.nan])
    rgb, ok = vantrel.unpack_rgb(packed, ok=True)
    assert rgb.tolist() == [[packed[0] & 255, packed[0] >> 8 & 255, packed[0] >> 16], [-1, -1, -1]]
    assert ok.tolist() == [True, False]


def test_type_hints_can_be_read():
    assert set(get_type_hints(vantrel.refl_to_density)) == {"spectra", "paper", "status", "response"}
