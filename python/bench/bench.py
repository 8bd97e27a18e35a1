"""Measures the package beside other packages and beside C, in one run, for scripts/bench-python.

Every row takes turns with its rival; what is compared are the medians of the turns, per row of the
arrays. Rows run on one processor, save where two are the point.
"""

import argparse
import ctypes
import functools
import os
import platform
import statistics
import subprocess
import sys
import time
import warnings
from concurrent.futures import ThreadPoolExecutor
from importlib.metadata import version

import numpy as np

import plain
import vantrel

with warnings.catch_warnings():
    warnings.simplefilter("ignore")  # of what it can do without
    import colour
from colormath.color_objects import SpectralColor
from colormath.density import ansi_density
from colormath.density_standards import ANSI_STATUS_T_GREEN

RANDOM = np.random.default_rng(1)
PAPER = np.linspace(80, 90, 31)
ALL_PROCESSORS = os.sched_getaffinity(0)


def turns(ours, theirs, rounds, clock):
    """Medians of the seconds that two calls take, by turns, after one of each to warm up."""
    times = ([], [])
    for round in range(rounds + 1):
        for call, taken in zip((ours, theirs), times):
            start = clock()
            call()
            if round:
                taken.append(clock() - start)
    return [statistics.median(taken) for taken in times]


def report(name, rows, ours, beside, theirs, goal, rounds=15, their_rows=None, at_least=False):
    # of one thread the processor's time, in which other programs have no part
    mine, other = turns(ours, theirs, rounds, time.perf_counter if at_least else time.process_time)
    mine, other = mine / rows * 1e9, other / (their_rows or rows) * 1e9
    ratio = other / mine if at_least else mine / other
    missed = ratio < goal if at_least else ratio > goal
    sign = "≥" if at_least else "≤"
    print(
        f"| {name} | {mine:.1f} | {beside} | {other:.1f} | {ratio:.3g} | {sign} {goal}"
        f"{' missed' if missed else ''} |",
        flush=True,
    )


def pointer(array):
    return array.ctypes.data_as(ctypes.c_void_p)


def colorimetry(c):
    shape = colour.SpectralShape(400, 700, 10)
    observer = colour.MSDS_CMFS["CIE 1931 2 Degree Standard Observer"].copy().align(shape)
    d50 = colour.SDS_ILLUMINANTS["D50"].copy().align(shape)
    for rows in 10_000, 100_000, 1_000_000:
        spectra, out = RANDOM.uniform(1, 99, (rows, 31)), np.empty((rows, 3))
        rounds = max(11, 1_000_000 // rows + 1)
        name = f"`refl_to_xyz`, {rows:,} spectra"
        report(
            name,
            rows,
            lambda: vantrel.refl_to_xyz(spectra, "D50_2DEG"),
            "colour-science, `msds_to_XYZ_integration`",
            lambda: colour.colorimetry.msds_to_XYZ_integration(spectra, observer, d50, shape=shape),
            0.2,
            rounds,
        )
        if rows < 100_000:
            # its exact method takes one spectrum at a time
            few = [colour.SpectralDistribution(s / 100, shape) for s in spectra[:20]]
            report(
                name,
                rows,
                lambda: vantrel.refl_to_xyz(spectra, "D50_2DEG"),
                "colour-science, `sd_to_XYZ`, ASTM E308",
                lambda: [colour.sd_to_XYZ(s, observer, d50, method="ASTM E308") for s in few],
                0.01,
                their_rows=len(few),
            )
        report(
            name + ", `out=`",
            rows,
            lambda: vantrel.refl_to_xyz(spectra, "D50_2DEG", out=out),
            "C loop",
            lambda: c.loop_xyz(pointer(spectra), rows, 4, pointer(out)),
            1.15,
            rounds,
        )


def difference(c):
    rows = 100_000
    lab1, lab2 = RANDOM.uniform([0, -90, -90], [100, 90, 90], (2, rows, 3))
    out = np.empty(rows)
    science = colour.difference
    for name, ours, theirs, goal in (
        ("2000", vantrel.lab_to_de2000, science.delta_E_CIE2000, 0.25),
        ("_cmc", vantrel.lab_to_de_cmc, science.delta_E_CMC, 0.4),
        ("94", vantrel.lab_to_de94, science.delta_E_CIE1994, 0.2),
    ):
        report(
            f"`lab_to_de{name}`, 100,000 pairs",
            rows,
            lambda: ours(lab1, lab2),
            f"colour-science, `{theirs.__name__}`",
            lambda: theirs(lab1, lab2),
            goal,
        )
    report(
        "`lab_to_de2000`, 100,000 pairs, `out=`",
        rows,
        lambda: vantrel.lab_to_de2000(lab1, lab2, out=out),
        "C loop",
        lambda: c.loop_de2000(pointer(lab1), pointer(lab2), rows, pointer(out)),
        1.15,
    )


def density(c):
    rows, few = 100_000, 500
    spectra, out = RANDOM.uniform(1, 99, (rows, 31)), np.empty(rows)
    names = [f"spec_{nm}nm" for nm in range(400, 701, 10)]

    def colormath():
        for row in spectra[:few]:
            color = SpectralColor(**dict(zip(names, map(str, row / 100))))
            ansi_density(color, ANSI_STATUS_T_GREEN)

    report(
        "`refl_to_density`, 100,000 spectra",
        rows,
        lambda: vantrel.refl_to_density(spectra, None, "T", "GREEN"),
        "python-colormath, `ansi_density`, spectrum by spectrum",
        colormath,
        0.005,
        their_rows=few,
    )
    report(
        "`refl_to_density`, over a paper, `out=`",
        rows,
        lambda: vantrel.refl_to_density(spectra, PAPER, "T", "GREEN", out=out),
        "C loop",
        lambda: c.loop_density(pointer(spectra), pointer(PAPER), rows, 3, 2, pointer(out)),
        1.15,
    )


def inks(shape):
    """Inks with one smooth absorption on a paper."""
    centre, width = RANDOM.uniform(0, 31, shape), RANDOM.uniform(3, 8, shape)
    bands = (np.arange(31) - centre[..., None]) / width[..., None]
    return PAPER * (1 - RANDOM.uniform(0.3, 0.95, shape)[..., None] * np.exp(-(bands**2)))


def in_blocks(formula, rows):
    """What stays in the processor's caches between the steps of a formula."""
    parts = [formula(rows[i : i + 1000]) for i in range(0, len(rows), 1000)]
    if isinstance(parts[0], tuple):
        return [np.concatenate(results) for results in zip(*parts)]
    return np.concatenate(parts)


def arrays():
    """Beside the same formulas in NumPy, whole or in blocks, whichever is faster.

    All rows share paper, solid and standard.
    """
    rows = 100_000
    spectra, layers = inks(rows), inks((rows, 3))
    solid, percent = inks(()), np.array([70, 40, 85])
    for name, given, ours, formula in (
        (
            "refl_to_dot_gain",
            spectra,
            lambda: vantrel.refl_to_dot_gain(solid, spectra, PAPER, "T", "GREEN", 1, 50),
            lambda some: plain.dot_gain(solid, some, PAPER, 1, 50),
        ),
        (
            "refl_to_densities`, over a paper`",
            spectra,
            lambda: vantrel.refl_to_densities(spectra, PAPER, "T"),
            lambda some: plain.densities_over(PAPER, some),
        ),
        (
            "determine_density_response`, over a paper`",
            spectra,
            lambda: vantrel.determine_density_response(spectra, "T", PAPER),
            lambda some: plain.response(some, PAPER),
        ),
        (
            "verbal_color_difference",
            spectra,
            lambda: vantrel.verbal_color_difference(solid, spectra, "D50_2DEG", 0),
            lambda some: plain.words(solid, some),
        ),
        (
            "estimate_refls_for_thickness",
            spectra,
            lambda: vantrel.estimate_refls_for_thickness(spectra, 0.8, PAPER),
            lambda some: plain.thickness(some, 0.8, PAPER),
        ),
        (
            "estimate_refls`, 3 inks`",
            layers,
            lambda: vantrel.estimate_refls(layers, percent, PAPER),
            lambda some: plain.estimate(some, percent, PAPER),
        ),
        (
            "refl_to_density",
            spectra,
            lambda: vantrel.refl_to_density(spectra, None, "T", "GREEN"),
            plain.density,
        ),
        (
            "metamerism",
            spectra,
            lambda: vantrel.metamerism(solid, spectra, "D50_2DEG", "A_2DEG"),
            lambda some: plain.metamerism(solid, some),
        ),
        (
            "refl_to_cielab",
            spectra,
            lambda: vantrel.refl_to_cielab(spectra, "D50_2DEG"),
            lambda some: np.stack(plain.D50.lab(some), -1),
        ),
    ):
        whole = functools.partial(formula, given)
        blocks = functools.partial(in_blocks, formula, given)
        expect_same(name, ours(), whole())
        by_blocks, at_once = turns(blocks, whole, 5, time.process_time)
        theirs, how = (blocks, ", 1,000 rows at a time") if by_blocks < at_once else (whole, "")
        report(f"`{name}`".replace("``", ""), rows, ours, "plain NumPy" + how, theirs, 1.0)

    names = RANDOM.choice(["A", "E", "I", "T"], rows)
    numbers = np.array([vantrel.Status[n + "_STATUS"] for n in names])
    report(
        "`refl_to_density`, a status by name for each row",
        rows,
        lambda: vantrel.refl_to_density(spectra, None, names, "GREEN"),
        "by number",
        lambda: vantrel.refl_to_density(spectra, None, numbers, "GREEN"),
        2.0,
    )


def expect_same(name, ours, theirs):
    """Stops where a rival computes something else; rounding may tip one row in a thousand."""
    for mine, other in zip(np.atleast_2d(ours), np.atleast_2d(theirs)):
        same = mine == other if mine.dtype.kind in "iU" else np.isclose(mine, other, 1e-5, 1e-5)
        if same.mean() < 0.999:
            sys.exit(f"{name}: only {same.mean():.1%} of the results are those of its rival")


def two_processors():
    """A large image on two threads, and on two workers of Dask, against one thread."""
    import dask
    import dask.array as da

    image, out = RANDOM.uniform(1, 99, (1000, 1000, 31)), np.empty((1000, 1000))
    rows = 1_000_000
    os.sched_setaffinity(0, ALL_PROCESSORS)
    flat = image.ravel()
    halves = flat[: flat.size // 2], flat[flat.size // 2 :]
    report(
        "1,000,000 densities, one thread, `out=`",
        rows,
        lambda: vantrel.refl_to_density(image, PAPER, "E", "GREEN", out=out),
        "reading their memory (`np.dot` of it with itself)",
        lambda: np.dot(flat, flat),
        1.5,
    )
    with ThreadPoolExecutor(2) as pool:
        report(
            "reading that memory, two threads",
            rows,
            lambda: list(pool.map(lambda half: np.dot(half, half), halves)),
            "one thread",
            lambda: [np.dot(half, half) for half in halves],
            1.8,
            at_least=True,
        )
        for name, call in (
            ("`refl_to_xyz`", lambda part: vantrel.refl_to_xyz(part, "D50_2DEG")),
            ("`refl_to_density`", lambda part: vantrel.refl_to_density(part, PAPER, "E", "GREEN")),
        ):
            report(
                f"{name}, image of 1000 × 1000, two threads",
                rows,
                lambda: list(pool.map(call, (image[:500], image[500:]))),
                "one thread",
                lambda: list(map(call, (image[:500], image[500:]))),
                1.8,
                at_least=True,
            )
    with dask.config.set(scheduler="threads", num_workers=2):
        lazy = vantrel.refl_to_density(da.from_array(image, chunks=(250, -1, -1)), PAPER, "E", 2)
        report(
            "`refl_to_density`, the same image, two Dask workers",
            rows,
            lazy.compute,
            "NumPy, one thread",
            lambda: vantrel.refl_to_density(image, PAPER, "E", 2),
            1.8,
            at_least=True,
        )


def import_time():
    def run(code):
        start = time.perf_counter()
        subprocess.run([sys.executable, "-c", code], check=True)
        return time.perf_counter() - start

    pairs = [(run("import numpy, vantrel"), run("import numpy")) for _ in range(16)][1:]
    extra = statistics.median(both - numpy for both, numpy in pairs)
    print(f"\n`import vantrel` takes {extra:.3f} s beyond NumPy's own (goal: at most 0.2 s).")


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--loops", required=True, help="loop.c as a shared library")
    c = ctypes.CDLL(parser.parse_args().loops)
    for function in c.loop_xyz, c.loop_de2000, c.loop_density:
        function.restype = None
    c.loop_xyz.argtypes = ctypes.c_void_p, ctypes.c_long, ctypes.c_int, ctypes.c_void_p
    c.loop_de2000.argtypes = [ctypes.c_void_p] * 2 + [ctypes.c_long, ctypes.c_void_p]
    c.loop_density.argtypes = [ctypes.c_void_p] * 2 + [
        ctypes.c_long,
        ctypes.c_int,
        ctypes.c_int,
        ctypes.c_void_p,
    ]

    packages = ", ".join(
        f"{p} {version(p)}" for p in ("numpy", "colour-science", "colormath", "dask")
    )
    print(f"Python {platform.python_version()}, vantrel {vantrel.__version__}, {packages}\n")
    print("| | ns | beside | ns | ratio | goal |\n|---|---|---|---|---|---|")
    os.sched_setaffinity(0, {min(ALL_PROCESSORS)})
    colorimetry(c)
    difference(c)
    density(c)
    arrays()
    two_processors()
    import_time()


if __name__ == "__main__":
    main()
