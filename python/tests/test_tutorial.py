"""docs/python.md from top to bottom: its code runs, and prints what it says."""

import os
import re
import subprocess
import sys
from pathlib import Path

LIBRARY = Path(__file__).resolve().parents[1] / "library"
MARK = "-- end of a block --"


def test_the_tutorial_does_what_it_says(tmp_path):
    text = (LIBRARY / "python.md").read_text()
    blocks = re.findall(r"```python\n(.*?)```\n(?:\n```text\n(.*?)```)?", text, re.DOTALL)
    assert len(blocks) > 7
    (tmp_path / "examples").symlink_to(LIBRARY / "examples")
    script = "".join(f"{code}\nprint({MARK!r})\n" for code, _ in blocks)
    # not from a file, which the workers of the cluster would run again
    run = subprocess.run(
        [sys.executable, "-W", "error::RuntimeWarning", "-c", script],
        cwd=tmp_path,
        env=os.environ | {"MPLBACKEND": "Agg"},
        capture_output=True,
        text=True,
        timeout=300,
    )
    assert run.returncode == 0, run.stderr
    assert run.stdout.split(MARK + "\n")[:-1] == [printed for _, printed in blocks]
    for figure in "tone_values.png", "ab_plane.png", "differences.png", "density_map.png":
        assert (tmp_path / figure).stat().st_size > 5000
