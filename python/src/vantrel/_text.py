"""A sheet as CSV and CGATS text, which read() takes back to the last digit."""

import csv
import io
import re
from typing import Any, Dict, List, Tuple

import numpy as np

from ._wavelengths import NM

# CMYK_C, CMYKOG_O, RGB_R, 6CLR_1: the names of the standard; what else is an ink is named as one.
_STANDARD = re.compile(r"(RGB|CMY|CMYK[A-Z]*|\d+CLR)_.+")
_FRACTIONS = 2  # what no keyword names is read as fractions up to here


def _column(values: Any) -> List[str]:
    """Numbers with all their digits; nothing for a NaN."""
    return ["" if value != value else repr(value) for value in np.asarray(values, float).tolist()]


def _number_columns(sheet: Any, lab: Any, spectral: str, light: str = "") -> Any:
    for field, values in sheet.device.items():
        yield field if _STANDARD.fullmatch(field) else f"ink:{field}", _column(values)
    if lab is not None:
        yield from ((f"LAB_{axis}{light}", _column(v)) for axis, v in zip("LAB", lab.T))
    if sheet.spectra is not None:
        yield from ((f"{spectral}{nm:g}", _column(v)) for nm, v in zip(NM, sheet.spectra.T))


def _light(sheet: Any) -> Tuple[str, str]:
    """Illuminant and observer of the L*a*b*, in the words of the file where these still hold."""
    if sheet.lab_illuminant is None:
        return sheet.lab_stated, ""
    light, degrees = sheet.lab_illuminant.name.removesuffix("DEG").split("_")
    stated, comma, observer = sheet.lab_stated.rpartition(", ")
    words = re.findall(r"[A-Za-z0-9]+", sheet.lab_stated)
    if light in words and degrees in words and comma:
        return stated, observer
    return light, "" if sheet.lab_stated == light and degrees == "2" else degrees


def _labels(sheet: Any) -> Dict[str, List[str]]:
    """Ids and names, but for those that are places."""
    places = [str(i) for i in range(1, len(sheet) + 1)]
    labels = {}
    if sheet.has_ids or sheet.ids != places:
        labels["id"] = sheet.ids
    if sheet.named or sheet.names != places:
        labels["name"] = sheet.names
    return labels


def _one_line(text: str) -> str:
    return " ".join(text.splitlines())


def csv_text(sheet: Any, lab: Any) -> str:
    if sheet.kind == "transmission":
        raise ValueError("CSV does not tell transmittance from reflectance; .txt does")
    if sheet.spectra is not None and not sheet.spectra.max() > _FRACTIONS:
        raise ValueError("CSV does not name the scale of spectra, and these look like fractions; .txt does")
    columns = _labels(sheet)
    if sheet.source.condition:
        columns["measurement_condition"] = [sheet.source.condition] * len(sheet)
    light = sheet.lab_illuminant
    light = "" if light is None else "_" + light.name.removesuffix("DEG")
    columns.update(_number_columns(sheet, lab, "nm", light))
    text = io.StringIO()
    writer = csv.writer(text, lineterminator="\n")
    writer.writerow(columns)
    writer.writerows(zip(*columns.values()))
    return text.getvalue()


def _quoted(text: str) -> str:
    return '"' + _one_line(text).replace('"', '""') + '"'


def cgats_text(sheet: Any, lab: Any) -> str:
    origin = sheet.origin
    keywords = {
        "ORIGINATOR": origin.originator,
        "DESCRIPTOR": origin.descriptor,
        "CREATED": origin.created,
        "INSTRUMENTATION": origin.instrument,
        "JOB_NAME": origin.job,
        "MEASUREMENT_CONDITION": sheet.source.condition,
    }
    if sheet.spectra is not None:
        keywords["QUANTITY"] = "transmittance" if sheet.kind == "transmission" else "reflectance"
        keywords["SPECTRAL_NORM"] = "100"
    keywords["ILLUMINANT"], keywords["OBSERVER_ANGLE"] = _light(sheet)
    if sheet.collection:
        keywords["COLLECTION"] = "yes"
    labels = _labels(sheet)
    columns = {f"SAMPLE_{label.upper()}": [*map(_quoted, texts)] for label, texts in labels.items()}
    for field, values in _number_columns(sheet, lab, "SPECTRAL_NM"):
        heading = field if re.fullmatch(r"[^\s\"#]+", field) else _quoted(field)
        columns[heading] = [value or '""' for value in values]
    lines = ["CGATS.17"]
    told = {keyword: value.replace('"', "'") for keyword, value in keywords.items() if value}
    lines += [f"{keyword}\t{_quoted(value)}" for keyword, value in told.items()]
    lines += [f"NUMBER_OF_FIELDS\t{len(columns)}", "BEGIN_DATA_FORMAT", "\t".join(columns)]
    lines += ["END_DATA_FORMAT", f"NUMBER_OF_SETS\t{len(sheet)}", "BEGIN_DATA"]
    lines += map("\t".join, zip(*columns.values()))
    return "\n".join([*lines, "END_DATA", ""])
