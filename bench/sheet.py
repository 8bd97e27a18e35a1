"""Writes a CSV sheet of so many patches: the tints of three inks, each with a little noise."""
import random
import sys

random.seed(7)
BANDS = range(400, 701, 10)
print("name,CMYK_C,CMYK_M,CMYK_Y," + ",".join(f"nm{nm}" for nm in BANDS))
INKS = [[1 - 0.9 / (1 + ((nm - centre) / 50) ** 4) for nm in BANDS] for centre in (640, 540, 440)]
for i in range(int(sys.argv[1])):
    tints = [round(100 * random.random(), 1) if i else 0 for _ in INKS]
    refl = [90.0] * len(BANDS)
    for tint, ink in zip(tints, INKS):
        refl = [r * (1 - tint / 100 * (1 - t)) for r, t in zip(refl, ink)]
    values = ",".join(f"{r + 0.05 * random.random():.4f}" for r in refl)
    print(f"Patch {i}," + ",".join(map(str, tints)) + "," + values)
