"""Measurement files: CGATS text, CSV and CxF, from the file to arrays."""

import html
import os
import re
import warnings
import zlib
from dataclasses import dataclass, field, replace
from typing import Any, Dict, List, Literal, Optional, Sequence, Tuple, Union

import numpy as np
from numpy.typing import NDArray

from ._colour import refl_to_cielab
from ._enums import IllumObs
from ._extension import extension
from ._file import write_text
from ._result import MaybeNone
from ._text import cgats_text, csv_text
from ._wavelengths import NM

Scale = Literal["automatic", "percent", "fraction"]
Condition = Optional[Literal["M0", "M1", "M2", "M3"]]
_SCALES = {"automatic": 0, "percent": 1, "fraction": 2}
_STALE = "its L*a*b* are of spectra that were replaced, and are left out"
_WRITTEN = (
    "spectra", "names", "ids", "device", "lab", "lab_illuminant", "lab_stated", "kind", "condition",
    "origin", "collection",
)
_HATCHED = "repeating-linear-gradient(45deg,#fff 0 4px,#bbb 4px 5px)"  # for a colour that is none
_MOST_SHOWN = 200  # patches in a notebook

# What the program's texts name after two hyphens; those that a patch or a file has in its name stay.
_OPTIONS = {
    "format html: this program": "to_html(): this package",
    "format json": "to_dict()",
    "ink": "inks=",
    "pair auto": 'pair="auto"',
    **{
        option: option.replace("-", "_") + "="
        for option in (
            "advice", "condition", "force-pairs", "illuminant", "pair", "paper", "scale",
            "second-paper", "substrate-corrected",
        )
    },
}
_OPTION = re.compile(rf"(?<!\S)--({'|'.join(_OPTIONS)})(?![\w-])")


@dataclass(frozen=True)
class Source:
    """What the spectra looked like in the file.

    `averaged`: several of its values make a band. `interpolated`: they are 20 nm apart. `held`: the
    last value stands for bands outside their range. `scaled`: they are not in percent there, and
    `scale_by` says what told so: a keyword, the kind of file, "values" or the option "--scale".
    `condition`: M0 to M3 (ISO 13655), "" where the file does not say.
    """

    first_nm: float
    last_nm: float
    step_nm: float
    bands: int
    averaged: bool
    interpolated: bool
    held: bool
    scaled: bool
    scale_by: str
    condition: str


@dataclass(frozen=True)
class Origin:
    """Who measured what and when, in the words of the file; "" where it does not say."""

    originator: str
    descriptor: str
    created: str
    instrument: str
    job: str


@dataclass(frozen=True, eq=False, repr=False)
class Sheet:
    """The patches of a measurement file.

    Attributes
    ----------
    spectra : array (n, 31) or None
        Reflectance (transmittance) in percent at 400, 410, ... 700 nm; None where the file holds
        colours alone.
    names, ids : list of str
        Of the patches.
    device : dict of str to array (n,)
        Dot areas and the like by field, "CMYK_M" for instance; NaN where a patch has none.
    lab : array (n, 3) or None
        L*a*b* that the file itself holds.
    lab_illuminant : IllumObs or None
        What the file states for its colours; report() and its kin take it by default.
    lab_stated : str
        The same in the words of the file, which may be none of IllumObs.
    kind : str
        "reflectance", "transmission" or "colours".
    source : Source
        What the spectra looked like in the file; of colours alone, their measurement condition.
    origin : Origin
        Who measured what and when.
    collection : bool
        Of colours, a spot library for instance: no paper is among them.
    file : str
        The name of the file, "" for bytes.
    warnings : list of str
        What the reader found odd.
    named, has_ids : bool
        Whether names or ids, and whether ids, are the file's own; places stand for them otherwise.
    lines : list of int
        Where the patches stand in the file.
    """

    spectra: Union[NDArray[np.floating[Any]], MaybeNone]
    names: List[str]
    ids: List[str]
    device: Dict[str, NDArray[np.floating[Any]]]
    lab: Union[NDArray[np.floating[Any]], MaybeNone]
    lab_illuminant: Optional[IllumObs]
    lab_stated: str
    kind: str
    source: Source
    origin: Origin
    collection: bool = False
    file: str = ""
    warnings: List[str] = field(default_factory=list)
    named: bool = True
    has_ids: bool = True
    lines: Sequence[int] = ()
    _warnings: Sequence[str] = ()  # in the words of the program
    _read_from: str = ""
    _of: Tuple[int, ...] = ()  # digests of the numbers of the file: spectra, L*a*b*, device values

    def __repr__(self) -> str:
        return f"<Sheet of {self.file}: {len(self)} patches, {self.kind}>"

    def __len__(self) -> int:
        return len(self.names)

    def index(self, name: str) -> int:
        """The place of the first patch of this name, or else of this id.

        Parameters
        ----------
        name : str

        Returns
        -------
        place : int

        Raises
        ------
        KeyError
            Where no patch has this name or id.

        Examples
        --------
        >>> vantrel.read("examples/two_ink_halftone.txt").index("Magenta 20")
        2
        """
        for labels in self.names, self.ids:
            if name in labels:
                return labels.index(name)
        raise KeyError(f"no patch {name!r}; the patches are {', '.join(self.names[:8])} ...")

    def __getitem__(self, name: str) -> NDArray[np.float64]:
        """The spectrum of a patch, by its name or id."""
        if self.spectra is None:
            raise KeyError(f"{name!r} has no spectrum: the file holds colours alone")
        spectrum: NDArray[np.float64] = self.spectra[self.index(name)]
        return spectrum

    def to_pandas(self) -> Any:
        """The patches as a table.

        Returns
        -------
        table : pandas.DataFrame
            Columns id, name, device values, the spectrum by wavelength, L*a*b* of the file.

        Examples
        --------
        >>> vantrel.read("examples/two_ink_halftone.txt").to_pandas().shape
        (31, 35)
        """
        import pandas as pd

        columns = {"id": self.ids, "name": self.names, **self.device}
        if self.spectra is not None:
            columns.update(zip(NM.astype(int).tolist(), self.spectra.T))
        lab = self._own_lab()
        if lab is not None:
            columns.update(zip(("L", "a", "b"), lab.T))
        elif self.lab is not None:
            warnings.warn(f"{self.file}: {_STALE}", stacklevel=2)
        return pd.DataFrame(columns)

    def to_xarray(self) -> Any:
        """The spectra as a labelled array.

        Returns
        -------
        refl : xarray.DataArray
            Over patch and nm, with names, ids and device values as coordinates.

        Raises
        ------
        ValueError
            Where the file holds colours alone.

        Examples
        --------
        >>> vantrel.read("examples/two_ink_halftone.txt").to_xarray().dims
        ('patch', 'nm')
        """
        import xarray as xr

        if self.spectra is None:
            raise ValueError("the file holds colours alone, no spectra")
        by_patch = {"name": self.names, "id": self.ids, **self.device}
        coordinates = {label: ("patch", values) for label, values in by_patch.items()}
        return xr.DataArray(self.spectra, {**coordinates, "nm": NM}, ("patch", "nm"), name="refl")

    def write(self, file: Union[str, "os.PathLike[str]"]) -> None:
        """Writes CSV to a name that ends in .csv, CGATS text (ISO 28178) to one in .txt.

        read() gives the same sheet back, to the last digit, as spectra from 400 to 700 nm. What the
        format does not hold is warned of: CSV has no room for the origin, nor to say that the sheet is
        a collection. L*a*b* of the file are left out where the spectra were changed and they were not.
        The file is replaced as a whole.

        Parameters
        ----------
        file : str or path

        Raises
        ------
        ValueError
            Where the name ends otherwise, a spectrum holds what is no number, or the file is the one
            that the sheet was read from.
        OSError
            Where the file cannot be written; what was there stays.

        Examples
        --------
        >>> vantrel.read("examples/two_ink_halftone.txt").write("sheet.doc")
        Traceback (most recent call last):
        ValueError: file: its name ends in .csv or .txt, not '.doc'
        """
        ending = os.path.splitext(os.fspath(file))[1].lower()
        if ending not in (".csv", ".txt"):
            raise ValueError(f"file: its name ends in .csv or .txt, not {ending!r}")
        if self.spectra is not None and not np.all(np.isfinite(self.spectra)):
            row, band = np.argwhere(~np.isfinite(self.spectra))[0]
            value = self.spectra[row, band]
            what = "not-a-number" if np.isnan(value) else f"{value:g}"
            raise ValueError(f"spectra: {self.names[row]!r} holds {what} at {NM[band]:g} nm")
        lab = self._own_lab()
        text = csv_text(self, lab) if ending == ".csv" else cgats_text(self, lab)
        lost = self._lost(text, lab)
        write_text(file, text, [self._read_from] if self._read_from else [])
        if self.lab is not None and lab is None:
            warnings.warn(f"{self.file}: {_STALE}", stacklevel=2)
        if lost:
            warnings.warn(
                f"{os.fspath(file)}: read() will not give the same {', '.join(lost)}", stacklevel=2
            )

    def _own_lab(self) -> Optional[NDArray[np.float64]]:
        """The L*a*b* of the file, unless they belong to spectra that are no longer here."""
        if self.spectra is None or not self._of or self.lab is None:
            return self.lab
        stale = _digest(self.spectra) != self._of[0] and _digest(self.lab) == self._of[1]
        return None if stale else self.lab

    def _digests(self) -> Tuple[int, ...]:
        return tuple(map(_digest, (self.spectra, self.lab, *self.device.values())))

    def _lost(self, text: str, lab: Any) -> List[str]:
        """The fields that a file with this text does not give back."""
        try:
            back = _read_sheet(text.encode(), "automatic", None)
        except ValueError as error:
            raise ValueError(f"what would be written cannot be read: {error}") from None
        wanted = {**vars(self), "lab": lab, "condition": self.source.condition}
        found = {**vars(back), "condition": back.source.condition}
        if back.lab_illuminant is not None:
            wanted["lab_stated"] = back.lab_stated  # its wording is free
        return [name for name in _WRITTEN if not _same(wanted[name], found[name])]

    def _colours(self) -> Any:
        """(L*a*b*, what it is for) of the patches that a notebook shows."""
        if self.spectra is not None:
            return refl_to_cielab(self.spectra[:_MOST_SHOWN]), "D50_2DEG"
        stated = self.lab_illuminant.name if self.lab_illuminant is not None else ""
        return np.asarray(self.lab)[:_MOST_SHOWN], stated or self.lab_stated

    def _repr_html_(self) -> str:
        lab, light = self._colours()
        swatches = srgb(lab)
        head = ["", "id", "name", *self.device, "L*", "a*", "b*"]
        rows = []
        for i, colour in enumerate(lab):
            rgb = f"rgb{tuple(swatches[i].tolist())}" if np.isfinite(colour).all() else _HATCHED
            values = [f"{column[i]:g}" for column in self.device.values()]
            cells = [self.ids[i], self.names[i], *values, *(f"{c:.2f}" for c in colour)]
            rows.append(
                f'<tr><td style="background:{rgb};min-width:3em"></td>'
                + "".join(f"<td>{html.escape(cell)}</td>" for cell in cells)
                + "</tr>"
            )
        left_out = len(self) - len(rows)
        return (
            f"<p>{html.escape(self.file)}: {len(self)} patches, L*a*b* for {html.escape(light)}</p>"
            + "<table><tr>"
            + "".join(f"<th>{html.escape(title)}</th>" for title in head)
            + f"</tr>{''.join(rows)}</table>"
            + (f"<p>{left_out} more patches are not shown</p>" if left_out else "")
        )


def _digest(array: Any) -> int:
    return 0 if array is None else zlib.crc32(np.ascontiguousarray(array, dtype=np.float64).data)


def _same(first: Any, second: Any) -> bool:
    if isinstance(first, dict):
        return list(first) == list(second) and all(_same(first[k], second[k]) for k in first)
    if isinstance(first, np.ndarray) and second is not None:
        return np.array_equal(first, second, equal_nan=True)
    return bool(first is second or first == second)


def srgb(lab: Any) -> NDArray[np.uint8]:
    """Red, green and blue of a display, 0 to 255, for L*a*b* (..., 3); its white is 255, 255, 255."""
    lab = np.ascontiguousarray(lab, dtype=np.float64)
    return np.frombuffer(extension().srgb(lab), dtype=np.uint8).reshape(lab.shape)


def in_python(text: str) -> str:
    """Text of the program with its options as arguments: "--force-pairs" as "force_pairs="."""
    return re.sub(_OPTION, lambda found: _OPTIONS[found[1]], text)


def _array(buffer: Any, *shape: int) -> NDArray[np.float64]:
    return np.frombuffer(buffer, dtype=np.float64).reshape(shape)


def _read_sheet(content: bytes, scale: str, condition: Optional[str]) -> Sheet:
    """Raises ValueError in the words of the program."""
    found = extension().read(content, _SCALES[scale], condition or "")
    illuminant = found.get("lab_illuminant")
    spectra = _array(found["spectra"], -1, 31) if "spectra" in found else None
    lab = _array(found["lab"], -1, 3) if "lab" in found else None
    sheet = Sheet(
        spectra=spectra,
        names=found["names"],
        ids=found["ids"],
        device={name: _array(column, -1) for name, column in found["device"].items()},
        lab=lab,
        lab_illuminant=None if illuminant is None else IllumObs(illuminant),
        lab_stated=found["lab_stated"],
        **{name: found[name] for name in ("kind", "collection", "named", "has_ids", "lines")},
        source=Source(**found["source"]),
        origin=Origin(**found["origin"]),
        warnings=[in_python(line.strip()) for line in found["warnings"]],
        _warnings=found["warnings"],
    )
    return replace(sheet, _of=sheet._digests())


def _sheet(
    content: bytes, file: str, scale: str, condition: Optional[str], level: int
) -> Sheet:
    extension()
    if scale not in _SCALES:
        raise ValueError(f"scale: {scale!r} is not one of {', '.join(_SCALES)}")
    if condition not in (None, "M0", "M1", "M2", "M3"):
        raise ValueError(f"condition: {condition!r} is not one of M0, M1, M2, M3")
    try:
        sheet = replace(_read_sheet(content, scale, condition), file=file)
    except ValueError as error:
        text = in_python(str(error))
        raise ValueError(f"{file}: {text}" if file else text) from None
    for line in sheet._warnings:
        warnings.warn(in_python(f"{file}:{line}" if file else line.strip()), stacklevel=level)
    return sheet


def read(
    file: Union[str, "os.PathLike[str]"],
    *,
    scale: Scale = "automatic",
    condition: Condition = None,
) -> Sheet:
    """A measurement file, CGATS text, CSV or CxF, as the program `vantrel` reads it.

    Parameters
    ----------
    file : str or path
    scale : {"automatic", "percent", "fraction"}
        Of the reflectances; automatic: as the file says, or as its largest value.
    condition : {"M0", "M1", "M2", "M3"}, optional
        The measurement condition (ISO 13655) that is wanted; otherwise that of the file, or M1 of
        several.

    Returns
    -------
    sheet : Sheet
        What the reader finds odd becomes warnings.

    Raises
    ------
    ValueError
        Where the file cannot be read as a measurement, with the line and the reason.
    OSError
        Where there is no such file.

    Examples
    --------
    >>> sheet = vantrel.read("examples/two_ink_halftone.txt")
    >>> sheet.spectra.shape, sheet.device["CMYK_M"][:3].tolist()
    ((31, 31), [0.0, 10.0, 20.0])
    """
    name = os.fspath(file)  # open() would take the number of an open file too
    with open(name, "rb") as opened:
        content = opened.read()
    sheet = _sheet(content, name, scale, condition, 3)
    return replace(sheet, _read_from=os.path.abspath(file))


def reads(content: bytes, *, scale: Scale = "automatic", condition: Condition = None) -> Sheet:
    """What read() gives, of the bytes of a measurement file.

    Parameters
    ----------
    content : bytes
    scale, condition
        As in read().

    Returns
    -------
    sheet : Sheet

    Raises
    ------
    ValueError
        Where the bytes cannot be read as a measurement, with the line and the reason.

    Examples
    --------
    >>> text = "name," + ",".join(map(str, range(400, 701, 10))) + "\\ngrey" + 31 * ",50"
    >>> vantrel.reads(text.encode())["grey"].mean()
    np.float64(50.0)
    """
    return _sheet(content, "", scale, condition, 3)
