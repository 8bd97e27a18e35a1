"""Measurement files of every format, as arrays."""

import dataclasses
import inspect
import os
import pickle
import re
import shlex
import subprocess
import warnings
from dataclasses import replace
from pathlib import Path

import matplotlib
import numpy as np
import pandas as pd
import pytest

import vantrel
from vantrel._sheet import in_python

LIBRARY = Path(__file__).resolve().parents[1] / "library"
EXAMPLE = LIBRARY / "examples/two_ink_halftone.txt"

WIDE = "NUMBER_OF_FIELDS 39\nBEGIN_DATA_FORMAT\nSAMPLE_ID SAMPLE_NAME CMYK_C LAB_L LAB_A LAB_B "
WIDE += " ".join(f"SPECTRAL_NM{nm}" for nm in range(390, 711, 10)) + "\nEND_DATA_FORMAT\n"
WIDE += "NUMBER_OF_SETS 2\nBEGIN_DATA\n"
WIDE += "A1 <b>&grey 101.5 51 1 2 " + " ".join(f"{0.2 + i / 100:.2f}" for i in range(33)) + "\n"
WIDE += "A2 black 40 11 3 4 " + " ".join(f"{0.02 + i / 1000:.3f}" for i in range(33)) + "\n"
WIDE += "END_DATA\n"
SPOT = '<ReflectanceSpectrum ColorSpecification="{0}" StartWL="400">' + "0.{1} " * 31 + "</ReflectanceSpectrum>"
CONDITION = """<ColorSpecification Id="{0}"><MeasurementSpec><WavelengthRange Increment="10"/>
<Device><DeviceIllumination>{0}_Light</DeviceIllumination></Device></MeasurementSpec></ColorSpecification>"""
LIBRARY_OF_SPOTS = f"""<CxF xmlns="http://colorexchangeformat.com/CxF3-core"><Resources><ObjectCollection>
<Object ObjectType="Standard" Name="Spot" Id="1"><ColorValues>{SPOT.format("M0", 4)}{SPOT.format("M1", 5)}
</ColorValues></Object></ObjectCollection><ColorSpecificationCollection>{CONDITION.format("M0")}
{CONDITION.format("M1")}</ColorSpecificationCollection></Resources></CxF>"""
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
    sheet = vantrel.reads(COLOURS.replace("\n", ",M1\n").replace("b,M1", "b,mode").encode())
    assert (sheet.kind, sheet.spectra, sheet.source.condition) == ("colours", None, "M1")
    with pytest.warns(UserWarning, match="for which illuminant"):
        assert vantrel.report(sheet).source.condition == "M1"
    assert sheet.lab[1].tolist() == [48, 75, -4] and "magenta" in sheet._repr_html_()
    with pytest.raises(KeyError, match="colours alone"):
        sheet["paper"]
    assert "L*a*b* for F7_2DEG" in replace(sheet, lab_illuminant=vantrel.IllumObs.F7_2DEG)._repr_html_()


def test_a_library_of_spots_has_no_paper_and_two_conditions(tmp_path):
    file = tmp_path / "spots.cxf"
    file.write_text(LIBRARY_OF_SPOTS)
    with warnings.catch_warnings():
        warnings.simplefilter("ignore")
        sheets = [vantrel.read(file, condition=c) for c in ("M0", "M1")]
        comparison = vantrel.compare(*sheets)
    assert [(s.collection, s.source.condition, s["Spot"][0]) for s in sheets] == [
        (True, "M0", 40),
        (True, "M1", 50),
    ]
    assert "spots.cxf (M0)" in str(comparison) and "spots.cxf (M1)" in str(comparison)


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


@pytest.fixture(scope="module")
def darker(sheet):
    """One patch measured twice, one without an aim and without device values, one entered twice."""
    kept = [*range(31), 4, 7]
    spectra = sheet.spectra[kept] * np.linspace(0.9, 1, 33)[:, None]
    spectra[32] = spectra[7]
    device = {field: column[kept] for field, column in sheet.device.items()}
    for column in device.values():
        column[32] = np.nan
    return replace(
        sheet,
        spectra=spectra,
        names=["no aim", *sheet.names[1:], sheet.names[4], "entered twice"],
        ids=[*map(str, range(33))],
        device=device,
        lines=[],
        file="darker.txt",
    )


def agree(made, document):
    """Whether a result holds all of a document, in whatever order."""
    if dataclasses.is_dataclass(made):
        attributes = {f.name: getattr(made, f.name) for f in dataclasses.fields(made)}
        delta_e = attributes.pop("delta_e", {})
        missing = {name for name, value in attributes.items() if value is None}
        agree({**attributes, **delta_e}, {**dict.fromkeys(missing), **document})
    elif isinstance(made, dict):
        assert made.keys() == document.keys()
        for key, value in made.items():
            agree(value, document[key])
    elif isinstance(made, tuple):
        assert len(made) == len(document)
        for value, other in zip(made, document):
            agree(value, other)
    else:
        assert made == document and type(made) is type(document)


ASKED = [
    (
        lambda sheet, _: vantrel.report(
            sheet, illuminant="D65_10DEG", status="T", paper="none", n_factor=1.7, order=["CMYK_Y"]
        ),
        "report EXAMPLE --illuminant D65_10DEG --status T_STATUS --paper none --n-factor 1.7 --order CMYK_Y",
    ),
    (
        lambda sheet, darker: vantrel.report(
            sheet, second_paper="Magenta 10", second_sheet=darker, second_illuminant=12
        ),
        "report EXAMPLE --second-illuminant F11_2DEG --second-paper darker.txt:Magenta\\ 10",
    ),
    (
        lambda sheet, darker: vantrel.compare(
            sheet,
            darker,
            illuminant="C_2DEG",
            status=vantrel.Status.I_STATUS,
            pair="name",
            repeats="each",
            formula=["cmc", "de2000"],
            weights={"de2000": (2, 1.5)},
            second_illuminant="F2_2DEG",
            words="hue",
            tolerance=1.25,
            tolerances=LIBRARY / "examples/proof.toml",
            substrate_corrected=True,
            allow_missing=True,
        ),
        "compare EXAMPLE darker.txt --illuminant C_2DEG --status I_STATUS --pair name --repeats each"
        " --formula cmc,de2000 --weights de2000=2,1.5 --second-illuminant F2_2DEG --words hue"
        " --tolerance 1.25 --tolerances LIBRARY/examples/proof.toml --substrate-corrected --allow-missing",
    ),
    (
        lambda sheet, darker: vantrel.report(sheet, advice=darker),
        "report EXAMPLE --advice darker.txt",
    ),
    (
        lambda sheet, darker: vantrel.compare(
            sheet, darker, paper="1", pair="id", force_pairs=True, advice=True
        ),
        "compare EXAMPLE darker.txt --paper 1 --pair id --force-pairs --advice",
    ),
    (
        lambda sheet, _: vantrel.ink(
            sheet,
            "Magenta 100 Yellow 100",
            against="6",
            illuminant=0,
            status="I",
            paper="1",
            order=["CMYK_Y", "CMYK_M"],
        ),
        "ink EXAMPLE --patch 'Magenta 100 Yellow 100' --against 6 --illuminant A_2DEG --status I_STATUS"
        " --paper 1 --order CMYK_Y,CMYK_M",
    ),
    (
        lambda sheet, _: vantrel.predict(sheet, order=["CMYK_Y", "CMYK_M"], status="A"),
        "predict EXAMPLE --order CMYK_Y,CMYK_M --status A_STATUS",
    ),
    (
        lambda _, darker: vantrel.predict(darker, inks=[("CMYK_Y", 30), ("Magenta 100", 61)]),
        "predict darker.txt --ink CMYK_Y:30 --ink Magenta\\ 100:61",
    ),
    (
        lambda sheet, darker: vantrel.run(
            [sheet, LIBRARY / "examples/proof.toml", darker],
            sheet,
            tolerances=LIBRARY / "examples/proof.toml",
            status="T",
            illuminant="D65_2DEG",
            paper="1",
            order=["CMYK_Y", "CMYK_M"],
        ),
        "run EXAMPLE LIBRARY/examples/proof.toml darker.txt --aims EXAMPLE --status T_STATUS --paper 1"
        " --tolerances LIBRARY/examples/proof.toml --illuminant D65_2DEG --order CMYK_Y,CMYK_M",
    ),
]


# What the program asks for and Python says otherwise: by read(), by the sheets, by the result.
NOT_ARGUMENTS = set("all aims condition format help no-color output sample-condition scale".split())


def test_every_option_of_the_program_is_an_argument():
    program = os.environ.get("VANTREL_PROGRAM")
    if not program:
        pytest.skip("VANTREL_PROGRAM does not name the program")
    for command in "report", "compare", "predict", "ink", "run":
        shown = subprocess.run([program, command, "--help"], capture_output=True, text=True).stdout
        options = {*re.findall(r"(?<!\S)--([a-z-]+)", shown)} - NOT_ARGUMENTS
        taken = {*inspect.signature(getattr(vantrel, command)).parameters}
        renamed = {"ink": "inks"} if command == "predict" else {}
        assert len(options) > 3
        assert {renamed.get(o, o.replace("-", "_")) for o in options} <= taken, command


@pytest.mark.parametrize("call, command", ASKED)
def test_results_are_those_of_the_program(call, command, sheet, darker, tmp_path, monkeypatch):
    program = os.environ.get("VANTREL_PROGRAM")
    if not program:
        pytest.skip("VANTREL_PROGRAM does not name the program")
    monkeypatch.chdir(tmp_path)
    darker.write("darker.txt")
    with warnings.catch_warnings(record=True) as caught:
        warnings.simplefilter("always")
        darker = vantrel.read("darker.txt")
        assert "the same spectrum to the last digit" in str(caught[0].message)
        if "darker.txt" not in command:
            caught.clear()
        result = call(sheet, darker)
    words = shlex.split(command.replace("EXAMPLE", str(EXAMPLE)).replace("LIBRARY", str(LIBRARY)))

    def printed(form):
        return subprocess.run([program, *words, "--format", form], capture_output=True, text=True)

    run = printed("json")
    assert (result.json, str(result)) == (run.stdout, printed("table").stdout)
    told = sorted(f"vantrel: {w.message}" for w in caught)
    complained = run.stderr.replace("--force-pairs ", "force_pairs= ").replace("--paper ", "paper= ")
    assert told == sorted(complained.splitlines())
    for ending, form in (".html", "html"), (".csv", "csv"), (".txt", "cgats"), (".json", "json"):
        result.write("result" + ending)
        assert Path("result" + ending).read_bytes() == printed(form).stdout.encode()
    assert result.to_html() == Path("result.html").read_text()
    document = result.to_dict()
    assert document.pop("command") == command.split()[0]
    agree(result, document["sheets"][0] if command.startswith("report") else document)
    assert pickle.loads(pickle.dumps(result)) == result
    assert "<pre>" in result._repr_html_()

    frame = result.to_pandas()
    frame.to_csv("frame.csv", index=False)
    ours, theirs = pd.read_csv("frame.csv"), pd.read_csv("result.csv", nrows=len(frame))
    theirs.columns = theirs.columns.str.removeprefix("nm")
    if command.startswith("ink"):
        theirs = pd.read_csv("result.csv").query("table == 'densities'").reset_index()
    if command.startswith("run"):
        readings = pd.read_csv("result.csv", index_col="name").loc[ours.columns[1:]]
        theirs = readings.filter(regex=r"^\d+ (?!zones)").T.reset_index(drop=True)
    both = [column for column in ours if column in theirs]
    assert len(both) > 2 and len(ours) > 1
    pd.testing.assert_frame_equal(
        ours[both], theirs[both], rtol=0, atol=6e-5, check_dtype=False, check_names=False
    )


def test_spectra_that_are_put_in_are_judged_with_their_scale_in_doubt(sheet):
    doubts = {1 / 100: "all reflectances are at most 1.5 %: multiply fractions by 100",
              4: f"the largest reflectance is {4 * sheet.spectra.max():.4g} %"}
    for factor, doubt in doubts.items():
        other = replace(sheet, spectra=sheet.spectra * factor, file="other")
        with pytest.warns(UserWarning, match=re.escape(f"other: {doubt}")):
            assert f"other: {doubt}" in vantrel.report(other).to_html()


def test_numbers_that_are_put_in_are_doubted_as_those_of_a_file(sheet, tmp_path):
    magenta = sheet.device["CMYK_M"]
    below = np.where(np.arange(31) == 7, -sheet.spectra, sheet.spectra)
    for odd in (
        replace(sheet, spectra=below),
        replace(sheet, device={"CMYK_M": magenta / 100, "CMYK_Y": sheet.device["CMYK_Y"]}),
        replace(sheet, device={"CMYK_M": np.where(magenta == 30, -30, magenta), "CMYK_Y": sheet.device["CMYK_Y"]}),
    ):
        with warnings.catch_warnings(record=True) as put_in:
            warnings.simplefilter("always")
            vantrel.report(replace(odd, file="odd"))
        with warnings.catch_warnings(record=True):
            warnings.simplefilter("always")
            odd.write(tmp_path / "odd.txt")
            read = vantrel.read(tmp_path / "odd.txt")
        told = [str(w.message) for w in put_in]
        unplaced = [re.sub(r"^(\d+:)? ?", "", line) for line in read.warnings]
        assert unplaced and all(any(line in one for one in told) for line in unplaced)


def test_an_illuminant_that_a_file_states_holds_for_its_spectra_too(tmp_path):
    (tmp_path / "stated.txt").write_text(EXAMPLE.read_text().replace("DESC", 'ILLUMINANT "D65"\nDESC', 1))
    assert vantrel.report(vantrel.read(tmp_path / "stated.txt")).to_dict()["sheets"][0]["illuminant"] == "D65_2DEG"


def test_a_result_stays_what_it_was(sheet):
    live = replace(sheet, spectra=sheet.spectra.copy())
    report = vantrel.report(live, n_factor=np.float64(1.5))
    page = report.to_html()
    live.spectra[:] *= 0.5
    assert report.to_html() == page and report.json == vantrel.report(sheet, n_factor=1.5).json
    with vantrel.settings(achromatic=(90, 10, 40, 50)):
        with pytest.warns(UserWarning, match="constants of the program"):
            assert vantrel.report(sheet, n_factor=1.5).json == report.json


@pytest.mark.filterwarnings("ignore")
def test_a_run_names_what_is_not_there(sheet, darker):
    with pytest.warns(UserWarning, match="not judged: nowhere.txt: No such file"):
        run = vantrel.run([darker, "nowhere.txt"], sheet)
    assert run.unread == ("nowhere.txt: No such file or directory",)


def test_a_sheet_shows_what_it_is(sheet):
    page = sheet._repr_html_()
    assert page.count("rgb(243, 242, 240)") == 1 and "<td>95.48</td><td>0.04</td><td>1.11</td>" in page
    assert "L*a*b* for D50_2DEG" in page
    assert "two_ink_halftone.txt: 31 patches, reflectance" in repr(sheet)
    many = vantrel.reads(COLOURS.encode() + b"yellow,90,-5,92\n" * 201)
    assert "<p>3 more patches are not shown</p>" in many._repr_html_()
    library = vantrel.report(replace(sheet, collection=True, device={}, lab=np.full((31, 3), np.nan)))
    assert (library.paper.name, library.paper.chosen) == (None, "a collection of colours")


@pytest.mark.parametrize(
    "call, reason",
    [
        (lambda s: vantrel.report(s, illuminant="D50"), "illuminant: there is no 'D50'; 'D50_2DEG'"),
        (lambda s: vantrel.report(s, status=10), "status: 10 is not one of"),
        (lambda s: vantrel.report(s, paper="Cyan"), "Cyan"),
        (lambda s: vantrel.compare(s, s, force_pairs=True), "force_pairs"),
        (lambda s: vantrel.compare(s, s, weights={"de76": (1, 1)}), "de76 has no weights"),
        (lambda s: vantrel.compare(s, s, formula=["de2000"] * 2), "named twice"),
        (lambda s: vantrel.compare(s, s, tolerances=EXAMPLE), "examples/two_ink_halftone.txt:1: "),
        (lambda s: vantrel.predict(s, inks={"CMYK_M": 40.5}), "whole percentage"),
        (lambda s: vantrel.predict(s, inks={"CMYK_M": np.nan}), "inks: of 'CMYK_M' .* not nan"),
        (lambda s: vantrel.predict(replace(s, device={})), "name inks with inks="),
        (lambda s: vantrel.report(replace(s, spectra=s.spectra[:, :30])), "spectra: the shape"),
        (lambda s: vantrel.report(replace(s, spectra=np.where(s.spectra == s["Yellow 20"][3], np.nan, s.spectra))),
         "spectra: 'Yellow 20' holds not-a-number at 430 nm"),
        (lambda s: vantrel.report(replace(s, ids=[])), "31 names, 0 ids"),
        (lambda s: vantrel.compare(s, s, tolerance=np.nan), "an argument is not finite"),
        (lambda s: vantrel.report(replace(s, spectra=None, kind="colours")), "neither spectra nor lab"),
        (lambda s: vantrel.report(replace(s, spectra=None)), "kind 'reflectance'"),
        (lambda s: s.write("sheet.cxf"), "ends in .csv or .txt, not '.cxf'"),
        (lambda s: vantrel.report(s).write("report.doc"), "not '.doc'"),
        (lambda s: vantrel.plot.differences(vantrel.compare(s, s), "cmc"), "'cmc' is not one"),
    ],
)
@pytest.mark.filterwarnings("ignore:.*hold the same spectra")
def test_what_cannot_be_said_says_why(call, reason, sheet):
    with pytest.raises(ValueError, match=reason):
        call(sheet)


def test_texts_name_the_arguments_and_leave_names_alone():
    for source in (LIBRARY / "sheets").rglob("*.cpp"):
        for text in re.findall(r'"([^"\n]*--[a-z][^"\n]*)"', source.read_text()):
            assert "--" not in in_python(text), text
    text = "my--paper.txt: a “--paper” and --paper-white; --pair auto, --force-pairs or --ink"
    assert in_python(text) == (
        'my--paper.txt: a “--paper” and --paper-white; pair="auto", force_pairs= or inks='
    )


def test_what_has_no_colour_is_not_drawn_black(sheet):
    matplotlib.use("Agg")
    missing = replace(sheet, spectra=np.where(np.arange(31)[:, None] == 2, np.nan, sheet.spectra), file="missing")
    for draw in vantrel.plot.spectra, vantrel.plot.ab_plane:
        with pytest.warns(UserWarning, match="missing: no colour, and left out: 'Magenta 20'$") as caught:
            ax = draw(missing)
        assert caught[0].filename == __file__
    assert len(ax.collections[0].get_offsets()) == 30
    assert np.isfinite(ax.get_lines()[0].get_xydata()).all()
    row = missing._repr_html_().split("<tr>")[4]
    assert "repeating-linear-gradient" in row and "rgb(0, 0, 0)" not in row
    functions = [getattr(vantrel.plot, name) for name in vantrel.plot.__all__]
    for draw, given in [(draw, given) for draw in functions for given in ("sheet.cxf", sheet.spectra)]:
        with pytest.raises(TypeError, match=f"is needed, not {type(given).__name__}"):
            draw(given)
    matplotlib.pyplot.close("all")


def test_figures_show_what_the_sheet_has(sheet, darker):
    matplotlib.use("Agg")
    white = replace(sheet, spectra=np.vstack([np.full(31, 100.0), sheet.spectra[1:]]))
    ax = vantrel.plot.spectra(white)
    lines = ax.get_lines()
    assert np.array_equal([line.get_ydata() for line in lines], white.spectra)
    assert lines[0].get_color().tolist() == [1, 1, 1]
    assert lines[0].get_xdata()[[0, -1]].tolist() == [400, 700]

    report = vantrel.report(sheet)
    _, magenta, yellow = vantrel.plot.tone_curves(report).get_lines()
    assert (magenta.get_color(), yellow.get_color()) == ("#e0007a", "#d8b800")
    assert magenta.get_label() == "CMYK_M" and yellow.get_xydata()[0].tolist() == [0, 0]
    assert magenta.get_xydata()[5] == pytest.approx([50, 68.62], abs=0.005)

    ax = vantrel.plot.ab_plane(report)
    points = ax.collections[0]
    assert np.array_equal(points.get_offsets(), [patch.lab[1:] for patch in report.patches])
    shown = matplotlib.colors.to_rgba_array([patch.rgb for patch in report.patches])
    assert np.array_equal(points.get_facecolors(), shown)
    around = matplotlib.path.Path(ax.get_lines()[0].get_xydata())
    assert around.contains_points(points.get_offsets(), radius=1e-9).all()
    along = np.diff(around.vertices, axis=0)
    assert (along[:-1, 0] * along[1:, 1] > along[:-1, 1] * along[1:, 0]).all()  # convex

    with pytest.warns(UserWarning, match="are up to ΔE00 .* from their mean|1 of 33 patches have no|the same spectrum to"):
        comparison = vantrel.compare(sheet, darker, formula=["cmc", "de2000"], tolerance=1.5)
    ax = vantrel.plot.ab_plane(comparison)
    assert len(ax.get_lines()) == len(comparison.pairs) + 3
    sides = [comparison.pairs[0].reference, comparison.pairs[0].sample]
    assert np.array_equal(ax.get_lines()[0].get_xydata(), [side.lab[1:] for side in sides])
    ax = vantrel.plot.differences(comparison)
    heights = [bar.get_height() for bar in ax.patches]
    assert heights == sorted((pair.delta_e["cmc"] for pair in comparison.pairs), reverse=True)
    assert ax.get_lines()[0].get_ydata()[0] == 1.5 and ax.get_ylabel() == "ΔE CMC(2:1)"
    assert not vantrel.plot.differences(comparison, "de2000").get_lines()
    matplotlib.pyplot.close("all")
