"""What a declaration says of a function, and the call of its ufunc on NumPy arrays."""

import inspect
from typing import Any, Dict

import numpy as np

from . import _ufuncs
from ._arguments import (
    BANDS,
    FRACTION,
    check_core,
    check_reading,
    convert,
    is_lazy,
    is_spectral,
    look_like_fractions,
    warn_of_fractions,
)
from ._enums import IllumObs, Response, Status
from ._filters import OWN_READINGS, check_filter, without_filter

WORDS = {"verbal_color_difference": np.array(_ufuncs.difference_words)}


_DOUBLE = np.dtype(np.float64)
_HANDED_ON = object()  # a value that is not remembered
_ENUMERATIONS = {IllumObs, Status, Response}
_MOST_REMEMBERED = 1000  # calls of a function
_THROUGH_FILTERS = {"Reading", "ResponseName", "InkResponse"}


class Declared:
    """One function: its ufuncs, and the names of its outputs."""

    def __init__(self, declaration, outputs):
        self.name = declaration.__name__
        self.outputs = outputs
        self.parameters = list(inspect.signature(declaration).parameters.values())
        self.ufunc = getattr(_ufuncs, self.name)
        self.flagged: Any = getattr(_ufuncs, self.name + "_ok", None)
        self.signature = _signature(self.ufunc)
        inputs, _, results = self.signature.partition("->")
        self.cores = _cores(inputs)
        self.result_cores = _cores(results)
        self.names = [p.name for p in self.parameters]
        self.kinds = [p.annotation for p in self.parameters]
        self.read = self._read()
        self.spectral = [is_spectral(*pair) for pair in zip(self.kinds, self.cores)]
        self.without_spectra = not any(self.spectral)
        self.last = [_last(*pair) for pair in zip(self.kinds, self.cores)]
        self.dtypes = [np.dtype(t) for t in self.ufunc.types[0].partition("->")[0]]
        self.seen = {}
        self.defaults = {p.name: p.default for p in self.parameters if p.default is not p.empty}

    def _read(self):
        """Where a status and a response stand among the arguments, and whether that is a Reading."""
        read = [i for i, kind in enumerate(self.kinds) if kind in _THROUGH_FILTERS]
        if "status" not in self.names or not read:
            return None
        return self.names.index("status"), read[0], self.kinds[read[0]] == "Reading"

    def _peak(self, values):
        """The place in den_weight of the largest weight of the filter that is read through."""
        if not self.read or any(np.ndim(values[i]) for i in self.read[:2]):
            return None
        filter_at = tuple(int(values[i]) for i in self.read[:2])
        if filter_at[0] in OWN_READINGS:
            return None
        return *filter_at, int(_ufuncs.den_weight[filter_at].argmax())

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
        values = [convert(*four) for four in zip(self.kinds, self.cores, values, self.names)]
        for value, core, kind, name in zip(values, self.cores, self.kinds, self.names):
            if core:
                check_core(value, core, kind, name)
        if self.read:
            i, j, is_reading = self.read
            if not is_lazy(values[i]) and not is_lazy(values[j]):
                if is_reading:
                    check_reading(values[i], values[j], self.names[j])
                check_filter(values[i], values[j], is_reading, self.names[j])
        if any(self.spectral):
            triples = zip(self.names, values, self.spectral)
            warn_of_fractions({name: v for name, v, spectral in triples if spectral}, 4)
        return values

    def prepare_again(self, args):
        """What prepare() gives for arrays of doubles, words and whole numbers; it remembers these.

        None where there is anything else among the arguments, and where spectra may be fractions.
        """
        if len(args) > len(self.names):
            return None
        key, percent = [], self.without_spectra
        for value, last, spectral, name in zip(args, self.last, self.spectral, self.names):
            kind = type(value)
            if kind is np.ndarray:
                shape = value.shape
                if value.dtype is not _DOUBLE or shape != last and shape[-1:] != last:
                    return None
                if spectral and 0 not in shape:
                    if value.item(0) > FRACTION or value.item(-1) > FRACTION:
                        percent = True
                    elif look_like_fractions(value, name):
                        return None
                key.append(_HANDED_ON)
            elif kind is str or kind is int or value is None:
                key.append(value)
            elif kind is float and last == ():
                key.append(_HANDED_ON)
            elif kind in _ENUMERATIONS:
                key.append((kind, value))
            else:
                return None
        if not percent:
            return None
        called = tuple(key)
        seen = self.seen.get(called)
        if seen is None or seen[2] and _ufuncs.den_weight.item(seen[2]) <= 0:  # its filter was taken away
            values = [np.asarray(*v) for v in zip(self.prepare(self.bind(args, {})), self.dtypes)]
            handed_on = [i for i, k in enumerate(key) if k is _HANDED_ON]
            seen = values, handed_on, self._peak(values)
            if len(self.seen) < _MOST_REMEMBERED:
                self.seen[called] = seen
        prepared = seen[0].copy()
        for i in seen[1]:
            prepared[i] = args[i]
        return prepared

    def result_types(self, ok):
        """(names of the core dimensions, type) of each output."""
        types = (self.flagged if ok else self.ufunc).types[0].partition("->")[2]
        dtypes = [np.dtype(t) for t in types]
        if self.name in WORDS:
            dtypes[:3] = [WORDS[self.name].dtype] * 3
        cores = self.result_cores + ([[]] if ok else [])
        return cores, dtypes


def _signature(ufunc):
    """NumPy forgets the signature of a ufunc without a core."""
    nothing = ",".join(["()"] * ufunc.nin) + "->" + ",".join(["()"] * ufunc.nout)
    return ufunc.signature or nothing


def _cores(signature):
    """The core dimensions of "(n,31),()" as [["n", "31"], []]."""
    return [[d for d in core.split(",") if d] for core in signature[1:-1].split("),(")]


def _last(kind, core):
    """The end of the shape of doubles; None for other kinds, and for more than one dimension."""
    if kind not in ("Spectra", "OptionalSpectra", "Colours", "Numbers") or len(core) > 1:
        return None
    return tuple(int(d) if d.isdigit() else BANDS for d in core)


DECLARED: Dict[str, Any] = {}


def evaluate(name, ok, *values, out=None, missing=()):
    """Runs the ufunc of a function on NumPy arrays; `missing` spectra were not handed on."""
    declared = DECLARED[name]
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
    if declared.read and not any(declared.result_cores):  # the C function refuses these itself
        status, response, is_reading = declared.read
        results = without_filter(results, values[status], values[response], is_reading)
    if words is None:
        return results
    texts = tuple(words[np.maximum(r, 0)] for r in results[:3])
    return tuple(t if np.ndim(t) else str(t) for t in texts) + results[3:]
