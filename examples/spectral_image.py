"""The density of every pixel of a spectral image that need not fit into memory, on two processes.

    python spectral_image.py FOLDER ROWS

makes an image of ROWS x 4096 pixels (1,000,000 bytes a row) in FOLDER, once as plain bytes and once
as zarr, and computes the density of both.
"""

import pickle
import sys
import time
from pathlib import Path

import dask.array as da
import numpy as np
from dask.distributed import Client, LocalCluster

import vantrel

COLUMNS, BANDS, TOGETHER = 4096, 31, 32
PAPER = np.linspace(80, 90, BANDS)


class OnDisk:
    """A file of doubles that the workers map: the graph of Dask holds its name, not its bytes."""

    dtype, ndim = np.dtype(np.float64), 3

    def __init__(self, file, rows):
        self.file, self.shape = str(file), (rows, COLUMNS, BANDS)

    def __getitem__(self, part):
        return np.array(np.memmap(self.file, self.dtype, "r", shape=self.shape)[part])


def make(folder, rows):
    """Writes a vignette with noise, a few rows at a time."""
    import zarr

    random = np.random.default_rng(1)
    chunks = (TOGETHER, COLUMNS, BANDS)
    shape = (rows, COLUMNS, BANDS)
    store = str(folder / "image.zarr")
    stored = zarr.open_array(store, mode="w", shape=shape, chunks=chunks, dtype="f8")
    with open(folder / "image.raw", "wb") as file:
        for first in range(0, rows, TOGETHER):
            shape = (min(TOGETHER, rows - first), COLUMNS, BANDS)
            part = np.linspace(85, 5, COLUMNS)[:, None] + random.uniform(-1, 1, shape)
            stored[first : first + TOGETHER] = part
            part.tofile(file)


def density_of(image):
    return vantrel.refl_to_density(image, PAPER, "E", "GREEN")


def peak_memory():
    """Of this process, in MiB."""
    import resource

    return resource.getrusage(resource.RUSAGE_SELF).ru_maxrss / 1024


def main(folder, rows):
    make(folder, rows)
    by_map = da.from_array(OnDisk(folder / "image.raw", rows), (TOGETHER, COLUMNS, BANDS), name="raw")
    by_zarr = da.from_zarr(folder / "image.zarr")
    results = []
    with LocalCluster(n_workers=2, threads_per_worker=1, dashboard_address=None) as cluster:
        with Client(cluster) as client:
            for name, image in ("memory-mapped", by_map), ("zarr", by_zarr):
                lazy = density_of(image)
                size = len(pickle.dumps(dict(lazy.dask)))
                start = time.perf_counter()
                results.append(lazy.compute())
                seconds = time.perf_counter() - start
                megabytes = max(client.run(peak_memory).values())
                print(
                    f"{name}: {image.nbytes / 1e6:.0f} MB in {seconds:.1f} s, at most "
                    f"{megabytes:.0f} MiB a process; the graph is {size / 1000:.0f} kB"
                )
    some = min(rows, 8 * TOGETHER)
    part = np.fromfile(folder / "image.raw", count=some * COLUMNS * BANDS)
    part = part.reshape(some, COLUMNS, BANDS)
    start = time.perf_counter()
    expected = density_of(part)
    alone = (time.perf_counter() - start) * rows / some
    print(f"computing alone, in one process: {alone:.1f} s for as many rows")
    assert np.array_equal(results[0], results[1])
    assert np.array_equal(results[0][:some], expected)


if __name__ == "__main__":
    main(Path(sys.argv[1]), int(sys.argv[2]))
