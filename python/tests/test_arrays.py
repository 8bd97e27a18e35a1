"""What NumPy users expect of the functions: any shape, layout and type, and clear refusals."""

import ast
import pydoc
import runpy
import warnings
from concurrent.futures import ThreadPoolExecutor
from pathlib import Path

import numpy as np
import pytest

import vantrel

RANDOM = np.random.default_rng(7)
SPECTRA = RANDOM.uniform(1, 99, (6, 5, 31))
PAPER = np.linspace(80, 90, 31)
CURVES = np.ones((4, 31))
WHITE = [3100] * 4


def row_by_row(function, array):
    return np.array([[function(row) for row in rows] for rows in array])


@pytest.mark.parametrize(
    "lay_out",
    [
        np.asfortranarray,
        lambda a: np.repeat(a, 3, axis=2)[..., ::3],
        lambda a: a[::-1, :, ::-1].copy()[::-1, :, ::-1],
        lambda a: np.moveaxis(np.moveaxis(a, 2, 0).copy(), 0, 2),
        lambda a: a.astype(">f8"),
        lambda a: np.frombuffer(b"\0" + a.tobytes(), "u1")[1:].view("f8").reshape(a.shape),
    ],
    ids=["fortran", "every third", "backwards", "bands first", "big-endian", "unaligned"],
)
def test_memory_layout_changes_no_bit(lay_out):
    laid_out = lay_out(SPECTRA)
    expected = row_by_row(vantrel.refl_to_cielab, SPECTRA)
    assert np.array_equal(vantrel.refl_to_cielab(laid_out), expected)
    out = np.full((5, 3, 6), np.nan).transpose(2, 0, 1)
    assert vantrel.refl_to_cielab(laid_out, out=out) is out
    assert np.array_equal(out, expected)
    weights = np.asfortranarray(RANDOM.uniform(1, 2, (4, 31)))
    targets = np.broadcast_to([1.0, 2.0, 3.0, 4.0], (6, 5, 4))
    assert np.array_equal(
        vantrel.pol_refl_auto_adjust(laid_out, targets, weights),
        vantrel.pol_refl_auto_adjust(SPECTRA, targets.copy(), weights.copy(order="C")),
    )
    wide = np.ones((250, 2))[:, 0]  # more than a row has room for
    assert vantrel.calculate_special_density(PAPER, 15, wide) == 0


@pytest.mark.filterwarnings("ignore:.*reflectances are at most")
@pytest.mark.parametrize("illum_obs", vantrel.IllumObs)
def test_many_spectra_have_the_bits_of_one(illum_obs):
    spectra = RANDOM.uniform(-5, 120, (11, 33))[:, 1:32]
    spectra[1, 3], spectra[2, 30], spectra[4], spectra[5] = np.inf, 1e300, -0.0, 5e-324
    together = vantrel.refl_to_xyz(spectra, illum_obs)
    one_by_one = np.array([vantrel.refl_to_xyz(row, illum_obs) for row in spectra])
    assert together.tobytes() == one_by_one.tobytes()
    assert np.array_equal(vantrel.refl_to_xyz(spectra[:6], illum_obs), one_by_one[:6])


def test_everything_broadcasts():
    statuses = [["E"], ["T"]]
    densities = vantrel.refl_to_density(SPECTRA[0, 0], PAPER, statuses, ["RED", "BLUE", "VISUAL"])
    assert densities.shape == (2, 3)
    assert densities[1, 1] == vantrel.refl_to_density(
        SPECTRA[0, 0], PAPER, vantrel.Status.T_STATUS, vantrel.Response.BLUE_RESPONSE
    )
    mixed = ["RED", 3, vantrel.Response.VISUAL_RESPONSE]
    assert np.array_equal(vantrel.refl_to_density(SPECTRA[0, 0], PAPER, statuses, mixed), densities)
    lab = vantrel.refl_to_cielab(SPECTRA, np.arange(5, dtype=np.uint64))
    assert np.array_equal(lab[:, 3], vantrel.refl_to_cielab(SPECTRA[:, 3], "C_10DEG"))
    delta_e = vantrel.lab_to_de2000(lab[:, None], lab[None, :], kL=[1, 1, 2, 2, 3])
    assert delta_e.shape == (6, 6, 5) and np.all(np.diagonal(delta_e) == 0)
    inks, percent = SPECTRA[0, :2], [[[100, 0]], [[50, 50]]]
    assert vantrel.estimate_refls(inks, percent, SPECTRA[0]).shape == (2, 5, 31)
    assert vantrel.find_max_density_points(SPECTRA)[2].shape == (6, 5)
    assert vantrel.refl_to_xyz(np.empty((0, 31))).shape == (0, 3)
    assert vantrel.refl_to_density(SPECTRA[:, :0], None, "E", 1).shape == (6, 0)


def test_single_precision_is_a_cast_on_the_way_in_and_out():
    single = SPECTRA.astype(np.float32)
    exact = vantrel.refl_to_density(single.astype(np.float64), PAPER, "E", "GREEN")
    assert np.array_equal(vantrel.refl_to_density(single, PAPER, "E", "GREEN"), exact)
    out = np.empty(exact.shape, np.float32)
    vantrel.refl_to_density(single, PAPER, "E", "GREEN", out=out)
    assert np.array_equal(out, exact.astype(np.float32))
    assert np.array_equal(vantrel.refl_to_xyz([50] * 31), vantrel.refl_to_xyz([50.0] * 31))


def test_out_may_be_an_input_and_a_tuple():
    lab = vantrel.refl_to_cielab(SPECTRA)
    there_and_back = lab.copy()
    vantrel.cielab_to_cielch_ex(there_and_back, 0, out=there_and_back)
    assert np.array_equal(there_and_back, vantrel.cielab_to_cielch_ex(lab, 0))
    grayness, hue_error = np.empty((2, 6, 5))
    vantrel.refl_to_hue_gray(SPECTRA, PAPER, "E", out=(grayness, hue_error))
    assert np.array_equal((grayness, hue_error), vantrel.refl_to_hue_gray(SPECTRA, PAPER, "E"))


def test_a_refused_row_is_nan_without_a_warning():
    rows = SPECTRA[0].copy()
    rows[2] = 0
    with warnings.catch_warnings(), np.errstate(all="raise"):
        warnings.simplefilter("error")
        Yxy, ok = vantrel.refl_to_cie_yxy(rows, ok=True)
        vantrel.refl_to_density(rows * 1e300, PAPER * np.nan, "E", 1)
        vantrel.density_to_dot_area(rows[:, 0], np.inf, [1, 0, -0.0, np.nan, 1e-300])
    assert ok.tolist() == [True, True, False, True, True]
    assert np.isnan(Yxy).all(axis=-1).tolist() == [False, False, True, False, False]
    out = np.zeros_like(Yxy)
    result, ok = vantrel.refl_to_cie_yxy(rows, out=out, ok=True)
    assert result is out and np.isnan(out[2]).all() and ok.dtype == bool
    refl, first, peak, last = vantrel.get_normalized_density_weights("A", ["RED", "HIFI1"])
    assert np.isnan(refl[1]).all() and not np.isnan(peak[0])


@pytest.mark.parametrize(
    "call, reason",
    [
        (lambda: vantrel.refl_to_xyz(SPECTRA[..., :30]), "spectra.* 31 bands .* not 30"),
        (lambda: vantrel.refl_to_xyz(50.0), "spectra: 1 dimensions"),
        (lambda: vantrel.refl_to_xyz(SPECTRA, "D51_2DEG"), "illum_obs: .*D51_2DEG.*D50_2DEG"),
        (lambda: vantrel.refl_to_xyz(SPECTRA, [4, 18, 4, 4, 4]), "illum_obs: 18 is not one of"),
        (lambda: vantrel.refl_to_xyz(SPECTRA, 4.5), "no 4.5 among A_2DEG"),
        (lambda: vantrel.refl_to_xyz(SPECTRA, np.inf), "illum_obs: there is no inf"),
        (lambda: vantrel.refl_to_xyz(SPECTRA, vantrel.Status.E_STATUS), "no <Status.E_STATUS: 1>"),
        (lambda: vantrel.refl_to_xyz(np.ma.masked_greater(SPECTRA, 90)), "spectra: masked"),
        (lambda: vantrel.refl_to_xyz(None), "spectra: None"),
        (lambda: vantrel.refl_to_xyz(["a"] * 31), "spectra: numbers"),
        (lambda: vantrel.refl_to_density(SPECTRA, PAPER[1:], "E", 1), "paper.* 31"),
        (lambda: vantrel.refl_to_density(SPECTRA, [], "E", 1), "paper.* 31 bands .* not 0"),
        (lambda: vantrel.pol_refl_to_densities(PAPER, WHITE, PAPER, None, CURVES, "E"), "targets"),
        (lambda: vantrel.refl_to_density(SPECTRA, None, "SPECTRAL", 390), "390 .* 391 to 709"),
        (lambda: vantrel.refl_to_density(SPECTRA, None, ["E", "T"], 9), "shape|9 is not from 0"),
        (lambda: vantrel.refl_to_density(SPECTRA, None, -1, 1), "status: -1"),
        (lambda: vantrel.refl_to_hue_gray(SPECTRA, None, "SPECTRALX"), "status: 5 is not"),
        (lambda: vantrel.refl_to_white_e313_98(SPECTRA, "A_2DEG"), "illum_obs: 0 is not"),
        (lambda: vantrel.estimate_refls(SPECTRA[0, :4], [1] * 4, PAPER), "inks: one to three"),
        (lambda: vantrel.estimate_refls(SPECTRA[0, :2], [50, 5.5], PAPER), "percent: whole"),
        (lambda: vantrel.lab_to_de_lab(SPECTRA[..., :3], np.ones((4, 3))), "broadcast"),
        (lambda: vantrel.set_spectralx_constants(2, 84, 1.5, 0.5, 0.1), "centre must be 1"),
        (lambda: vantrel.set_achromatic_constants(50, 50, 3, 11), "no finite line"),
        (lambda: vantrel.set_hifi_constants([500, 510]), "wavelengths: 3 values"),
    ],
)
def test_a_wrong_call_says_why(call, reason):
    constants = vantrel.get_spectralx_constants()
    with pytest.raises(ValueError, match=reason):
        call()
    assert vantrel.get_spectralx_constants() == constants


def test_threads_run_side_by_side_and_agree():
    spectra = RANDOM.uniform(1, 99, (20_000, 31))
    expected = vantrel.refl_to_cielab(spectra)
    with ThreadPoolExecutor(8) as pool:
        for result in pool.map(vantrel.refl_to_cielab, [spectra] * 16):
            assert np.array_equal(result, expected)


def test_den_weight_is_the_table_that_densities_read():
    row = vantrel.den_weight[vantrel.Status.I_STATUS, vantrel.Response.RED_RESPONSE]
    kept = row.copy()
    before = vantrel.refl_to_density(SPECTRA, None, "I", "RED")
    try:
        row[:] = vantrel.den_weight[vantrel.Status.E_STATUS, vantrel.Response.RED_RESPONSE]
        after = vantrel.refl_to_density(SPECTRA, None, "I", "RED")
    finally:
        row[:] = kept
    assert np.array_equal(after, vantrel.refl_to_density(SPECTRA, None, "E", "RED"))
    assert not np.array_equal(before, after)


def test_words_are_strings():
    words = vantrel.verbal_color_difference(PAPER, PAPER * 0.9)
    assert words == ("Too Dark", "On Target", "On Target") and type(words[0]) is str
    lightness, colour1, colour2, ok = vantrel.verbal_color_difference(PAPER, SPECTRA, 4, 2, ok=True)
    assert lightness.shape == (6, 5) and lightness.dtype.kind == "U" and ok.all()
    assert set(colour1.flat) == {""} == set(colour2.flat)


def test_the_type_stubs_are_those_of_the_functions():
    folder = Path(__file__).parents[1]
    written = (folder / "src/vantrel/__init__.pyi").read_text()
    assert runpy.run_path(folder / "stubs.py")["stubs"]() == written
    ast.parse(written)
    assert "    refl_to_trap(" in pydoc.render_doc(vantrel, renderer=pydoc.plaintext)
