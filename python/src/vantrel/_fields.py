"""The numbers of a sheet as the program's commands take them, checked and doubted."""

from dataclasses import asdict
from typing import Any, Dict, List, Sequence, Tuple

import numpy as np

from ._arguments import FRACTION
from ._sheet import Sheet
from ._wavelengths import NM

_BRIGHTEST = 200  # percent; papers with much brightener come to 150
_LARGEST = 1e6  # of reflectances in percent and of colours, as the readers take them


def _doubles(
    values: Any,
    shape: Tuple[int, ...],
    name: str,
    patches: Sequence[str],
    columns: Sequence[str] = (),
    missing: bool = False,
) -> Any:
    """Numbers of patches; what is none of these is told with its patch and column."""
    array = np.array(values, dtype=np.float64, order="C")
    if array.shape != shape:
        raise ValueError(f"{name}: the shape {shape} is needed, not {array.shape}")
    wrong = np.argwhere(~((np.abs(array) <= _LARGEST) | (missing & np.isnan(array))))
    if len(wrong):
        row, *column = wrong[0]
        value = array[tuple(wrong[0])]
        what = "not-a-number" if np.isnan(value) else f"{value:g}"
        at = f" at {columns[column[0]]}" if column else ""
        raise ValueError(
            f"{name}: {patches[row]!r} holds {what}{at}; numbers of at most {_LARGEST:g} are needed"
        )
    return array


def _scale_doubts(sheet: Sheet) -> List[str]:
    """What read() would say of the scale, of spectra that were put into a sheet."""
    known = any("--scale" in warning for warning in sheet._warnings)
    if sheet.spectra is None or sheet.kind != "reflectance" or known:
        return []
    largest = np.max(sheet.spectra, initial=0)
    if largest <= FRACTION:
        return [f" all reflectances are at most {FRACTION} %: multiply fractions by 100"]
    return [f" the largest reflectance is {largest:.4g} %"] if largest > _BRIGHTEST else []


def fields_of(sheet: Sheet) -> Dict[str, Any]:
    """A sheet as the extension takes it, in copies of its numbers."""
    if not isinstance(sheet, Sheet):
        raise TypeError(f"a Sheet is needed, as vantrel.read() gives, not {type(sheet).__name__}")
    patches = len(sheet)
    if not patches or len(sheet.ids) != patches:
        raise ValueError(f"sheet: {patches} names, {len(sheet.ids)} ids; a patch at least has both")
    if (sheet.spectra is None) != (sheet.kind == "colours"):
        raise ValueError(f"sheet: a sheet of kind {sheet.kind!r} with spectra {sheet.spectra}")
    if sheet.spectra is None and sheet.lab is None:
        raise ValueError("sheet: neither spectra nor lab")
    lines = sheet.lines if len(sheet.lines) == patches else np.zeros(patches)
    taken: Dict[str, Any] = {name: getattr(sheet, name) for name in vars(sheet)}
    taken["warnings"] = [*sheet._warnings, *_scale_doubts(sheet)]
    taken["changed"] = sheet._digests() != sheet._of
    taken["lines"] = _doubles(lines, (patches,), "lines", sheet.names)
    taken["device"] = {
        field: _doubles(column, (patches,), field, sheet.names, missing=True)
        for field, column in sheet.device.items()
    }
    if sheet.spectra is not None:
        taken["spectra"] = _doubles(
            sheet.spectra, (patches, 31), "spectra", sheet.names, [f"{nm:g} nm" for nm in NM]
        )
    taken["lab"] = sheet._own_lab()
    if taken["lab"] is not None:
        taken["lab"] = _doubles(
            taken["lab"], (patches, 3), "lab", sheet.names, ("L*", "a*", "b*"), sheet.kind != "colours"
        )
    taken["origin"] = asdict(sheet.origin)
    taken["source"] = asdict(sheet.source)
    return taken
