"""Functions over xarray arrays: results keep the labels."""

from ._arguments import library_of


def on_xarray(declared, values, ok, run):
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

    cores, _ = declared.result_types(ok)
    cores_out = [dims_out(*pair) for pair in zip(cores, declared.outputs + ["ok"])]
    return xr.apply_ufunc(
        run,
        *values,
        input_core_dims=cores_in,
        output_core_dims=cores_out,
        dask="allowed",
    )
