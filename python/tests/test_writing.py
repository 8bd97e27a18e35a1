"""Sheets that are written, and what a format loses."""

import os
import shutil
import warnings
from dataclasses import replace
from pathlib import Path

import numpy as np
import pytest

import vantrel

LIBRARY = Path(__file__).resolve().parents[1] / "library"
EXAMPLE = LIBRARY / "examples/two_ink_halftone.txt"
NOBODY = vantrel.Origin("", "", "", "", "")
OWN = {"source", "file", "warnings", "lines", "_warnings", "_read_from", "_of"}  # of each file
SHEETS = [*LIBRARY.glob("examples/*.txt"), *LIBRARY.parents[1].glob("tests/sheets/data/*.*")]


def differing(first, second):
    """The fields that tell two sheets apart, but for what is of each file."""

    def digits(value):
        return value.tolist() if isinstance(value, np.ndarray) else value

    held = [
        {name: repr(digits(value)) for name, value in vars(s).items() if name not in OWN}
        | {"device": repr({field: column.tolist() for field, column in s.device.items()})}
        | {"condition": s.source.condition}
        for s in (first, second)
    ]
    return {name for name in held[0] if held[0][name] != held[1][name]}


@pytest.mark.filterwarnings("ignore")
def test_what_is_written_reads_back(sheet, tmp_path):
    odd = replace(
        sheet,
        names=[f'{name}, "no. {i}"' for i, name in enumerate(sheet.names)],
        device={"CMYK_C": np.where(np.arange(31) == 3, np.nan, np.arange(31) / 7), "Reflex #1": np.arange(31.0)},
        spectra=sheet.spectra / 99,
        lab=np.linspace(1, 90, 93).reshape(31, 3),
        lab_illuminant=vantrel.IllumObs.F12_10DEG,
        lab_stated="F12, 10",
        source=replace(sheet.source, condition="M2"),
        origin=vantrel.Origin("me", "a sheet; of two", "2026-03-02", "reader", "job 7"),
        kind="transmission",
        collection=True,
    )
    plain = replace(odd, kind="reflectance", spectra=sheet.spectra / 7, collection=False, origin=NOBODY)
    unlabelled = replace(plain, names=[str(i + 1) for i in range(31)], named=False, has_ids=False)
    unlabelled = replace(unlabelled, ids=unlabelled.names, device={}, lab_stated="D93", lab_illuminant=None)
    held = {".txt": [odd, plain, unlabelled], ".csv": [plain, replace(unlabelled, lab=None, lab_stated="")]}
    for file in SHEETS:
        try:
            read = vantrel.read(file)
        except ValueError:
            continue
        held[".txt"].append(read)
        light = None if read.lab is None else read.lab_illuminant
        stated = light.name[:-3].replace("_", ", ") if light is not None else ""
        held[".csv"].append(replace(read, collection=False, origin=NOBODY, lab_illuminant=light, lab_stated=stated))
    assert len(held[".csv"]) > 3
    for ending, sheets in held.items():
        for written in sheets:
            with warnings.catch_warnings(record=True) as caught:
                warnings.simplefilter("always")
                written.write(tmp_path / f"sheet{ending}")
            assert not [str(w.message) for w in caught]
            assert not differing(vantrel.read(tmp_path / f"sheet{ending}"), written)
    for refused, reason in (odd, "transmittance"), (replace(sheet, spectra=sheet.spectra / 50), "scale"):
        with pytest.raises(ValueError, match=reason):
            refused.write(tmp_path / "refused.csv")


@pytest.mark.filterwarnings("ignore:.*(interchanged|green density|lab_illuminant)")
def test_what_is_not_written_is_told(sheet, tmp_path):
    library = replace(sheet, collection=True, lab=vantrel.refl_to_cielab(sheet.spectra), lab_stated="D93")
    with pytest.warns(UserWarning, match="not give the same lab_stated, origin, collection$"):
        library.write(tmp_path / "library.csv")
    library.write(tmp_path / "library.txt")
    read = vantrel.read(tmp_path / "library.txt")
    darker = replace(read, spectra=read.spectra * 0.9)
    with pytest.warns(UserWarning, match="are of spectra that were replaced, and are left out"):
        darker.write(tmp_path / "darker.txt")
    assert vantrel.read(tmp_path / "darker.txt").lab is None
    both = replace(darker, lab=vantrel.refl_to_cielab(darker.spectra))
    both.write(tmp_path / "both.txt")
    assert not differing(both, vantrel.read(tmp_path / "both.txt"))


@pytest.mark.filterwarnings("ignore:.*would agree")
def test_what_is_written_over_stays_whole(sheet, tmp_path, monkeypatch):
    for name in "measured.txt", "again.csv":
        shutil.copy(EXAMPLE, tmp_path / name)
    os.link(tmp_path / "measured.txt", tmp_path / "linked.txt")
    measured, again = (vantrel.read(tmp_path / name) for name in ("measured.txt", "again.csv"))
    for result in measured, vantrel.report(measured), vantrel.predict(measured):
        with pytest.raises(ValueError, match="linked.txt is the measurement itself"):
            result.write(tmp_path / "linked.txt")
    with pytest.raises(ValueError, match="again.csv is the measurement itself"):
        vantrel.compare(measured, replace(again, spectra=again.spectra * 0.9)).write(tmp_path / "again.csv")

    written = tmp_path / "written.txt"
    written.write_text("old")
    written.chmod(0o640)
    with monkeypatch.context() as full:
        full.setattr(os, "replace", lambda *_: (_ for _ in ()).throw(OSError(28, "No space left on device")))
        with pytest.raises(OSError, match="No space"):
            vantrel.report(measured).write(written)
    assert written.read_text() == "old"
    unreadable = replace(sheet, spectra=np.where(np.arange(31)[:, None] == 2, np.nan, sheet.spectra))
    with pytest.raises(ValueError, match=f"{sheet.names[2]!r} holds not-a-number at"):
        unreadable.write(written)
    measured.write(written)
    assert written.stat().st_mode & 0o777 == 0o640 and np.array_equal(vantrel.read(written).spectra, sheet.spectra)
    assert sorted(path.name for path in tmp_path.iterdir()) == [
        "again.csv", "linked.txt", "measured.txt", "written.txt"
    ]
