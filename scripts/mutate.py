"""Changes one operator, constant or condition of src/ at a time and asks the tests whether they
notice. Prints the changes that they let pass, and the share that they killed."""

import argparse
import concurrent.futures
import itertools
import json
import os
import pathlib
import random
import re
import shlex
import subprocess
import sys
import tempfile

ROOT = pathlib.Path(__file__).resolve().parent.parent
FIGURES_OF_A_ROW = 3  # of a row of a table only so many are changed, unless all are asked for
FIGURES_OF_A_NUMBER = 12  # what the tests tell apart: they compare to a relative 1e-12
SECONDS = 60  # a change that keeps the tests busy for longer is noticed

# What is never changed: comments, text, the preprocessor's lines, assertions of the compiler.
SKIPPED = re.compile(r"""//[^\n]* | /\*.*?\*/ | "(?:\\.|[^"\\\n])*" | '(?:\\.|[^'\\])+'
                         | ^[ \t]*\#(?:\\\n|[^\n])* | \b(?:static_assert|using)\b.*?;""",
                     re.S | re.M | re.X)
OPPOSITES = [("+", "-"), ("*", "/"), ("<", "<="), (">", ">="), ("==", "!="), ("&&", "||"),
             ("+=", "-="), ("*=", "/="), ("sin", "cos"), ("min", "max"), ("fmin", "fmax"),
             ("true", "false")]
SWAPS = dict(OPPOSITES + [pair[::-1] for pair in OPPOSITES])
SWAPPED = re.compile(r"(?<=\s)([-+*/<>]|[<>=!+*/-]=|&&|\|\|)(?=\s)|"
                     r"\b(sin|cos|f?min|f?max|true|false)\b")
NEGATION = re.compile(r"!(?=[\w(])")
CONDITION = re.compile(r"\b(?:if|while) \(")
NUMBER = re.compile(r"(?<![\w.])(?:0x[\da-fp]+|(\d+\.?\d*)(?:e[-+]?\d+)?)[fu]?(?![\w.])")


def other_number(number):
    """The last digit of the mantissa, at most the twelfth, one up, or 8 for 9."""
    digits = [i for i, c in enumerate(re.split("[epf]", number)[0] or number) if c.isdigit()]
    leading = sum(1 for _ in itertools.takewhile(lambda i: number[i] == "0", digits[:-1]))
    last = digits[leading:][:FIGURES_OF_A_NUMBER][-1]
    digit = 8 if number[last] == "9" else int(number[last]) + 1
    return number[:last] + str(digit) + number[last + 1:]


def closing(text, start):
    """Where the parenthesis closes that opens before start."""
    depth = 1
    while depth:
        depth += {"(": 1, ")": -1}.get(text[start], 0)
        start += 1
    return start - 1


def changes_of(path, every_figure):
    """All changes of a file, in its order, as (path, text, start, end, replacement)."""
    text = path.read_text()
    code = SKIPPED.sub(lambda m: re.sub(r"[^\n]", "\0", m[0]), text)
    found = [(m.start(), m.end(), SWAPS[m[0]]) for m in SWAPPED.finditer(code)]
    found += [(m.start(), m.end(), "") for m in NEGATION.finditer(code)]
    for m in CONDITION.finditer(code):
        end = closing(code, m.end())
        if ";" not in code[m.end():end]:
            found.append((m.end(), end, f"!({text[m.end():end]})"))
    for line in re.finditer(r"[^\n]+", code):
        numbers = list(NUMBER.finditer(code, line.start(), line.end()))
        if len(numbers) > 2 * FIGURES_OF_A_ROW and not every_figure:
            numbers = random.Random(line[0]).sample(numbers, FIGURES_OF_A_ROW)
        found += [(m.start(), m.end(), other_number(m[0])) for m in numbers]
    return [(path, text, *change) for change in sorted(found)]


def described(change):
    path, text, start, end, replacement = change
    first, last = text.rfind("\n", 0, start) + 1, text.find("\n", end)
    line = f"{text[first:start]}[{text[start:end]} => {replacement}]{text[end:last]}"
    return f"{path.relative_to(ROOT)}:{text.count(chr(10), 0, start) + 1}: {' '.join(line.split())}"


def succeeds(*command, seconds=None):
    try:
        return subprocess.run(["nice", *command], stdout=subprocess.DEVNULL,
                              stderr=subprocess.DEVNULL, timeout=seconds).returncode == 0
    except subprocess.TimeoutExpired:
        return False


class Build:
    """The library and its tests, built once. A change compiles what it concerns, and links again."""

    # The tests, the quick ones first, and what has the objects of their programs.
    PROGRAMS = {"tests/library/CMakeFiles/vantrel_tests.dir/": [
                    ["--gtest_filter=Golden.*", "--gtest_fail_fast"],
                    ["--gtest_filter=-Golden.*", "--gtest_fail_fast"]],
                "tests/bits/CMakeFiles/bits.dir/": [[ROOT / "tests/bits/digest.txt", os.devnull]],
                "tests/elementary/CMakeFiles/elementary.dir/": [["1000"]]}

    def __init__(self, folder, *flags):
        self.folder = folder
        self.flags = flags
        subprocess.run(["nice", "ninja", "-C", folder, "-j2", "vantrel_tests", "bits",
                        "elementary"],
                       check=True, stdout=subprocess.DEVNULL)
        listed = json.loads((folder / "compile_commands.json").read_text())
        commands = [shlex.split(entry["command"]) for entry in listed]
        self.commands = {c[c.index("-o") + 1]: c for c in commands}
        # Which files each object is made from, headers included.
        known = subprocess.run(["ninja", "-C", folder, "-t", "deps"], stdout=subprocess.PIPE,
                               text=True, check=True).stdout
        self.sources = {}
        for target, *files in map(str.splitlines, known.strip().split("\n\n")):
            self.sources[target.split(":")[0]] = {(folder / f.strip()).resolve() for f in files}

    def survives(self, change):
        """Whether the tests pass with the change, or as things are with None."""
        path, text, start, end, replacement = change or (None, "", 0, 0, "")
        with tempfile.TemporaryDirectory() as name:
            overlay = pathlib.Path(name)
            if change:
                changed = overlay / path.relative_to(ROOT)
                changed.parent.mkdir(parents=True)
                changed.write_text(text[:start] + replacement + text[end:])
            compiler = next(iter(self.commands.values()))[0]
            objects = {target: self.folder / target for target in self.commands}
            for target, files in self.sources.items():
                if path not in files:
                    continue
                objects[target] = overlay / target.replace("/", ".")
                arguments = [{str(path): changed, target: objects[target]}.get(a, a)
                             for a in self.commands[target][1:]]
                if not succeeds(compiler, f"-I{overlay / 'src'}", *arguments):
                    return False
            library = [o for t, o in objects.items() if t.startswith("CMakeFiles/Vantrel.dir/")]
            for prefix, runs in self.PROGRAMS.items():
                own = [o for t, o in objects.items() if t.startswith(prefix)]
                program = overlay / "program"
                # The tests have a file of the library in themselves: the first definition counts.
                if not succeeds(compiler, *self.flags, "-Wl,-z,muldefs", "-o", program, *own,
                                *library, "-lgtest_main", "-lgtest", "-lmpfr", "-pthread"):
                    return False
                if not all(succeeds(program, *run, seconds=SECONDS) for run in runs):
                    return False
            return True


def main():
    options = argparse.ArgumentParser(prog="scripts/mutate", description=__doc__)
    options.add_argument("paths", nargs="*", metavar="FILE", type=pathlib.Path,
                         help="a file or a folder of src/ (all of it)")
    options.add_argument("--sample", type=int, metavar="N", help="try N changes, always the same")
    options.add_argument("--all", action="store_true", help="change every figure of the tables")
    options.add_argument("--jobs", type=int, default=min(2, os.cpu_count()), metavar="N")
    options.add_argument("--list", action="store_true", help="list the changes, try none")
    chosen = options.parse_args()
    files = set()
    for path in [path.resolve() for path in chosen.paths] or [ROOT / "src"]:
        found = path.rglob("*") if path.is_dir() else [path]
        files.update(f for f in found if f.suffix in (".h", ".cpp") and f.is_file())
        if not path.is_relative_to(ROOT / "src") or not path.exists():
            options.error(f"{path} is not in src/")
    changes = [change for f in sorted(files) for change in changes_of(f, chosen.all)]
    if chosen.sample is not None and chosen.sample < len(changes):
        kept = random.Random(1).sample(range(len(changes)), chosen.sample)
        changes = [changes[i] for i in sorted(kept)]
    if chosen.list:
        print(*map(described, changes), sep="\n")
        return
    # What passes the fast build is tried again where sanitizers and argument checks report.
    builds = [Build(ROOT / "build-mutate"),
              Build(ROOT / "build-mutate-checked", "-fsanitize=address,undefined")]
    if not all(build.survives(None) for build in builds):
        sys.exit("The tests fail without any change.")

    def survives(change):
        return all(build.survives(change) for build in builds)

    killed = 0
    with concurrent.futures.ThreadPoolExecutor(chosen.jobs) as pool:
        for change, survived in zip(changes, pool.map(survives, changes)):
            killed += not survived
            if survived:
                print(described(change), flush=True)
    print(f"{killed} of {len(changes)} changes killed ({100 * killed / max(1, len(changes)):.1f} %)")


if __name__ == "__main__":
    main()
