from pathlib import Path

import pytest

import vantrel


@pytest.fixture(scope="session")
def sheet():
    return vantrel.read(Path(__file__).resolve().parents[1] / "library/examples/two_ink_halftone.txt")
