"""Makes a function of the package from its declaration: arguments, documentation, dispatch."""

import functools
import inspect
import operator

import numpy as np

from . import _ufuncs
from ._arguments import check_core, check_reading, convert, is_lazy, library_of

WORDS = {"verbal_color_difference": np.array(_ufuncs.difference_words)}

_OUT = """
    `out`: array, or tuple of arrays, that takes the result (not for Dask and xarray)."""
_OK = """
    `ok`: with `ok=True` a last output tells which rows the library accepted; a refused row is NaN
    (-1 in integers, "" in words) either way."""


class Declared:
    """One function: its ufuncs, and the names of its outputs."""

    def __init__(self, declaration, outputs):
        self.name = declaration.__name__
        self.outputs = outputs
        self.parameters = list(inspect.signature(declaration).parameters.values())
        self.ufunc = getattr(_ufuncs, self.name)
        self.flagged = getattr(_ufuncs, self.name + "_ok", None)
        self.signature = _signature(self.ufunc)
        inputs, _, results = self.signature.partition("->")
        self.cores = _cores(inputs)
        self.result_cores = _cores(results)
        self.names = [p.name for p in self.parameters]
        self.kinds = [p.annotation for p in self.parameters]
        self.defaults = {p.name: p.default for p in self.parameters if p.default is not p.empty}

    def bind(self, args, kwargs):
        """The arguments in order, defaults filled in."""
        if len(args) > len(self.names):
            raise TypeError(f"{self.name}() takes {len(self.names)} arguments, not {len(args)}")
        values = list(args)
        for name in self.names[len(args) :]:
            if name in kwargs:
                values.append(kwargs.pop(name))
            elif name in self.defaults:
                values.append(self.defaults[name])
            else:
                raise TypeError(f"{self.name}() needs the argument {name!r}")
        if kwargs:
            wrong = next(iter(kwargs))
            given = "twice" if wrong in self.names else "an unknown argument"
            raise TypeError(f"{self.name}() was given {wrong!r}: {given}")
        return values

    def prepare(self, values):
        given = dict(zip(self.kinds, values))
        if given.get("OptionalSpectra") is not None and given.get("OptionalTargets", 0) is None:
            raise ValueError("paper_targets: a paper needs them")
        values = [convert(*three) for three in zip(self.kinds, values, self.names)]
        for value, core, kind, name in zip(values, self.cores, self.kinds, self.names):
            if core:
                check_core(value, core, kind, name)
        if "Reading" in self.kinds:
            reading = self.kinds.index("Reading")
            status = values[self.names.index("status")]
            if not is_lazy(status) and not is_lazy(values[reading]):
                check_reading(status, values[reading], self.names[reading])
        return values


def _signature(ufunc):
    """NumPy forgets the signature of a ufunc without a core."""
    nothing = ",".join(["()"] * ufunc.nin) + "->" + ",".join(["()"] * ufunc.nout)
    return ufunc.signature or nothing


def _cores(signature):
    """The core dimensions of "(n,31),()" as [["n", "31"], []]."""
    return [[d for d in core.split(",") if d] for core in signature[1:-1].split("),(")]


_DECLARED = {}


def evaluate(name, ok, *values, out=None, missing=()):
    """Runs the ufunc of a function on NumPy arrays; `missing` spectra were not handed on."""
    declared = _DECLARED[name]
    for index in missing:
        values = values[:index] + (np.empty(0),) + values[index:]
    ufunc = declared.flagged if ok else declared.ufunc
    words = WORDS.get(name)
    if out is None:
        results = ufunc(*values)
    elif words is not None:
        raise TypeError(f"{name}() makes new arrays of words and has no out=")
    else:
        outs = out if isinstance(out, tuple) else (out,)
        results = ufunc(*values, out=outs + (None,) * (ufunc.nout - len(outs)))
    if words is None:
        return results
    texts = tuple(words[np.maximum(r, 0)] for r in results[:3])
    return tuple(t if np.ndim(t) else str(t) for t in texts) + results[3:]


def _result_types(declared, ok):
    """(names of the core dimensions, type) of each output."""
    types = (declared.flagged if ok else declared.ufunc).types[0].partition("->")[2]
    dtypes = [np.dtype(t) for t in types]
    if declared.name in WORDS:
        dtypes[:3] = [WORDS[declared.name].dtype] * 3
    cores = declared.result_cores + ([[]] if ok else [])
    return cores, dtypes


def _on_block(name, ok, missing, *blocks):
    """What evaluate() gives for one block, as a tuple; a core arrives in lists of its one piece."""

    def only(block):
        return only(block[0]) if isinstance(block, list) else block

    results = evaluate(name, ok, *map(only, blocks), missing=missing)
    return results if isinstance(results, tuple) else (results,)


def _on_dask(declared, values, ok):
    """Block by block; apply_gufunc() would copy each block to join the one piece of its core."""
    import dask.array as da
    from dask.array.core import broadcast_shapes

    # Dask knows no core of no values
    optional = [i for i, kind in enumerate(declared.kinds) if kind == "OptionalSpectra"]
    missing = tuple(i for i in optional if np.shape(values[i]) == (0,))
    arrays, cores = [], []
    for i, (value, core) in enumerate(zip(values, declared.cores)):
        if i not in missing:
            whole = {axis: -1 for axis in range(-len(core), 0)}
            arrays.append(da.asarray(value).rechunk(whole))
            cores.append(core)
    loops = [array.ndim - len(core) for array, core in zip(arrays, cores)]
    depth = len(broadcast_shapes(*(a.shape[:loop] for a, loop in zip(arrays, loops))))
    names = [f"loop{d}" for d in range(depth)]
    indices = [(*names[depth - loop :], *core) for loop, core in zip(loops, cores)]
    tuples = da.blockwise(
        functools.partial(_on_block, declared.name, ok, missing),
        names,
        *(part for pair in zip(arrays, indices) for part in pair),
        concatenate=False,
        token=declared.name,
        meta=np.empty((0,) * depth, object),
    )
    results = tuple(
        da.blockwise(
            operator.itemgetter(k),
            [*names, *core],
            tuples,
            names,
            new_axes={d: int(d) for d in core},
            token=f"{declared.name}-{output}",
            meta=np.empty((0,) * (depth + len(core)), dtype),
        )
        for k, (core, dtype, output) in enumerate(
            zip(*_result_types(declared, ok), declared.outputs + ["ok"])
        )
    )
    return results if len(results) > 1 else results[0]


def _on_xarray(declared, values, ok):
    import xarray as xr

    cores_in, spectral = [], "band"
    for value, core in zip(values, declared.cores):
        dims = core
        if core and library_of(value) == "xarray":
            dims = list(value.dims[-len(core) :])
            spectral = dims[-1] if core[-1] == "31" else spectral
        cores_in.append(dims)

    def dims_out(core, name):
        return [spectral if size == "31" else name for size in core]

    cores, _ = _result_types(declared, ok)
    cores_out = [dims_out(*pair) for pair in zip(cores, declared.outputs + ["ok"])]
    return xr.apply_ufunc(
        functools.partial(_dispatch, declared, ok=ok),
        *values,
        input_core_dims=cores_in,
        output_core_dims=cores_out,
        dask="allowed",
    )


def _dispatch(declared, *values, ok=False, out=None):
    libraries = {library_of(value) for value in values}
    for library, run in ("xarray", _on_xarray), ("dask", _on_dask):
        if library in libraries:
            if out is not None:
                raise TypeError(f"{declared.name}(): out= is for NumPy arrays, not {library}")
            return run(declared, values, ok)
    return evaluate(declared.name, ok, *values, out=out)


def function(*outputs):
    """Makes the function that a declaration (name, parameters, documentation) describes."""

    def make(declaration):
        declared = _DECLARED[declaration.__name__] = Declared(declaration, list(outputs))

        @functools.wraps(declaration)
        def call(*args, out=None, ok=False, **kwargs):
            if ok and declared.flagged is None:
                raise TypeError(f"{declared.name}() refuses no row and has no ok=")
            values = declared.prepare(declared.bind(args, kwargs))
            return _dispatch(declared, *values, ok=bool(ok), out=out)

        text = inspect.cleandoc(declaration.__doc__ or "")  # python -OO drops them
        subject = (declaration.__globals__["__doc__"] or "").partition("\n\n")[2].strip()
        shapes = f"Shapes: {declared.signature}, broadcast as NumPy does."
        source = f"C function: {_ufuncs.c_names[declared.name]}."
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
