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

Spectra = Colours = Inks = Numbers = Integers = ArrayLike
OptionalSpectra = OptionalTargets = Union[ArrayLike, None]
Names = Union[str, Sequence[str], ArrayLike]
Illuminant = WhitenessIlluminant = StatusName = CCRStatus = HueStatus = Names
ResponseName = InkResponse = Reading = Names

__version__: str
ufuncs: Any
den_weight: NDArray[np.int64]
'''


def declaration(name, function):
    signature = inspect.signature(function)
    keywords = {"out": "Any", "ok": "bool"}
    parameters, starred = [], False
    for p in signature.parameters.values():
        if p.kind is p.KEYWORD_ONLY and not starred:
            parameters.append("*")
            starred = True
        annotation = keywords.get(p.name, "Any" if p.annotation is p.empty else p.annotation)
        parameters.append(f"{p.name}: {annotation}" + ("" if p.default is p.empty else " = ..."))
    result = "Any"
    if name.startswith("get_num") and not parameters:
        result = "int"
    elif name.startswith("set_"):
        result = "None"
    line = f"def {name}({', '.join(parameters)}) -> {result}: ..."
    if len(line) <= 96:
        return line
    inside = textwrap.fill(", ".join(parameters), 96, initial_indent="    ", subsequent_indent="    ")
    return f"def {name}(\n{inside}\n) -> {result}: ..."


def stubs():
    parts = [HEADER]
    public = {name: value for name, value in vars(vantrel).items() if not name.startswith("_")}
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
