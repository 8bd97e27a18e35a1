"""Makes a function of the package from its declaration: documentation, dispatch."""

import functools
import inspect

from . import _ufuncs
from ._arguments import library_of
from ._dask import on_dask
from ._declared import DECLARED, WORDS, Declared, evaluate
from ._xarray import on_xarray

_OUT = """
    `out`: array, or tuple of arrays, that takes the result (not for Dask and xarray)."""
_OK = """
    `ok`: with `ok=True` a last output tells which rows the library accepted; a refused row is NaN
    (-1 in integers, "" in words) either way."""


def _dispatch(declared, *values, ok=False, out=None):
    library = {library_of(value) for value in values} & {"xarray", "dask"}
    if library and out is not None:
        raise TypeError(f"{declared.name}(): out= is for NumPy arrays, not {', '.join(library)}")
    if "xarray" in library:
        return on_xarray(declared, values, ok, functools.partial(_dispatch, declared, ok=ok))
    if "dask" in library:
        return on_dask(declared, values, ok)
    return evaluate(declared.name, ok, *values, out=out)


def function(*outputs):
    """Makes the function that a declaration (name, parameters, documentation) describes."""

    def make(declaration):
        declared = DECLARED[declaration.__name__] = Declared(declaration, list(outputs))

        plain = declared.name not in WORDS

        @functools.wraps(declaration)
        def call(*args, out=None, ok=False, **kwargs):
            if out is None and ok is False and not kwargs and plain:
                values = declared.prepare_again(args)
                if values is not None:
                    return declared.ufunc(*values)
            if ok and declared.flagged is None:
                raise TypeError(f"{declared.name}() refuses no row and has no ok=")
            values = declared.prepare(declared.bind(args, kwargs))
            return _dispatch(declared, *values, ok=bool(ok), out=out)

        text = inspect.cleandoc(declaration.__doc__ or "")  # python -OO drops them
        subject = (declaration.__globals__["__doc__"] or "").partition("\n\n")[2].strip()
        shapes = f"Shapes: {declared.signature}, broadcast as NumPy does."
        c_name = _ufuncs.c_names[declared.name]
        source = f"C function: {c_name}." if c_name else ""
        keywords = {"out": (None, _OUT), "ok": (False, _OK)}
        if declared.name in WORDS:
            del keywords["out"]
        if not declared.flagged:
            del keywords["ok"]
        more = inspect.cleandoc("".join(note for _, note in keywords.values()))
        call.__doc__ = "\n\n".join(filter(None, (text, subject, f"{shapes} {source}", more)))
        extra = [
            inspect.Parameter(name, inspect.Parameter.KEYWORD_ONLY, default=default)
            for name, (default, _) in keywords.items()
        ]
        call.__signature__ = inspect.Signature(declared.parameters + extra)
        return call

    return make
