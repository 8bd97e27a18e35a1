"""Writes src/vantrel/__init__.pyi from the installed package: python stubs.py"""

import inspect
import textwrap
from pathlib import Path

import vantrel
from vantrel._arguments import INDICES
from vantrel._declared import DECLARED

HEADER = '''"""Types of the package, written by stubs.py.

Results are arrays of the kind that was handed in, NumPy scalars for single rows; with `ok=True` a
tuple that ends with the flags.
"""

from contextlib import AbstractContextManager
from typing import Annotated, Any, Literal, Optional, Protocol, Sequence, TypeVar, Union, overload

import numpy as np
from numpy.typing import ArrayLike, NDArray

from . import plot as plot
from ._enums import IllumObs as IllumObs, Response as Response, Status as Status
from ._ink import Ink as Ink
from ._judge import compare as compare, ink as ink, predict as predict, report as report, run as run
from ._predictions import Predictions as Predictions
from ._results import Comparison as Comparison, Report as Report
from ._run import Run as Run
from ._sheet import Origin as Origin, Sheet as Sheet, Source as Source, read as read, reads as reads

class _SupportsArray(Protocol):
    def __array__(self) -> Any: ...

class _Other(Protocol):  # an array of Dask or xarray
    def __dask_graph__(self) -> Any: ...

_T = TypeVar("_T")
_Flags = Annotated[NDArray[np.bool_], "or a flag, for single rows"]
_OneOrMore = Union[_T, int, Sequence[Union[_T, int, Sequence[Union[_T, int]]]], _SupportsArray]
_Spectra = ArrayLike
_Colours = ArrayLike
_Inks = ArrayLike
_Numbers = ArrayLike
_Integers = ArrayLike
_OptionalSpectra = Optional[ArrayLike]
_OptionalTargets = Optional[ArrayLike]
'''

TYPES = {"f": "np.floating[Any]", "i": "np.integer[Any]", "u": "np.integer[Any]", "U": "np.str_"}
TYPES["b"] = "np.bool_"

CONSTANTS = '''
def get_hifi_constants() -> tuple[_Row, _Row, _Row, _Row]: ...
def set_hifi_constants(
    wavelengths: ArrayLike, shape1: Optional[ArrayLike] = None, shape2: Optional[ArrayLike] = None,
    shape3: Optional[ArrayLike] = None
) -> None: ...
def get_hexachrome_constants() -> tuple[_Row, _Row, _Row]: ...
def set_hexachrome_constants(
    wavelengths: ArrayLike, shape1: Optional[ArrayLike] = None, shape2: Optional[ArrayLike] = None
) -> None: ...
def get_spectralx_constants() -> tuple[float, float, float, float, float]: ...
def set_spectralx_constants(
    tolerance: float, reserved: float, centre: float, inner: float, outer: float
) -> None: ...
def get_achromatic_constants() -> tuple[float, float, float, float]: ...
def set_achromatic_constants(L1: float, L2: float, C1: float, C2: float) -> None: ...
def settings(
    *, hifi: Optional[Sequence[ArrayLike]] = None, hexachrome: Optional[Sequence[ArrayLike]] = None,
    spectralx: Optional[Sequence[float]] = None, achromatic: Optional[Sequence[float]] = None
) -> AbstractContextManager[None]: ...
def get_num_illuminant_observers() -> int: ...
def get_num_responses() -> int: ...
def get_num_statuses() -> int: ...
def resample(values: ArrayLike, wavelengths: ArrayLike) -> NDArray[np.float64]: ...
'''


def inside(items):
    """What brackets hold, in lines of its own."""
    return textwrap.fill(", ".join(items), 96, initial_indent="    ", subsequent_indent="    ")


def line(name, parameters, result, decorators=()):
    head = "".join(f"{d}\n" for d in decorators)
    text = f"def {name}({', '.join(parameters)}) -> {result}: ..."
    if len(text) > 96:
        text = f"def {name}(\n{inside(parameters)}\n) -> {result}: ..."
    return head + text


def result_of(core, dtype):
    """An array with its shape; what is a single number may be one for each row."""
    kind = TYPES[dtype.kind]
    if not core:
        return f"Annotated[Any, '{'bool' if dtype.kind == 'b' else dtype.name} or array']"
    shape = ", ".join(core)
    return f"Annotated[NDArray[{kind}], '(..., {shape})']"


def declarations(name, function, decorators=()):
    """The overloads of a function: results without and with flags, and of arrays of others."""
    declared = DECLARED[function.__name__]
    signature = inspect.signature(function).parameters
    parameters = []
    for p in declared.parameters:
        default = "" if p.default is p.empty else f" = {p.default!r}"
        parameters.append(f"{p.name}: _{p.annotation}{default}")
    out = ["out: Any = None"] if "out" in signature else []
    results = [result_of(*pair) for pair in zip(*declared.result_types(False))]
    if "ok" in signature:
        modes = [(["ok: Literal[False] = False"], results)]
        modes.append((["ok: Literal[True]"], results + ["_Flags"]))
    else:
        modes = [([], results)]
    first = parameters[0].split(":")[0]
    overloads = [line(name, [f"{first}: _Other", "*others: Any", "**named: Any"], "Any")]
    for ok, given in modes:
        result = given[0] if len(given) == 1 else f"tuple[{', '.join(given)}]"
        starred = ["*"] if out or ok else []
        overloads.append(line(name, parameters + starred + out + ok, result))
    head = "".join(f"{d}\n" for d in ("@overload", *decorators))
    return "\n".join(head + text for text in overloads)


def names_of(kind):
    """The literal names that an argument of this kind takes."""
    index = INDICES[kind]
    words = [f'"{name}"' for name, number in index.numbers.items() if number in index.allowed]
    return f"_{kind} = _OneOrMore[\n    Literal[\n{textwrap.indent(inside(words), '    ')}\n    ]\n]"


def stubs():
    names = [f'"{name}"' for name in vantrel.__all__]
    public = {name: getattr(vantrel, name) for name in vantrel.__all__}
    parts = [HEADER]
    parts += [names_of(kind) for kind in INDICES]
    parts += ["_Row = NDArray[np.float64]", "__version__: str", "ufuncs: Any"]
    parts += ["den_weight: NDArray[np.int64]", f"\n__all__ = [\n{inside(names)}\n]\n"]
    for name, value in public.items():
        if callable(value) and getattr(value, "__name__", None) in DECLARED:
            parts.append(declarations(name, value))
    parts.append(CONSTANTS)
    parts.append("class CIEDE2000:")
    for name, value in vars(vantrel.CIEDE2000).items():
        if isinstance(value, staticmethod):
            text = declarations(name, value.__func__, ["@staticmethod"])
            parts.append(textwrap.indent(text, "    "))
    return "\n".join(parts) + "\n"


if __name__ == "__main__":
    (Path(__file__).parent / "src/vantrel/__init__.pyi").write_text(stubs())
