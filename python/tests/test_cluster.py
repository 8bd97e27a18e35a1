"""Blocks on other processes: bounded memory, settings that travel, workers that die."""

import os
import pickle
import re
import signal
import subprocess
import sys
import threading
import time
from pathlib import Path

import dask.array as da
import numpy as np
from dask.distributed import Client, LocalCluster

import vantrel

LIBRARY = Path(__file__).resolve().parents[1] / "library"


def test_a_large_image_takes_little_memory_and_a_small_graph(tmp_path):
    run = subprocess.run(
        [sys.executable, LIBRARY / "examples/spectral_image.py", tmp_path, "64"],
        capture_output=True,
        text=True,
        timeout=500,
    )
    assert run.returncode == 0, run.stderr
    lines = re.findall(r"65 MB in .*graph is (\d+) kB", run.stdout)
    assert len(lines) == 2 and all(int(graph) < 100 for graph in lines), run.stdout


def slowly(block):
    time.sleep(0.1)
    return block


def test_a_new_worker_computes_under_the_settings_of_the_job():
    image = np.random.default_rng(3).uniform(5, 95, (40, 31))
    with vantrel.settings(hifi=([480, 560, 620],)):
        expected = vantrel.refl_to_density(image, None, "HIFI", "HIFI1")
        lazy = vantrel.refl_to_density(
            da.from_array(image, chunks=(1, 31)).map_blocks(slowly), None, "HIFI", "HIFI1"
        )
        assert len(pickle.dumps(dict(lazy.dask))) < 200_000
    with LocalCluster(n_workers=2, threads_per_worker=1, dashboard_address=None) as cluster:
        with Client(cluster) as client:
            pids = client.run(os.getpid)
            job = client.compute(lazy)
            threading.Timer(0.8, os.kill, (min(pids.values()), signal.SIGKILL)).start()
            got = job.result(timeout=120)
            client.wait_for_workers(2)
            assert set(client.run(os.getpid).values()) != set(pids.values())  # one was killed
    assert np.array_equal(got, expected)
    assert not np.allclose(got, vantrel.refl_to_density(image, None, "HIFI", "HIFI1"))
