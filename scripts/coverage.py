"""Compares the branches that gcovr counted with the list of those that no test can take."""

import json
import pathlib
import sys

counted, listed = map(pathlib.Path, sys.argv[1:])

# FILE: TEXT OF THE LINE: HOW MANY, then the reason in lines that are indented.
excused = {}
for line in listed.read_text().splitlines():
    if line and not line.startswith(("#", " ")):
        place, _, count = line.rpartition(": ")
        excused[place] = int(count)

total = untaken = 0
faults = []
for file in json.loads(counted.read_text())["files"]:
    text = pathlib.Path(file["file"]).read_text().splitlines()
    for line in file["lines"]:
        counts = [branch["count"] for branch in line["branches"]]
        total += len(counts)
        missed = counts.count(0)
        untaken += missed
        where = f"{file['file']}: {text[line['line_number'] - 1].strip()}"
        if missed != excused.pop(where, 0):
            faults.append(f"{missed} branches untaken in {where}")
faults += [f"excused, but taken or gone: {place}" for place in excused]

print(*faults, f"{total - untaken} of {total} branches of src/ taken", sep="\n")
sys.exit(bool(faults) or not total)
