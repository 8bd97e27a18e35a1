"""Measurement files of every format, as arrays."""

from pathlib import Path

import numpy as np
import pytest

import vantrel

EXAMPLE = Path(__file__).parents[1] / "library/examples/two_ink_halftone.txt"

WIDE = "NUMBER_OF_FIELDS 39\nBEGIN_DATA_FORMAT\nSAMPLE_ID SAMPLE_NAME CMYK_C LAB_L LAB_A LAB_B "
WIDE += " ".join(f"SPECTRAL_NM{nm}" for nm in range(390, 711, 10)) + "\nEND_DATA_FORMAT\n"
WIDE += "NUMBER_OF_SETS 2\nBEGIN_DATA\n"
WIDE += "A1 <b>&grey 101.5 51 1 2 " + " ".join(f"{0.2 + i / 100:.2f}" for i in range(33)) + "\n"
WIDE += "A2 black 40 11 3 4 " + " ".join(f"{0.02 + i / 1000:.3f}" for i in range(33)) + "\n"
WIDE += "END_DATA\n"
COLOURS = "name,L,a,b\npaper,95,0,-2\nmagenta,48,75,-4\n"


def test_a_sheet_has_what_its_file_has():
    sheet = vantrel.read(EXAMPLE)
    assert (len(sheet), sheet.kind, sheet.file) == (31, "reflectance", str(EXAMPLE))
    assert (sheet.names[1], sheet.ids[1], sheet.index("2")) == ("Magenta 10", "2", 1)
    assert sheet.spectra[1, :3].tolist() == [79.93, 81.082, 81.825]
    assert sheet["Paper"] is not None and np.array_equal(sheet["Paper"], sheet.spectra[0])
    assert list(sheet.device) == ["CMYK_M", "CMYK_Y"] and sheet.device["CMYK_M"][1] == 10
    assert (sheet.lab, sheet.source.step_nm, sheet.source.bands) == (None, 10, 31)
    with pytest.raises(KeyError, match="no patch 'Cyan'; the patches are Paper, Magenta 10"):
        sheet["Cyan"]


def test_scales_ranges_and_warnings():
    with pytest.warns(UserWarning) as caught:
        sheet = vantrel.reads(WIDE.encode())
    assert [str(w.message) for w in caught] == sheet.warnings and caught[0].filename == __file__
    told = " ".join(sheet.warnings)
    assert "the largest ink value is 101.5" in told and "scale= sets the scale" in told
    assert np.allclose(sheet.spectra[:, [0, 30]], [[21, 51], [2.1, 5.1]])
    assert sheet.source.scaled and (sheet.source.first_nm, sheet.source.last_nm) == (390, 710)
    assert sheet.lab.tolist() == [[51, 1, 2], [11, 3, 4]]
    frame = sheet.to_pandas()
    assert frame.columns[:4].tolist() == ["id", "name", "CMYK_C", 400] and frame["b"][1] == 4
    refl = sheet.to_xarray()
    assert np.array_equal(refl.nm, np.arange(400, 701, 10)) and refl.CMYK_C[1] == 40
    assert vantrel.refl_to_cielab(refl).id.values.tolist() == ["A1", "A2"]
    page = sheet._repr_html_()
    assert "&lt;b&gt;&amp;grey" in page and "<b>" not in page and page.count("<tr>") == 3
    with pytest.warns(UserWarning):
        percent = vantrel.reads(WIDE.encode(), scale="percent")
    assert np.allclose(percent.spectra * 100, sheet.spectra)


def test_colours_alone_are_a_sheet_too():
    sheet = vantrel.reads(COLOURS.encode())
    assert (sheet.kind, sheet.spectra, sheet.source) == ("colours", None, None)
    assert sheet.lab[1].tolist() == [48, 75, -4] and "magenta" in sheet._repr_html_()
    with pytest.raises(KeyError, match="colours alone"):
        sheet["paper"]


@pytest.mark.parametrize(
    "call, reason",
    [
        (lambda: vantrel.reads(b"nothing"), "no measurement file"),
        (lambda: vantrel.reads(WIDE.replace("0.21", "o.21").encode()), "line 7: .*o.21"),
        (lambda: vantrel.read(__file__), "test_sheets.py: .*"),
        (lambda: vantrel.reads(WIDE.encode(), scale="per cent"), "scale: 'per cent'"),
        (lambda: vantrel.reads(WIDE.encode(), condition="M2"), "M2"),
        (lambda: vantrel.reads(WIDE.encode(), condition="D50"), "condition: 'D50'"),
    ],
)
def test_what_cannot_be_read_says_why(call, reason):
    with pytest.raises(ValueError, match=reason):
        call()
