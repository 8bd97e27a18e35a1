"""Functions over Dask arrays, block by block."""

import functools
import operator

import numpy as np

from . import _ufuncs
from ._declared import evaluate

_DEFAULTS = _ufuncs.get_settings()


def settings_in_force():
    """The settings that a block is made under; b"" for the defaults."""
    now = _ufuncs.get_settings()
    return b"" if now == _DEFAULTS else now


def _on_block(name, ok, missing, settings, *blocks):
    """What evaluate() gives for one block, as a tuple; a core arrives in lists of its one piece.

    The settings are those of the process that asked for the block, which may be far away.
    """

    def only(block):
        return only(block[0]) if isinstance(block, list) else block

    _ufuncs.use_settings(settings or _DEFAULTS)
    try:
        results = evaluate(name, ok, *map(only, blocks), missing=missing)
    finally:
        _ufuncs.use_settings(None)
    return results if isinstance(results, tuple) else (results,)


def on_dask(declared, values, ok):
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
        functools.partial(_on_block, declared.name, ok, missing, settings_in_force()),
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
            zip(*declared.result_types(ok), declared.outputs + ["ok"])
        )
    )
    return results if len(results) > 1 else results[0]
