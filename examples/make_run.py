"""Makes the sheets of a press run, as a measuring device would write them: make_run.py FOLDER

Ten sheets of a control strip in six zones, seven minutes apart, and aims.txt, the strip as it is to
be. In them stand what goes wrong at a press: magenta runs 0.8 % fuller from sheet to sheet, zone 3
prints 8 % more magenta, sheet 6 has 10 % less cyan, sheet 8 lost zone 5, sheet 9 is on another paper.
"""
import math
import pathlib
import random
import sys

WAVELENGTHS = range(400, 701, 10)
# Absorption: each ink's densest value, and (peak in nm, width, height) of its bands.
INKS = {
    "C": (1.8, [(625, 60, 1), (420, 45, 0.18)]),
    "M": (1.95, [(545, 45, 1), (435, 40, 0.25)]),
    "Y": (1.6, [(430, 52, 1)]),
    "K": (1.85, [(550, 900, 1)]),
}
STRIP = [{}, {"C": 100}, {"M": 100}, {"Y": 100}, {"K": 100},
         {"C": 50}, {"C": 75}, {"M": 50}, {"M": 75}, {"Y": 50}, {"Y": 75}, {"K": 50}, {"K": 75},
         {"M": 100, "Y": 100}, {"C": 100, "Y": 100}, {"C": 100, "M": 100},
         {"C": 50, "M": 40, "Y": 40}, {"C": 75, "M": 66, "Y": 66}]
ZONES = range(1, 7)
N = 1.8  # Yule and Nielsen's factor


def paper(nm, yellower=0.0):
    return (0.9 - 0.25 * math.exp(-(nm - 390) / 18)) * (1 - yellower * math.exp(-(nm - 400) / 60))


def density(ink, nm):
    peak, bands = INKS[ink]
    return peak * sum(height * math.exp(-((nm - centre) / width) ** 2)
                      for centre, width, height in bands)


def dots(percent):
    area = percent / 100
    return area + 0.2 * area * (1 - area)


def reflectance(inks, films, nm, yellower):
    """Neugebauer's mean over the overprints of all solids, in the power of 1/n."""
    mixed = 1.0
    for ink, percent in inks.items():
        area = dots(percent)
        mixed *= 1 - area + area * 10 ** (-density(ink, nm) * films.get(ink, 1) / N)
    return 100 * paper(nm, yellower) * mixed ** N


def name(inks, zone):
    words = " ".join(f"{ink}{percent}" for ink, percent in inks.items()) or "Paper"
    return f"{words} Z{zone}" if zone else words


def sheet(created, patches):
    rows = [f'CGATS.17\nORIGINATOR\t"made up"\nCREATED\t"{created}"\nJOB\t"spring catalogue"\n'
            f'INSTRUMENTATION\t"scanning table, 45/0"\nFILTER\t"M1"\n'
            f"NUMBER_OF_FIELDS\t{6 + len(WAVELENGTHS)}\nBEGIN_DATA_FORMAT",
            "\t".join(["SAMPLE_ID", "SAMPLE_NAME", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K",
                       *(f"SPECTRAL_NM{nm}" for nm in WAVELENGTHS)]),
            f"END_DATA_FORMAT\nNUMBER_OF_SETS\t{len(patches)}\nBEGIN_DATA"]
    for number, (inks, zone, values) in enumerate(patches, 1):
        device = [str(inks.get(ink, 0)) for ink in "CMYK"]
        rows.append("\t".join([str(number), f'"{name(inks, zone)}"', *device,
                               *(f"{value:.2f}" for value in values)]))
    return "\n".join(rows) + "\nEND_DATA\n"


def spectrum(inks, films, yellower=0.0):
    return [reflectance(inks, films, nm, yellower) for nm in WAVELENGTHS]


def main(folder):
    folder.mkdir(parents=True, exist_ok=True)
    aims = [(inks, None, spectrum(inks, {})) for inks in STRIP]
    (folder / "aims.txt").write_text(sheet("2026-03-02 07:30:00", aims))
    noise = random.Random(20260302)
    for number in range(1, 11):
        patches = []
        for zone in ZONES:
            films = {ink: 1 + 0.01 * (noise.random() - 0.5) for ink in INKS}
            films["M"] *= 1 + 0.008 * (number - 1)
            if zone == 3:
                films["M"] *= 1.08
            if number == 6:
                films["C"] *= 0.9
            if number == 8 and zone == 5:
                continue
            for inks in STRIP:
                values = spectrum(inks, films, 0.06 if number == 9 else 0.0)
                patches.append((inks, zone, [v * (1 + 0.002 * (noise.random() - 0.5))
                                             for v in values]))
        minutes = 7 * number
        created = f"2026-03-02 {8 + minutes // 60:02}:{minutes % 60:02}:00"
        (folder / f"sheet_{number:02}.txt").write_text(sheet(created, patches))


if __name__ == "__main__":
    if len(sys.argv) != 2:
        sys.exit(__doc__)
    main(pathlib.Path(sys.argv[1]))
