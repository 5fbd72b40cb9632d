#!/usr/bin/env python3
"""Writes the bundled example charts: a press proof (CMYK with spectra), the
same sheet measured on press (spectra only) and its target file (CMYK only).

The spectra come from a small model: paper with an optical brightener, four
process inks described by their spectral transmittance, dot gain, and the
reflectance of a patch as paper times the product of each ink's coverage
mix. A seeded random generator adds a little measurement noise, so the files
are the same on every run.

    python3 examples/generate_charts.py
"""
import math
import random
from pathlib import Path

HERE = Path(__file__).resolve().parent
WAVELENGTHS = list(range(380, 731, 10))
STRIPS, COLS = 4, 12


def sigmoid(x):
    return 1.0 / (1.0 + math.exp(-x))


def gauss(x, centre, width):
    return math.exp(-((x - centre) / width) ** 2)


def paper(nm):
    base = 0.88 - 0.30 * sigmoid((405 - nm) / 8.0)
    return base + 0.05 * gauss(nm, 445, 18)


INKS = {
    "c": lambda nm: 0.10 + 0.82 * sigmoid((575 - nm) / 18.0) - 0.12 * gauss(nm, 400, 25),
    "m": lambda nm: 0.95 - 0.88 * gauss(nm, 545, 48) - 0.15 * gauss(nm, 420, 30),
    "y": lambda nm: 0.06 + 0.90 * sigmoid((nm - 492) / 11.0),
    "k": lambda nm: 0.16 + 0.01 * (nm - 380) / 350.0,
}


def dot_area(tone, gain):
    t = tone / 100.0
    return min(1.0, t + gain * 4.0 * t * (1.0 - t))


def reflectance(cmyk, gain, shift, rng, noise):
    values = []
    for nm in WAVELENGTHS:
        r = paper(nm)
        for ink, tone in zip("cmyk", cmyk):
            a = dot_area(tone, gain)
            t = INKS[ink](nm + shift.get(ink, 0.0))
            r *= 1.0 - a + a * t * t
        r += rng.uniform(-noise, noise)
        values.append(max(0.001, r))
    return values


def patch_list():
    patches = []
    for name, index in (("Cyan", 0), ("Magenta", 1), ("Yellow", 2), ("Black", 3)):
        for tone in (25, 50, 75, 100):
            cmyk = [0, 0, 0, 0]
            cmyk[index] = tone
            patches.append((f"{name} {tone}", tuple(cmyk)))
    patches += [
        ("Red", (0, 100, 100, 0)),
        ("Green", (100, 0, 100, 0)),
        ("Blue", (100, 100, 0, 0)),
        ("Red 50", (0, 50, 50, 0)),
        ("Green 50", (50, 0, 50, 0)),
        ("Blue 50", (50, 50, 0, 0)),
        ("CMY grey 25", (25, 19, 19, 0)),
        ("CMY grey 50", (50, 40, 40, 0)),
        ("CMY grey 75", (75, 64, 64, 0)),
        ("Rich black", (60, 40, 40, 100)),
        ("Black 10", (0, 0, 0, 10)),
        ("Black 90", (0, 0, 0, 90)),
        ("Skin", (5, 30, 35, 0)),
        ("Sky", (60, 20, 0, 0)),
        ("Leaf", (70, 10, 90, 10)),
        ("Brick", (20, 80, 90, 10)),
        ("Violet", (70, 90, 0, 0)),
        ("Orange", (0, 60, 100, 0)),
        ("Olive", (40, 30, 100, 20)),
        ("Teal", (90, 20, 50, 10)),
        ("Sand", (10, 15, 40, 0)),
        ("Plum", (45, 85, 30, 15)),
        ("Stone", (30, 25, 30, 10)),
        ("Cream", (0, 5, 20, 0)),
        ("Navy", (100, 80, 20, 30)),
        ("Peach", (0, 25, 30, 0)),
        ("Cyan 10", (10, 0, 0, 0)),
        ("Lilac", (20, 40, 0, 0)),
        ("Moss", (40, 20, 80, 30)),
        ("Rose", (0, 50, 20, 0)),
        ("Ice", (20, 0, 5, 0)),
        ("Paper", (0, 0, 0, 0)),
    ]
    assert len(patches) == STRIPS * COLS, len(patches)
    # Values are split at blanks whatever their quotes, so names carry none.
    return [(name.replace(" ", "-"), cmyk) for name, cmyk in patches]


def header(lines, descriptor, fields, count, layout=True):
    lines += [
        "CGATS.17",
        'ORIGINATOR\t"Redavudeva example generator"',
        f'DESCRIPTOR\t"{descriptor}"',
        'CREATED\t"2026-12-06"',
        'MANUFACTURER\t"Redavudeva"',
        'PROD_DATE\t"2026-12"',
        'MEASUREMENT_SOURCE\t"Illumination=D50 ObserverAngle=2 WhiteBase=Abs"',
        "# Written by examples/generate_charts.py",
    ]
    if layout:
        lines += [
            'KEYWORD\t"NUMBER_OF_STRIPS"',
            f"NUMBER_OF_STRIPS\t{STRIPS}",
            'KEYWORD\t"NUMBER_OF_COLS"',
            f"NUMBER_OF_COLS\t{COLS}",
        ]
    lines += [
        f"NUMBER_OF_FIELDS\t{len(fields)}",
        "BEGIN_DATA_FORMAT",
        "\t".join(fields),
        "END_DATA_FORMAT",
        f"NUMBER_OF_SETS\t{count}",
        "BEGIN_DATA",
    ]


def write(path, lines):
    path.write_text("\n".join(lines) + "\n", encoding="utf-8", newline="\n")
    print(f"wrote {path.relative_to(HERE.parent)}")


def main():
    patches = patch_list()
    spectral = [f"SPECTRAL_NM_{nm}" for nm in WAVELENGTHS]

    # The proof: CMYK device values and the proof's spectra.
    rng = random.Random(20261206)
    fields = ["SAMPLE_ID", "SAMPLE_NAME", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"] + spectral
    lines = []
    header(lines, "Press proof, coated paper, 48 patches", fields, len(patches))
    lines[8:8] = [
        'KEYWORD\t"PROCESSCOLOR_ID"',
        'PROCESSCOLOR_ID\t"1 Cyan"',
        'PROCESSCOLOR_ID\t"2 Magenta"',
        'PROCESSCOLOR_ID\t"3 Yellow"',
        'PROCESSCOLOR_ID\t"4 Black"',
    ]
    for number, (name, cmyk) in enumerate(patches, start=1):
        values = reflectance(cmyk, 0.12, {}, rng, 0.0015)
        row = [str(number), f'"{name}"'] + [f"{v:.2f}" for v in cmyk]
        row += [f"{v:.4f}" for v in values]
        lines.append("\t".join(row))
    lines.append("END_DATA")
    write(HERE / "press_proof.it8", lines)

    # The press sheet as measured: more dot gain and a slightly warmer magenta.
    rng = random.Random(7)
    fields = ["SAMPLE_ID", "SAMPLE_NAME"] + spectral
    lines = []
    header(lines, "Press sheet measured, 48 patches", fields, len(patches))
    for number, (name, cmyk) in enumerate(patches, start=1):
        values = reflectance(cmyk, 0.17, {"m": -6.0}, rng, 0.003)
        row = [str(number), f'"{name}"'] + [f"{v:.4f}" for v in values]
        lines.append("\t".join(row))
    lines.append("END_DATA")
    write(HERE / "press_sheet.it8", lines)

    # The target file of the sheet: device values only, as sent to the press.
    fields = ["SAMPLE_ID", "SAMPLE_NAME", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"]
    lines = []
    header(lines, "Press target, 48 patches", fields, len(patches))
    for number, (name, cmyk) in enumerate(patches, start=1):
        lines.append("\t".join([str(number), f'"{name}"'] + [f"{v:.2f}" for v in cmyk]))
    lines.append("END_DATA")
    write(HERE / "press_target.it8", lines)


if __name__ == "__main__":
    main()
