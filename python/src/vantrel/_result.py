"""An answer of the program: its JSON as dataclasses, its page and its other formats."""

import functools
import html
import json
import os
from dataclasses import fields, is_dataclass
from typing import Any, Callable, Dict, Sequence, Union, get_args, get_origin, get_type_hints

from ._file import write_text

MaybeNone = Any  # beside the type of what is nearly always there: no check for None is asked for
FORMULAS = ("de2000", "cmc", "de94", "de76")


@functools.lru_cache(maxsize=None)
def _hints(kind: Any) -> Dict[str, Any]:
    hints = get_type_hints(kind)
    return {f.name: hints[f.name] for f in fields(kind)}


def made(kind: Any, value: Any) -> Any:
    """What JSON holds, as the dataclass, tuple, dictionary or plain value that `kind` asks for."""
    if value is None:
        return None
    if isinstance(kind, type) and is_dataclass(kind):
        hints = _hints(kind)
        known = {name: made(hint, value[name]) for name, hint in hints.items() if name in value}
        if "delta_e" in hints:  # members that go by the names of the formulas
            known["delta_e"] = {name: value[name] for name in FORMULAS if name in value}
        return kind(**known)
    if get_origin(kind) is Union:
        return made(get_args(kind)[0], value)  # of Optional
    if get_origin(kind) is tuple:
        return tuple(made(get_args(kind)[0], item) for item in value)
    if get_origin(kind) is dict:
        return {key: made(get_args(kind)[1], item) for key, item in value.items()}
    return value


class Result:
    """An answer of the program: its JSON, its page and its other formats."""

    json: str
    """The document that `vantrel --format json` prints, byte for byte."""
    _answer: Callable[[str], str]
    _read_from: Sequence[str]

    @classmethod
    def _of(cls, answer: Callable[[str], str], read_from: Sequence[str]) -> Any:
        text = answer("json")
        result = made(cls, cls._body(json.loads(text)))
        object.__setattr__(result, "json", text)
        object.__setattr__(result, "_answer", answer)
        object.__setattr__(result, "_read_from", read_from)
        return result

    @staticmethod
    def _body(document: Dict[str, Any]) -> Dict[str, Any]:
        return document

    def to_dict(self) -> Dict[str, Any]:
        """The document of `vantrel --format json`.

        Returns
        -------
        document : dict
            Dictionaries, lists and plain values.

        Examples
        --------
        >>> report = vantrel.report(vantrel.read("examples/two_ink_halftone.txt"))
        >>> report.to_dict()["command"]
        'report'
        """
        document: Dict[str, Any] = json.loads(self.json)
        return document

    def to_html(self) -> str:
        """The page of `vantrel --format html`: one file with tables and charts.

        Returns
        -------
        page : str

        Raises
        ------
        ValueError
            Where the package was built without npm, and has no page.

        Examples
        --------
        >>> report = vantrel.report(vantrel.read("examples/two_ink_halftone.txt"))
        >>> report.to_html()[:15]
        '<!DOCTYPE html>'
        """
        return self._answer("html")

    def write(self, file: Union[str, "os.PathLike[str]"]) -> None:
        """Writes .json, .html, .csv, or CGATS text as .txt, which the ending of the name chooses.

        The file is replaced as a whole.

        Parameters
        ----------
        file : str or path

        Raises
        ------
        ValueError
            Where the name ends otherwise, or the file is one of the measurement's.
        OSError
            Where the file cannot be written; what was there stays.

        Examples
        --------
        >>> vantrel.report(vantrel.read("examples/two_ink_halftone.txt")).write("report.doc")
        Traceback (most recent call last):
        ValueError: file: its name ends in .json, .html, .csv, .txt, not '.doc'
        """
        ending = os.path.splitext(os.fspath(file))[1].lower()
        formats = {".json": "json", ".html": "html", ".csv": "csv", ".txt": "cgats"}
        if ending not in formats:
            raise ValueError(f"file: its name ends in {', '.join(formats)}, not {ending!r}")
        write_text(file, self._answer(formats[ending]), self._read_from)

    def __str__(self) -> str:
        return self._answer("table")

    def _repr_html_(self) -> str:
        return f"<pre>{html.escape(str(self))}</pre>"
