"""Counts the instructions of commands on a sheet and on one of twice the size, by callgrind: where one
takes more than 2.5 times as many the cost is not in proportion. --long takes larger sheets.

    growth.py [--long] PROGRAM
"""
import pathlib
import re
import subprocess
import sys
import tempfile

MOST = 2.5
NM = range(400, 701, 10)
BANDS = [f"SPECTRAL_NM{nm}" for nm in NM]


def spectrum(i, by=","):
    return by.join(f"{20 + (i * 37 + nm) % 61 + nm / 1000:.3f}" for nm in NM)


def cgats(size):
    rows = "\n".join(f"{i}\t\"Patch {i}\"\t{i % 101}\t{spectrum(i, chr(9))}" for i in range(size))
    return ("CGATS.17\nBEGIN_DATA_FORMAT\nSAMPLE_ID SAMPLE_NAME CMYK_C " + " ".join(BANDS)
            + f"\nEND_DATA_FORMAT\nBEGIN_DATA\n{rows}\nEND_DATA\n")


def keywords(size):
    return "".join(f"KEYWORD \"OWN_{i}\"\nOWN_{i} \"{i}\"\n" for i in range(size)) + cgats(2)


def table(size):
    return "id,name," + ",".join(map(str, NM)) + "\n" + "".join(
        f"{i},Patch {i % 50},{spectrum(i)}\n" for i in range(size))


def inks(size):
    head = ",".join(f"SPOT_{i}" for i in range(size))
    return f"SAMPLE_ID,{head}," + ",".join(BANDS) + "\n" + "".join(
        f"{row}," + ",".join(str((i + row) % 99 + 1) for i in range(size)) + f",{spectrum(row)}\n"
        for row in range(4))


def named_inks(size):
    return "name,ink,tint," + ",".join(map(str, NM)) + "\n" + "".join(
        f"Solid {i},Ink {i},100,{spectrum(i)}\nTint {i},Ink {i},50,{spectrum(i + 7)}\n"
        for i in range(size // 2))


def cxf(objects, resources=""):
    return ('<CxF xmlns="http://colorexchangeformat.com/CxF3-core"><Resources><ObjectCollection>'
            + "".join(objects) + '</ObjectCollection><ColorSpecificationCollection>'
            '<ColorSpecification Id="S"><MeasurementSpec><WavelengthRange StartWL="400" '
            'Increment="10"/></MeasurementSpec></ColorSpecification></ColorSpecificationCollection>'
            f'</Resources>{resources}</CxF>')


def cxf_object(i):
    return (f'<Object ObjectType="Target" Name="Patch {i}" Id="o{i}"><ColorValues>'
            f'<ReflectanceSpectrum ColorSpecification="S">{spectrum(i, " ")}</ReflectanceSpectrum>'
            f'</ColorValues><DeviceColorValues><ColorCMYK><Cyan>{i % 101}</Cyan></ColorCMYK>'
            '</DeviceColorValues></Object>')


def cxf_objects(size):
    return cxf(map(cxf_object, range(size)))


def cxf_tints(size):
    steps = "".join(f'<Tint><ObjectRef>o{i}</ObjectRef><Percentage>{i % 101}</Percentage></Tint>'
                    for i in range(size))
    return cxf(map(cxf_object, range(size)),
               f'<CustomResources><SpotInkCharacterisation SpotInkName="Gold">{steps}'
               '</SpotInkCharacterisation></CustomResources>')


# a sheet, how long it is, and the commands
CASES = [
    (cgats, 150, ["report {}", "report {} --format json", "report {} --format cgats",
                  "compare {} {} --all", "compare {} {} --format json",
                  "predict {} --ink CMYK_C:40"]),
    (keywords, 1500, ["report {}"]),
    (table, 150, ["report {} --format csv", "compare {} {} --format csv"]),
    (inks, 2500, ["report {} --format csv"]),
    (named_inks, 300, ["report {} --format json"]),
    (cxf_objects, 150, ["report {} --format csv"]),
    (cxf_tints, 1000, ["report {}"]),
]


def instructions(program, command, file):
    words = [word.replace("{}", str(file)) for word in command.split()]
    done = subprocess.run(["valgrind", "--tool=callgrind", "--callgrind-out-file=/dev/null", program,
                           *words], capture_output=True, check=False)
    counted = re.search(rb"Collected : (\d+)", done.stderr)
    if done.returncode > 1 or not done.stdout or not counted:
        sys.exit(f"{command}: {done.stderr.decode()[-2000:]}")
    return int(counted[1])


def main():
    long = "--long" in sys.argv
    program = sys.argv[-1]
    failed = False
    with tempfile.TemporaryDirectory() as folder:
        small, twice = pathlib.Path(folder) / "small", pathlib.Path(folder) / "twice"
        for sheet, size, commands in CASES:
            size *= 8 if long else 1
            small.write_text(sheet(size), encoding="utf-8")
            twice.write_text(sheet(2 * size), encoding="utf-8")
            for command in commands:
                one, two = (instructions(program, command, file) for file in (small, twice))
                bad = two > MOST * one
                failed |= bad
                print(f"{two / one:5.2f} times {one / 1e6:6.0f} million: {command}, {sheet.__name__} of "
                      f"{2 * size} beside {size}{': TOO MUCH' if bad else ''}", flush=True)
    return failed


sys.exit(main())
