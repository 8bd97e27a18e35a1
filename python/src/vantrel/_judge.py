"""What the program's commands say of sheets: report, compare, predict, ink, run."""

import functools
import json
import os
import warnings
from dataclasses import replace
from typing import Any, Dict, List, Literal, Mapping, Optional, Sequence, Tuple, Union

import numpy as np

from ._arguments import INDICES
from ._dask import settings_in_force
from ._enums import IllumObs, Status
from ._extension import extension
from ._fields import fields_of
from ._ink import Ink
from ._predictions import Predictions
from ._results import Comparison, Report
from ._run import Run
from ._sheet import Sheet, in_python, read

Illuminant = Union[
    IllumObs,
    Literal[
        "A_2DEG", "A_10DEG", "C_2DEG", "C_10DEG", "D50_2DEG", "D50_10DEG", "D65_2DEG",
        "D65_10DEG", "F2_2DEG", "F2_10DEG", "F7_2DEG", "F7_10DEG", "F11_2DEG", "F11_10DEG",
        "F12_2DEG", "F12_10DEG", "D75_2DEG", "D75_10DEG"
    ],
]
StatusName = Union[
    Status,
    Literal[
        "A", "E", "I", "T", "SPECTRAL", "SPECTRALX", "HIFI", "HEXACHROME", "CCR1", "CCR2",
        "A_STATUS", "E_STATUS", "I_STATUS", "T_STATUS", "SPECTRAL_STATUS", "SPECTRALX_STATUS",
        "HIFI_STATUS", "HEXACHROME_STATUS", "CCR1_STATUS", "CCR2_STATUS"
    ],
]
Formula = Literal["de2000", "cmc", "de94", "de76"]
Inks = Union[Mapping[str, float], Sequence[Tuple[str, float]], None]
Path = Union[str, "os.PathLike[str]"]


def _plain(value: Any) -> Any:
    """What NumPy holds, as JSON does."""
    if isinstance(value, (np.generic, np.ndarray)):
        return value.tolist()
    raise TypeError(f"{value!r} is no number, text or list of these")


def _called(command: str) -> str:
    return "report" if command == "advice" else command


def _answer(
    command: str, sheets: Sequence[Dict[str, Any]], options: Dict[str, Any], form: str
) -> str:
    try:
        wishes = json.dumps({**options, "format": form}, default=_plain, allow_nan=False)
    except ValueError:
        raise ValueError(f"{_called(command)}: an argument is not finite") from None
    try:
        text: str = extension().answer(command, sheets, wishes)
    except ValueError as error:
        raise ValueError(in_python(str(error))) from None
    return text


def _result(kind: Any, command: str, sheets: Sequence[Sheet], options: Dict[str, Any]) -> Any:
    names = {key: value for key, value in options.items() if value is not None}
    given = [fields_of(sheet) for sheet in sheets]
    read_from = [sheet._read_from for sheet in sheets if sheet._read_from]
    result = kind._of(functools.partial(_answer, command, given, names), read_from)
    if settings_in_force():
        warnings.warn(
            f"{_called(command)}() takes the constants of the program, not those that are set: these hold for "
            "functions over arrays",
            stacklevel=3,
        )
    told = {f"{s.file}:{line}" for s in sheets for line in s._warnings}
    not_judged = [f"not judged: {reason}" for reason in getattr(result, "unread", ())]
    for line in [*result.warnings, *not_judged]:
        if line not in told:  # by read()
            warnings.warn(in_python(line), stacklevel=3)
    return result


def _name(kind: str, value: Any, argument: str) -> Optional[str]:
    """The full name of an illuminant or a status, given by name, member or number."""
    if value is None:
        return None
    index = INDICES[kind]
    number = index.number(value, argument)
    index.check(number, argument)
    name: str = index.members(number).name
    return name


def _inks(order: Optional[Sequence[str]]) -> Optional[List[str]]:
    if isinstance(order, str):
        raise TypeError("order: a list of inks is needed")
    return None if order is None else [*order]


def _usual(illuminant: Any, status: Any, paper: Optional[str]) -> Dict[str, Any]:
    return {
        "illuminant": _name("Illuminant", illuminant, "illuminant"),
        "status": _name("StatusName", status, "status"),
        "paper": paper,
    }


def report(
    sheet: Sheet,
    *,
    illuminant: Optional[Illuminant] = None,
    status: StatusName = "E",
    paper: Optional[str] = None,
    n_factor: float = 1,
    order: Optional[Sequence[str]] = None,
    second_paper: Optional[str] = None,
    second_sheet: Optional[Sheet] = None,
    second_illuminant: Optional[Illuminant] = None,
    advice: Optional[Sheet] = None,
) -> Report:
    """The colour, density and print attributes of every patch of a sheet, as `vantrel report`.

    Parameters
    ----------
    sheet : Sheet
    illuminant : IllumObs or its name, optional
        What the file states by default, or else D50 and 2 degrees.
    status : Status or its name, default "E"
    paper : str, optional
        The paper's patch by name or id, or "none" for absolute densities; by default the mean of the
        patches without ink, or else the lightest.
    n_factor : float, default 1
        The Yule-Nielsen factor of the dot areas.
    order : list of str, optional
        The inks in the order of printing, by device field or solid.
    second_paper : str, optional
        A paper to compare with, by name or id, of `second_sheet` where there is one; "" is its paper.
    second_sheet : Sheet, optional
    second_illuminant : IllumObs or its name, optional
        Of that metamerism, beside `illuminant`.
    advice : Sheet, optional
        Aims: of every solid, the density change that brings it nearest to its own.

    Returns
    -------
    report : Report
        What it finds odd becomes warnings.

    Raises
    ------
    ValueError
        Where the sheet does not hold what is asked for.

    Examples
    --------
    >>> report = vantrel.report(vantrel.read("examples/two_ink_halftone.txt"))
    >>> [(curve.ink, round(curve.values[4].dot_gain, 2)) for curve in report.tone_values]
    [('CMYK_M', 18.62), ('CMYK_Y', 19.13)]
    """
    options = {
        **_usual(illuminant, status, paper),
        "n_factor": n_factor,
        "order": _inks(order),
        "second_paper": second_paper,
        "second_illuminant": _name("Illuminant", second_illuminant, "second_illuminant"),
    }
    sheets = [s for s in (sheet, advice, second_sheet) if s is not None]
    result: Report = _result(Report, "report" if advice is None else "advice", sheets, options)
    return result


def _tolerances(file: Optional[Path]) -> Dict[str, Any]:
    if file is None:
        return {}
    with open(file, encoding="utf-8") as opened:
        return {"tolerances": opened.read(), "tolerances_name": os.fspath(file)}


def compare(
    aims: Sheet,
    sheet: Sheet,
    *,
    illuminant: Optional[Illuminant] = None,
    status: StatusName = "E",
    paper: Optional[str] = None,
    pair: Literal["auto", "name", "id", "device", "order"] = "auto",
    force_pairs: bool = False,
    repeats: Literal["mean", "each"] = "mean",
    allow_missing: bool = False,
    formula: Union[Formula, Sequence[Formula]] = "de2000",
    weights: Optional[Mapping[Formula, Tuple[float, float]]] = None,
    second_illuminant: Optional[Illuminant] = None,
    words: Literal["ab", "hue"] = "ab",
    tolerance: Optional[float] = None,
    tolerances: Optional[Path] = None,
    substrate_corrected: bool = False,
    advice: bool = False,
) -> Comparison:
    """How a sheet differs from its aims, patch by patch, as `vantrel compare`.

    Parameters
    ----------
    aims, sheet : Sheet
    illuminant : IllumObs or its name, optional
        What the files state by default, or else D50 and 2 degrees.
    status : Status or its name, default "E"
    paper : str, optional
        The paper's patch of both by name or id, or "none".
    pair : {"auto", "name", "id", "device", "order"}
        What patches pair by.
    force_pairs : bool
        Whether pairs are taken whose device values disagree.
    repeats : {"mean", "each"}
        Whether the mean of several measurements of a patch is judged, or each of them.
    allow_missing : bool
        Whether patches and aims without a partner leave the verdict complete.
    formula : {"de2000", "cmc", "de94", "de76"} or a list of them
        The first decides on worst and tolerance.
    weights : dict, optional
        By formula the factors of lightness and chroma, {"cmc": (1, 1)} for instance.
    second_illuminant : IllumObs or its name, optional
        Of the metamerism, beside `illuminant`.
    words : {"ab", "hue"}
        The difference in words along a* and b*, or as chroma and hue.
    tolerance : float, optional
        The largest difference that is accepted.
    tolerances : str or path, optional
        A TOML file of limits by group of patches.
    substrate_corrected : bool
        Whether the sheet is judged too by aims that are moved to its paper (ISO 13655).
    advice : bool
        Whether the comparison says which change of its density brings a solid nearest to its aim.

    Returns
    -------
    comparison : Comparison
        What it finds odd becomes warnings.

    Raises
    ------
    ValueError
        Where the sheets do not pair, or do not hold what is asked for.
    OSError
        Where there is no such file of tolerances.

    Examples
    --------
    >>> import dataclasses
    >>> aims = vantrel.read("examples/two_ink_halftone.txt")
    >>> sheet = dataclasses.replace(aims, spectra=aims.spectra * np.linspace(0.9, 1, 31), file="sheet")
    >>> comparison = vantrel.compare(aims, sheet, formula=["de2000", "cmc"], tolerance=2)
    >>> comparison.verdict, round(comparison.statistics["cmc"].max, 2)
    ('failed', 3.49)
    """
    options = {
        **_usual(illuminant, status, paper),
        "pair": pair,
        "force_pairs": force_pairs,
        "repeats": repeats,
        "allow_missing": allow_missing,
        "formula": [formula] if isinstance(formula, str) else [*formula],
        "weights": None if weights is None else {name: [*two] for name, two in weights.items()},
        "second_illuminant": _name("Illuminant", second_illuminant, "second_illuminant"),
        "words": words,
        "tolerance": tolerance,
        **_tolerances(tolerances),
        "substrate_corrected": substrate_corrected,
        "advice": advice or None,
    }
    conditions = [s.source.condition for s in (aims, sheet)]
    sheets = [aims, sheet]
    if aims.file == sheet.file and conditions[0] != conditions[1]:
        sheets = [replace(s, file=f"{s.file} ({c})") for s, c in zip(sheets, conditions)]
    result: Comparison = _result(Comparison, "compare", sheets, options)
    return result


def predict(
    sheet: Sheet,
    *,
    inks: Inks = None,
    illuminant: Optional[Illuminant] = None,
    status: StatusName = "E",
    paper: Optional[str] = None,
    order: Optional[Sequence[str]] = None,
) -> Predictions:
    """The colour that inks will have as tints and over one another, as `vantrel predict`.

    Parameters
    ----------
    sheet : Sheet
    inks : dict or list of (str, int), optional
        Inks in the order of printing, each by its solid's patch, name or id, or its device field,
        and its percentage; every measured overprint by default.
    illuminant, status, paper, order
        As of report().

    Returns
    -------
    predictions : Predictions
        What is odd becomes warnings.

    Raises
    ------
    ValueError
        Where the sheet does not hold what is asked for.

    Examples
    --------
    >>> sheet = vantrel.read("examples/two_ink_halftone.txt")
    >>> [prediction] = vantrel.predict(sheet, inks={"CMYK_M": 40, "CMYK_Y": 70}).predictions
    >>> prediction.calibrated.rgb, round(prediction.halftone.density, 2)
    ('#e2c282', 0.37)
    """
    options = {**_usual(illuminant, status, paper), "order": _inks(order)}
    if inks is not None:
        pairs: List[Tuple[str, float]] = [*(inks.items() if isinstance(inks, Mapping) else inks)]
        for name, percent in pairs:
            if isinstance(percent, (float, np.floating)) and not np.isfinite(percent):
                raise ValueError(f"inks: of {name!r} a whole percentage is needed, not {percent}")
        options["ink"] = [[name, percent] for name, percent in pairs]
    result: Predictions = _result(Predictions, "predict", [sheet], options)
    return result


def ink(
    sheet: Sheet,
    patch: str,
    *,
    against: Optional[str] = None,
    illuminant: Optional[Illuminant] = None,
    status: StatusName = "E",
    paper: Optional[str] = None,
    order: Optional[Sequence[str]] = None,
) -> Ink:
    """One patch under every status and illuminant, alone or beside another, as `vantrel ink`.

    Parameters
    ----------
    sheet : Sheet
    patch : str
        Its name or id.
    against : str, optional
        The name or id of another patch.
    illuminant, status, paper, order
        As of report().

    Returns
    -------
    ink : Ink
        What is odd becomes warnings.

    Raises
    ------
    ValueError
        Where the sheet does not hold what is asked for.

    Examples
    --------
    >>> sheet = vantrel.read("examples/two_ink_halftone.txt")
    >>> ink = vantrel.ink(sheet, "Magenta 100", against="Magenta 90")
    >>> round(ink.statuses[3].densities["Green"], 3), round(ink.against.de00, 2)
    (0.44, 1.54)
    """
    options = {
        **_usual(illuminant, status, paper),
        "patch": patch,
        "against": against,
        "order": _inks(order),
    }
    result: Ink = _result(Ink, "ink", [sheet], options)
    return result


def run(
    sheets: Sequence[Union[Sheet, Path]],
    aims: Sheet,
    *,
    tolerances: Optional[Path] = None,
    illuminant: Optional[Illuminant] = None,
    status: StatusName = "E",
    paper: Optional[str] = None,
    order: Optional[Sequence[str]] = None,
) -> Run:
    """What left its limits in a press run, what drifts, what stands apart, as `vantrel run`.

    Parameters
    ----------
    sheets : list of Sheet or of paths
        In the order of the run, unless all have a date. A file that cannot be read is named in
        `unread`, and the others are judged.
    aims : Sheet
    tolerances : str or path, optional
        A TOML file of limits by group of patches.
    illuminant, status, paper, order
        As of report().

    Returns
    -------
    run : Run
        What it finds odd becomes warnings.

    Raises
    ------
    ValueError
        Where no sheet can be judged.

    Examples
    --------
    >>> from dataclasses import replace
    >>> aims = vantrel.read("examples/two_ink_halftone.txt")
    >>> dates = [replace(aims.origin, created=f"2026-03-{day}") for day in range(11, 16)]
    >>> darker = [aims.spectra * np.linspace(1 - i / 99, 1, 31) for i in range(1, 6)]
    >>> sheets = [replace(aims, spectra=s, origin=date) for s, date in zip(darker, dates)]
    >>> run = vantrel.run(sheets, aims)
    >>> print(run.series[-1].title, np.round(run.series[-1].values, 2))
    largest ΔE00 [0.27 0.53 0.79 1.06 1.32]
    """
    if isinstance(sheets, (str, os.PathLike, Sheet)):
        raise TypeError("sheets: a list of them is needed")
    taken, unread = [], []
    for sheet in sheets:
        try:
            taken.append(sheet if isinstance(sheet, Sheet) else read(sheet))
        except ValueError as error:
            unread.append(str(error))
        except OSError as error:
            unread.append(f"{sheet}: {error.strerror}")
    options = {
        **_usual(illuminant, status, paper),
        "order": _inks(order),
        **_tolerances(tolerances),
        "unread": unread,
    }
    result: Run = _result(Run, "run", [aims, *taken], options)
    return result
