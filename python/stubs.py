"""Writes src/vantrel/__init__.pyi from the installed package: python stubs.py"""

import enum
import inspect
import textwrap
from pathlib import Path

import vantrel

HEADER = '''"""Types of the package, written by stubs.py.

Results are arrays of the kind that was handed in, NumPy scalars for single rows; with `ok=True` a
tuple that ends with the flags.
"""

from enum import IntEnum
from typing import Any, Sequence, Union

import numpy as np
from numpy.typing import ArrayLike, NDArray

_Spectra = ArrayLike
_Colours = ArrayLike
_Inks = ArrayLike
_Numbers = ArrayLike
_Integers = ArrayLike
_OptionalSpectra = Union[ArrayLike, None]
_OptionalTargets = Union[ArrayLike, None]
_Names = Union[str, Sequence[str], ArrayLike]
_Illuminant = _Names
_WhitenessIlluminant = _Names
_StatusName = _Names
_CCRStatus = _Names
_HueStatus = _Names
_ResponseName = _Names
_InkResponse = _Names
_Reading = _Names

__version__: str
ufuncs: Any
den_weight: NDArray[np.int64]
'''


def inside(items):
    """What brackets hold, in lines of its own."""
    return textwrap.fill(", ".join(items), 96, initial_indent="    ", subsequent_indent="    ")


def declaration(name, function):
    signature = inspect.signature(function)
    keywords = {"out": "Any", "ok": "bool"}
    parameters, starred = [], False
    for p in signature.parameters.values():
        if p.kind is p.KEYWORD_ONLY and not starred:
            parameters.append("*")
            starred = True
        kind = "Any" if p.annotation is p.empty else f"_{p.annotation}"
        annotation = keywords.get(p.name, kind)
        default = "" if p.default is p.empty else f" = {p.default!r}"
        parameters.append(f"{p.name}: {annotation}{default}")
    result = "Any"
    if name.startswith("get_num") and not parameters:
        result = "int"
    elif name.startswith("set_"):
        result = "None"
    line = f"def {name}({', '.join(parameters)}) -> {result}: ..."
    if len(line) <= 96:
        return line
    return f"def {name}(\n{inside(parameters)}\n) -> {result}: ..."


def stubs():
    names = [f'"{name}"' for name in vantrel.__all__]
    parts = [HEADER, f"__all__ = [\n{inside(names)}\n]\n"]
    public = {name: getattr(vantrel, name) for name in vantrel.__all__}
    for name, value in public.items():
        if inspect.isclass(value) and issubclass(value, enum.Enum):
            members = "".join(f"    {m.name} = {int(m)}\n" for m in value)
            parts.append(f"class {name}(IntEnum):\n{members}")
    for name, value in public.items():
        if callable(value) and not inspect.isclass(value):
            parts.append(declaration(name, value))
    parts.append("\nclass CIEDE2000:")
    for name, value in vars(vantrel.CIEDE2000).items():
        if isinstance(value, staticmethod):
            text = declaration(name, value.__func__).replace("\n", "\n    ")
            parts.append(f"    @staticmethod\n    {text}")
    return "\n".join(parts) + "\n"


if __name__ == "__main__":
    (Path(__file__).parent / "src/vantrel/__init__.pyi").write_text(stubs())
