"""Writes a sheet of so many patches: the tints of three inks, each with a little noise.

    sheet.py PATCHES [csv|cxf]
"""
import random
import sys

random.seed(7)
BANDS = range(400, 701, 10)
INKS = [[1 - 0.9 / (1 + ((nm - centre) / 50) ** 4) for nm in BANDS] for centre in (640, 540, 440)]


def patches(count):
    for i in range(count):
        tints = [round(100 * random.random(), 1) if i else 0 for _ in INKS]
        refl = [90.0] * len(BANDS)
        for tint, ink in zip(tints, INKS):
            refl = [r * (1 - tint / 100 * (1 - t)) for r, t in zip(refl, ink)]
        yield i, tints, [r + 0.05 * random.random() for r in refl]


def write_csv(count):
    print("name,CMYK_C,CMYK_M,CMYK_Y," + ",".join(f"nm{nm}" for nm in BANDS))
    for i, tints, refl in patches(count):
        print(f"Patch {i}," + ",".join(map(str, tints)) + "," + ",".join(f"{r:.4f}" for r in refl))


def write_cxf(count):
    print('<CxF xmlns="http://colorexchangeformat.com/CxF3-core"><Resources><ObjectCollection>')
    for i, tints, refl in patches(count):
        inks = "".join(f"<{ink}>{tint}</{ink}>"
                       for ink, tint in zip(("Cyan", "Magenta", "Yellow"), tints))
        values = " ".join(f"{r / 100:.4f}" for r in refl)
        print(f'<Object ObjectType="Target" Name="Patch {i}" Id="o{i}"><ColorValues>'
              f'<ReflectanceSpectrum ColorSpecification="S">{values}</ReflectanceSpectrum>'
              f'</ColorValues><DeviceColorValues><ColorCMYK>{inks}<Black>0</Black></ColorCMYK>'
              '</DeviceColorValues></Object>')
    print('</ObjectCollection><ColorSpecificationCollection><ColorSpecification Id="S">'
          '<MeasurementSpec><WavelengthRange StartWL="400" Increment="10"/></MeasurementSpec>'
          '</ColorSpecification></ColorSpecificationCollection></Resources></CxF>')


{"csv": write_csv, "cxf": write_cxf}[sys.argv[2] if len(sys.argv) > 2 else "csv"](int(sys.argv[1]))
