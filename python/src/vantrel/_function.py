"""Makes a function of the package from its declaration: documentation, dispatch."""

import functools
import inspect

import numpy as np

from . import _ufuncs
from ._arguments import library_of
from ._dask import on_dask
from ._declared import DECLARED, WORDS, Declared, evaluate
from ._kinds import meaning_of
from ._xarray import on_xarray

_OUT = """out : array or tuple of arrays, optional
    Takes the result; not for Dask and xarray."""
_OK = """ok : bool, default False
    Whether a last output tells which rows were accepted. A row that is refused, or that holds a NaN,
    is NaN (-1 in integers, False, "" in words) either way."""
_RAISES = "ValueError\n    Where an argument is wrong for the whole call, with its name and the reason."
_NO_FILTER = """A response of which the status has no filter: of single ones a ValueError, of several a
row that is refused. (The C function answers 5, 0 or infinity.)"""
_TYPES = {"f": "float", "i": "int", "u": "int", "b": "bool", "U": "str"}


def _dispatch(declared, *values, ok=False, out=None):
    library = {library_of(value) for value in values} & {"xarray", "dask"}
    if library and out is not None:
        raise TypeError(f"{declared.name}(): out= is for NumPy arrays, not {', '.join(library)}")
    if "xarray" in library:
        return on_xarray(declared, values, ok, functools.partial(_dispatch, declared, ok=ok))
    if "dask" in library:
        return on_dask(declared, values, ok)
    return evaluate(declared.name, ok, *values, out=out)


def _shape(core):
    """(..., 31) for the core "31"; a spectrum that may be missing has one of its own name."""
    sizes = {"p": "31", "q": "31"}
    return f" (..., {', '.join(sizes.get(d, d) for d in core)})" if core else ""


def _documentation(declared, declaration, keywords):
    """The text of a declaration, with a section for each of parameters, results and faults."""
    text = inspect.cleandoc(declaration.__doc__ or "")  # python -OO drops them
    text, prompt, example = text.partition("\n>>> ")
    parameters = [
        f"{p.name} : array_like{_shape(core)}"
        + ("" if p.default is p.empty else f", default {p.default!r}")
        + f"\n    {meaning_of(p.annotation)}"
        for p, core in zip(declared.parameters, declared.cores)
    ]
    parameters += [{"out": _OUT, "ok": _OK}[name] for name in keywords]
    results = [
        f"{name} : {_TYPES[dtype.kind]} or array{_shape(core)}"
        for name, core, dtype in zip(declared.outputs, *declared.result_types(False))
    ]
    c_name = _ufuncs.c_names[declared.name]
    notes = [
        (declaration.__globals__["__doc__"] or "").partition("\n\n")[2].strip(),
        _NO_FILTER if declared.read else "",
        f"Shapes: {declared.signature}, broadcast as NumPy does."
        + (f" C function: {c_name}." if c_name else ""),
    ]
    sections = {
        "Parameters": "\n".join(parameters),
        "Returns": "\n".join(results),
        "Raises": _RAISES,
        "Notes": "\n\n".join(filter(None, notes)),
        "Examples": prompt.strip("\n") + example,
    }
    titled = [f"{title}\n{'-' * len(title)}\n{body}" for title, body in sections.items() if body]
    return "\n\n".join([text.strip(), *titled])


def function(*outputs):
    """Makes the function that a declaration (name, parameters, documentation) describes."""

    def make(declaration):
        declared = DECLARED[declaration.__name__] = Declared(declaration, list(outputs))

        plain = declared.name not in WORDS

        @functools.wraps(declaration)
        def call(*args, out=None, ok=False, **kwargs):
            if ok and declared.flagged is None:
                raise TypeError(f"{declared.name}() refuses no row and has no ok=")
            if kwargs:
                args = declared.bind(args, kwargs)
            if plain and (out is None or type(out) is np.ndarray):
                values = declared.prepare_again(args)
                if values is not None:
                    if out is None and not ok:
                        return declared.ufunc(*values)
                    return evaluate(declared.name, bool(ok), *values, out=out)
            values = declared.prepare(declared.bind(args, {}))
            return _dispatch(declared, *values, ok=bool(ok), out=out)

        keywords = {"out": None, "ok": False}
        if not plain:
            del keywords["out"]
        if not declared.flagged:
            del keywords["ok"]
        call.__doc__ = _documentation(declared, declaration, keywords)
        extra = [
            inspect.Parameter(name, inspect.Parameter.KEYWORD_ONLY, default=default)
            for name, default in keywords.items()
        ]
        vars(call)["__signature__"] = inspect.Signature(declared.parameters + extra)
        return call

    return make
