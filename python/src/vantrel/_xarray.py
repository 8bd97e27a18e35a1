"""Functions over xarray arrays: results keep the labels."""

import numpy as np

from ._arguments import library_of


def _own_name(name, taken):
    """The name of a new dimension."""
    while name in taken:
        name += "_"
    return name


def _label(value, depth, loops, new, sizes, cores):
    """An array without labels under those of the others, as NumPy lines them up: from the right."""
    import xarray as xr

    names = ([*new, *loops] if depth > len(loops) else loops)[-depth:] if depth else []
    # what NumPy repeats has no place among labels
    repeated = [a for a in range(depth) if np.shape(value)[a] == 1 and sizes.get(names[a]) != 1]
    kept = [name for axis, name in enumerate(names) if axis not in repeated]
    array = value if hasattr(value, "squeeze") else np.asarray(value)
    return xr.Variable([*kept, *cores], array.squeeze(tuple(repeated)))


def on_xarray(declared, values, ok, run):
    """`run` takes the arrays that the labels are of."""
    import xarray as xr

    labelled = [library_of(value) == "xarray" for value in values]
    depths = [np.ndim(value) - len(core) for value, core in zip(values, declared.cores)]
    loops = []  # the dimensions that are not of a core
    for value, has_labels, depth in zip(values, labelled, depths):
        loops += [d for d in value.dims[:depth] if d not in loops] if has_labels else []
    taken = {d for value, has_labels in zip(values, labelled) if has_labels for d in value.dims}

    # dimensions that the arrays without labels have beyond those of the others
    plain = [np.shape(v)[:d] for v, has, d in zip(values, labelled, depths) if not has]
    shape = np.broadcast_shapes(*(s[: max(0, len(s) - len(loops))] for s in plain))
    new = [_own_name(f"dim_{i}", taken) for i in range(len(shape))]
    sizes = dict(zip(new, shape))

    arguments, cores_in, spectral = [], [], "band"
    for i, (value, core) in enumerate(zip(values, declared.cores)):
        if labelled[i]:
            names = list(value.dims[depths[i] :])
            spectral = names[-1] if core and core[-1] == "31" else spectral
        else:
            names = [f"{size} of {declared.names[i]}" for size in core]
            value = _label(value, depths[i], loops, new, sizes, names)
        arguments.append(value)
        cores_in.append(names)

    outputs = declared.outputs + ["ok"] * ok
    cores, _ = declared.result_types(ok)
    cores_out = [
        [spectral if size == "31" else _own_name(name, taken) for size in core]
        for core, name in zip(cores, outputs)
    ]
    results = xr.apply_ufunc(
        run,
        *arguments,
        input_core_dims=cores_in,
        output_core_dims=cores_out,
        dask="allowed",
        keep_attrs=False,
    )
    several = results if isinstance(results, tuple) else (results,)
    several = tuple(r.transpose(*new, ...).rename(n) for r, n in zip(several, outputs))
    return several if len(several) > 1 else several[0]
