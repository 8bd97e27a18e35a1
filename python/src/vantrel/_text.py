"""A sheet as CSV and CGATS text, which read() takes back to the last digit."""

import csv
import io
import re
from typing import Any, List

import numpy as np

from ._wavelengths import NM

_FRACTIONS = 2  # what no keyword names is read as fractions up to here


def _column(values: Any) -> List[str]:
    """Numbers with all their digits; nothing for a NaN."""
    return ["" if value != value else repr(value) for value in np.asarray(values, float).tolist()]


def _number_columns(sheet: Any, spectral: str) -> Any:
    yield from ((field, _column(values)) for field, values in sheet.device.items())
    if sheet.lab is not None:
        yield from ((f"LAB_{axis}", _column(v)) for axis, v in zip("LAB", sheet.lab.T))
    if sheet.spectra is not None:
        yield from ((f"{spectral}{nm:g}", _column(v)) for nm, v in zip(NM, sheet.spectra.T))


def _one_line(text: str) -> str:
    return " ".join(text.splitlines())


def csv_text(sheet: Any) -> str:
    if sheet.kind == "transmission":
        raise ValueError("CSV does not tell transmittance from reflectance; .txt does")
    if sheet.spectra is not None and not sheet.spectra.max() > _FRACTIONS:
        raise ValueError("CSV does not name the scale of spectra, and these look like fractions; .txt does")
    columns = {"id": sheet.ids, "name": sheet.names}
    if sheet.source is not None and sheet.source.condition:
        columns["measurement_condition"] = [sheet.source.condition] * len(sheet)
    columns.update(_number_columns(sheet, "nm"))
    text = io.StringIO()
    writer = csv.writer(text, lineterminator="\n")
    writer.writerow(columns)
    writer.writerows(zip(*columns.values()))
    return text.getvalue()


def _quoted(text: str) -> str:
    return '"' + _one_line(text).replace('"', '""') + '"'


def cgats_text(sheet: Any) -> str:
    origin = sheet.origin
    keywords = {
        "ORIGINATOR": origin.originator,
        "DESCRIPTOR": origin.descriptor,
        "CREATED": origin.created,
        "INSTRUMENTATION": origin.instrument,
        "JOB_NAME": origin.job,
    }
    if sheet.spectra is not None:
        keywords["MEASUREMENT_CONDITION"] = sheet.source.condition if sheet.source else ""
        keywords["QUANTITY"] = "transmittance" if sheet.kind == "transmission" else "reflectance"
        keywords["SPECTRAL_NORM"] = "100"
    if sheet.lab_illuminant is not None:
        light, degrees = sheet.lab_illuminant.name.removesuffix("DEG").split("_")
        keywords.update(ILLUMINANT=light, OBSERVER_ANGLE=degrees)
    else:
        keywords["ILLUMINANT"] = sheet.lab_stated
    columns = {"SAMPLE_ID": [*map(_quoted, sheet.ids)], "SAMPLE_NAME": [*map(_quoted, sheet.names)]}
    for field, values in _number_columns(sheet, "SPECTRAL_NM"):
        columns[re.sub(r"[\s\"#]", "_", field)] = [value or '""' for value in values]
    lines = ["CGATS.17"]
    told = {keyword: value.replace('"', "'") for keyword, value in keywords.items() if value}
    lines += [f"{keyword}\t{_quoted(value)}" for keyword, value in told.items()]
    lines += [f"NUMBER_OF_FIELDS\t{len(columns)}", "BEGIN_DATA_FORMAT", "\t".join(columns)]
    lines += ["END_DATA_FORMAT", f"NUMBER_OF_SETS\t{len(sheet)}", "BEGIN_DATA"]
    lines += map("\t".join, zip(*columns.values()))
    return "\n".join([*lines, "END_DATA", ""])
