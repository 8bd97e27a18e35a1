"""Several rows side by side have the bits of one after the other, in every function.

Which loops run is chosen when the package is imported, so that each width is asked in a process of
its own: it prints a digest of what every ufunc gives for the same arrays.
"""

import os
import subprocess
import sys

import numpy as np
import pytest

WIDTHS = ["2", "4", "8"]


def rows(random, kind, core, count):
    """Arrays of an operand: as they come, every second row, every second value, one row for all."""
    shape = (count, *core)
    if kind == "l":
        whole = random.integers(0, random.choice([4, 10, 18, 103]), (1, *core))
        return [whole[0], whole[0], whole[0], np.repeat(whole, count, 0)]
    if core and core[-1] == 31:
        values = random.uniform(60, 95, (2 * count, *core))
        centre = random.uniform(0, 31, (2 * count,) + (1,) * len(core))
        values *= 1 - 0.95 / (1 + ((np.arange(31) - centre) / 4) ** 2)
        values[3::8] *= random.choice([1e-6, -1, 0, 1e300, np.nan, np.inf])
        values[5::8] = random.uniform(0, 100, values[5::8].shape)
    else:
        values = random.uniform(-60, 60, (2 * count, *core))
        values[1::3] = abs(values[1::3])
        values[5::8] = 30 * np.round(values[5::8] / 30)  # neutral and opposite colours
    scattered = np.repeat(values[:count], 2, -1)[..., ::2]
    return [values[:count].copy(), values[::2], scattered, values[0].reshape(shape[1:])]


def digest():
    import hashlib

    from vantrel import _ufuncs

    random = np.random.default_rng(3)
    for name in sorted(_ufuncs.c_names):
        ufunc = getattr(_ufuncs, name)
        flagged = getattr(_ufuncs, name + "_ok", None)
        found = hashlib.sha256()
        inputs = (ufunc.signature or ",".join(["()"] * ufunc.nin) + "->").split("->")[0]
        cores = [c.strip("()") for c in inputs.split("),(")]
        for count in (1, 2, 3, 5, 8, 9, 31):
            for _ in range(40):
                sizes = {"p": random.choice([0, 31]), "q": 31, "n": random.integers(1, 4), "": 0}
                arrays = []
                for core, kind in zip(cores, ufunc.types[0]):
                    dims = [int(sizes[d]) if d in sizes else int(d) for d in core.split(",") if d]
                    choices = rows(random, kind, dims, count)
                    arrays.append(choices[random.integers(len(choices))])
                for call in filter(None, (ufunc, flagged)):
                    results = call(*arrays)
                    results = results if isinstance(results, tuple) else (results,)
                    # again into every second row and value, with what lies between them
                    outs = [np.zeros([2 * n for n in np.shape(r)], r.dtype) for r in results]
                    second = slice(None, None, 2)
                    call(*arrays, out=tuple(out[(..., *[second] * out.ndim)] for out in outs))
                    for result in map(np.asarray, (*results, *outs)):
                        # of a NaN, processors choose sign and payload
                        there = result == result
                        found.update(there.tobytes())
                        found.update(result[there].tobytes())
        print(name, found.hexdigest())


def of_width(width):
    environment = {**os.environ, "VANTREL_LANES": width}
    command = [sys.executable, "-W", "ignore", __file__]
    return subprocess.run(command, env=environment, capture_output=True, text=True)


@pytest.fixture(scope="module")
def one_by_one():
    return of_width("off")


@pytest.mark.parametrize("width", WIDTHS)
def test_side_by_side(one_by_one, width):
    run = of_width(width)
    if "no more than the processor has" in run.stderr:
        pytest.skip(f"this processor has no {width} lanes")
    assert run.returncode == 0, run.stderr
    assert run.stdout.splitlines() == one_by_one.stdout.splitlines()
    assert len(run.stdout.splitlines()) > 90


def test_another_width_is_refused():
    assert "VANTREL_LANES" in of_width("3").stderr


if __name__ == "__main__":
    digest()
