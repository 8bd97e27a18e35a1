"""What the documentation shows is what happens, and types say what is taken."""

import doctest
import inspect
import re
import subprocess
import sys
from pathlib import Path

import matplotlib
import numpy as np
import pytest

import vantrel
import vantrel.plot

LIBRARY = Path(__file__).resolve().parents[1] / "library"
PUBLIC = {name: getattr(vantrel, name) for name in vantrel.__all__}
DRAWING = {name: getattr(vantrel.plot, name) for name in vantrel.plot.__all__}
CLASSES = (vantrel.Sheet, vantrel.Report, vantrel.Comparison, vantrel.Predictions, vantrel.Ink, vantrel.Run)
METHODS = {
    f"{c.__name__}.{name}": getattr(c, name)
    for c in CLASSES
    for name in dir(c)
    if name[0] != "_" and (inspect.isfunction(getattr(c, name)) or isinstance(getattr(c, name), property))
}
FUNCTIONS = {name: value for name, value in PUBLIC.items() if inspect.isfunction(value)}


@pytest.fixture(scope="module")
def spectra():
    names = {"np": np, "vantrel": vantrel}
    runner = doctest.DocTestRunner(verbose=False)
    test = doctest.DocTestParser().get_doctest(vantrel.__doc__, names, "vantrel", None, 0)
    assert runner.run(test, clear_globs=False).failed == 0
    return test.globs


def test_every_example_prints_what_it_says(spectra, monkeypatch, capsys):
    monkeypatch.chdir(LIBRARY)
    matplotlib.use("Agg")
    documented = [*filter(callable, PUBLIC.values()), *DRAWING.values(), *METHODS.values()]
    documented += vars(vantrel.CIEDE2000).values()
    runner = doctest.DocTestRunner(optionflags=doctest.NORMALIZE_WHITESPACE, verbose=False)
    with_examples = 0
    for value in documented:
        text = getattr(getattr(value, "__func__", value), "__doc__", None) or ""
        test = doctest.DocTestParser().get_doctest(text, dict(spectra), text[:60], None, 0)
        with_examples += bool(test.examples)
        runner.run(test)
    assert runner.summarize(verbose=False).failed == 0, capsys.readouterr().out
    matplotlib.pyplot.close("all")
    assert with_examples >= len(FUNCTIONS) + len(DRAWING) + len(METHODS) + 4
    for name, function in (FUNCTIONS | DRAWING | METHODS).items():
        returns = not name.startswith("set") and not name.endswith(".write")
        titles = ["Returns", "Examples"] if returns else ["Examples"]
        titles += ["Parameters", "Raises"] if {*inspect.signature(function).parameters} - {"self"} else []
        assert all(f"{t}\n{'-' * len(t)}" in inspect.getdoc(function) for t in titles), name


def test_results_have_the_names_and_the_order_of_the_c_function():
    header = (LIBRARY / "include/vantrel.h").read_text()
    for function in FUNCTIONS.values():
        text = inspect.getdoc(function)
        results = re.findall(r"^(\w+) : ", text.partition("Returns\n---")[2].partition("\n\n")[0], re.M)
        if len(results) > 1:
            c_name = re.search(r"C function: (\w+)", text)[1]
            parameters = re.search(rf"\b{c_name}\(([^;]*)\);", header)[1]
            names = re.sub(r"([A-Z])", r"_\1", parameters).lower()
            outputs = [n for n in re.findall(r"\w+(?=,|$)", names) if n in results]
            assert outputs and outputs == [n for n in results if n in outputs], c_name


RIGHT = """
import dataclasses
import numpy as np
import vantrel
spectra = np.full((4, 31), 50.0)
lab = vantrel.refl_to_cielab(spectra, "D50_2DEG")
first: float = float(lab[0, 0])
gray, hue, ok = vantrel.refl_to_hue_gray(spectra, None, ["E", "T"], ok=True)
vantrel.refl_to_density(spectra, None, vantrel.Status.T_STATUS, [[1], [2]])
with vantrel.settings(hifi=([480, 560, 620],)):
    vantrel.refl_to_density(spectra, [80.0] * 31, np.array([6]), "HIFI1", ok=False)
sheet = vantrel.read("sheet.cxf", condition="M1")
names: list[str] = sheet.names
lighter = dataclasses.replace(sheet, spectra=1.1 * sheet.spectra[ok], lab=None)
accepted: list[bool] = ok.tolist()
brightness: float = round(vantrel.report(sheet).paper.brightness, 1)
print(vantrel.predict(sheet, inks={"CMYK_M": 35}).predictions[0].calibrated.rgb)
vantrel.CIEDE2000.calculate(lab, lab)
report = vantrel.report(sheet, status="T", illuminant=vantrel.IllumObs.D65_2DEG)
gains: list[float] = [value.dot_gain for curve in report.tone_values for value in curve.values]
says: str = vantrel.compare(sheet, sheet, formula=["cmc"], weights={"cmc": (1, 1)}).says
vantrel.plot.ab_plane(report).figure.savefig("ab.png")
"""
WRONG = [
    'vantrel.refl_to_density(spectra, None, "NONSENSE", 1)',
    'vantrel.refl_to_density(spectra, None, ["E", "NONSENSE"], 1)',
    'vantrel.refl_to_hue_gray(spectra, None, "SPECTRALX")',
    'vantrel.refl_to_xyz(spectra, "D51_2DEG")',
    'vantrel.refl_to_xyz(spectra, "A_2DEG", okay=True)',
    "lab.nonsense()",
    'vantrel.read("sheet.cxf", condition="M7")',
    'vantrel.report(sheet, status="NONSENSE")',
    'vantrel.compare(sheet, sheet, formula="de2001")',
    "float(report.patches[0].density)",
]


@pytest.mark.parametrize("checker", [["mypy", "--strict"], ["pyright", "--pythonpath", sys.executable]])
def test_type_checkers_take_what_is_right_and_nothing_else(checker, tmp_path):
    (tmp_path / "pyrightconfig.json").write_text('{"typeCheckingMode": "strict"}')
    script = tmp_path / "calls.py"
    script.write_text(RIGHT + "\n".join(WRONG) + "\n")
    run = subprocess.run(
        [sys.executable, "-m", *checker, "calls.py"], cwd=tmp_path, capture_output=True, text=True
    )
    said = {
        int(line.split("calls.py:")[1].split(":")[0])
        for line in run.stdout.splitlines()
        if "calls.py:" in line and "error" in line
    }
    before = RIGHT.count("\n")
    assert said == set(range(before + 1, before + 1 + len(WRONG))), run.stdout + run.stderr
