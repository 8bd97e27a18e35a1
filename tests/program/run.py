"""Runs the commands of case files and compares all that they print; --renew rewrites the files.

    run.py [--renew] PROGRAM FILE...

A file holds commands as one types them, each with what it prints: standard output as it is, lines of
standard error behind "! ", an exit status other than 0 behind "? ". Lines that begin with "> " go on
with a command, those with "# " before it say what it is for. The commands of a file run in order, in
a new folder that holds copies of the sheets in tests/sheets/data and of the examples. Control
characters are shown as the symbols for them. Where both numbers have 12 digits or more they may
differ in the last places; everything else is compared to the letter.
"""
import difflib
import math
import os
import pathlib
import re
import shutil
import subprocess
import sys
import tempfile

ROOT = pathlib.Path(__file__).resolve().parents[2]
NUMBER = re.compile(r"(-?\d+(?:\.\d+)?(?:e[-+]?\d+)?)")
CONTROL = {c: chr(0x2400 + c) for c in range(32) if chr(c) not in "\t\n"}


def close(expected, actual):
    if expected == actual:
        return True
    exact = min(len(re.sub(r"e.*|\D", "", text)) for text in (expected, actual)) < 12
    return (not exact and NUMBER.fullmatch(expected) and NUMBER.fullmatch(actual)
            and math.isclose(float(expected), float(actual), rel_tol=1e-9, abs_tol=1e-12))


def settled(expected, actual):
    """What was printed, with each line as expected that differs in last places alone."""
    if len(expected) != len(actual):
        return actual
    lines = []
    for old, new in zip(expected, actual):
        parts = NUMBER.split(old), NUMBER.split(new)
        same = len(parts[0]) == len(parts[1]) and all(map(close, *parts))
        lines.append(old if same else new)
    return lines


def marked(text, mark):
    lines = text.decode(errors="backslashreplace").translate(CONTROL).split("\n")
    end = lines.pop()
    return [mark + line for line in lines] + ([mark + end, "\\ no end of line"] if end else [])


def run(block, folder, environment):
    lines = block.split("\n")
    first = next(i for i, line in enumerate(lines) if line.startswith("$ "))
    end = first + 1
    while end < len(lines) and lines[end].startswith(">"):
        end += 1
    command = "\n".join([lines[first][2:], *(line[2:] for line in lines[first + 1:end])])
    done = subprocess.run(["sh", "-c", command], cwd=folder, env=environment, capture_output=True,
                          stdin=subprocess.DEVNULL, timeout=300, check=False)
    if re.search(rb"^sh: \d+: ", done.stderr, re.M):
        sys.exit(f"{command}\n{done.stderr.decode()}")
    printed = marked(done.stdout, "") + marked(done.stderr, "! ")
    if done.returncode:
        printed.append(f"? {done.returncode}")
    return "\n".join(lines[:end] + settled(lines[end:], printed))


def run_file(program, path, renew):
    expected = path.read_text(encoding="utf-8")
    environment = os.environ | {"LC_ALL": "C.UTF-8", "TERM": "xterm",
                                "PATH": f"{program.parent}:{os.environ['PATH']}"}
    environment.pop("NO_COLOR", None)
    with tempfile.TemporaryDirectory() as folder:
        for sheet in [*(ROOT / "tests/sheets/data").iterdir(), *(ROOT / "examples").glob("*.*")]:
            shutil.copy(sheet, folder)
        blocks = re.split(r"\n\n(?=(?:# .*\n)*\$ )", expected.removesuffix("\n"))
        actual = "\n\n".join(run(block, folder, environment) for block in blocks) + "\n"
    if renew:
        path.write_text(actual, encoding="utf-8")
    elif actual != expected:
        sys.stdout.writelines(difflib.unified_diff(
            expected.splitlines(True), actual.splitlines(True), str(path), "printed now"))
        return False
    return True


def main():
    words = [word for word in sys.argv[1:] if word != "--renew"]
    program = pathlib.Path(words[0]).resolve()
    results = [run_file(program, pathlib.Path(word), "--renew" in sys.argv) for word in words[1:]]
    return 0 if results and all(results) else 1


sys.exit(main())
