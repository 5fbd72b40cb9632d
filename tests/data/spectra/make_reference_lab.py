#!/usr/bin/python3
"""Writes reference_lab_tcs.txt: the CIE test colour samples on several
wavelength grids and ranges, with the L*a*b* (D50, CIE 1931 2 degree) that
ArgyllCMS spec2cie computes for each.

Input:  /usr/share/colord/ref/CIE-TCS.sp (Debian package colord-data): 15
        measured reflectance spectra, 360..830 nm in 5 nm steps.
Tool:   spec2cie (Debian package argyll), run as
        spec2cie -i D50 -o 1931_2 -n in.ti3 out.ti3
Every set is taken from the published 5 nm values themselves (every second or
fourth point, or a shorter range); nothing is interpolated here.

Run from anywhere: /usr/bin/python3 tests/data/spectra/make_reference_lab.py
"""
from decimal import Decimal
import os
import subprocess
import sys
import tempfile

SOURCE = "/usr/share/colord/ref/CIE-TCS.sp"
HERE = os.path.dirname(os.path.abspath(__file__))
OUTPUT = os.path.join(HERE, "reference_lab_tcs.txt")

# name, first nm, last nm, step nm
SETS = [
    ("5nm_360_830", 360, 830, 5),
    ("5nm_380_780", 380, 780, 5),
    ("10nm_380_780", 380, 780, 10),
    ("20nm_380_780", 380, 780, 20),
    ("10nm_360_780", 360, 780, 10),
    ("10nm_380_730", 380, 730, 10),
    ("10nm_400_700", 400, 700, 10),
]


def read_tcs(path):
    lines = open(path, encoding="ascii").read().splitlines()
    fields = lines[lines.index("BEGIN_DATA_FORMAT") + 1].split()
    wavelengths = [int(f[len("SPEC_"):]) for f in fields[1:]]
    begin = lines.index("BEGIN_DATA")
    end = lines.index("END_DATA")
    samples = []
    for line in lines[begin + 1:end]:
        words = line.split()
        samples.append((words[0], dict(zip(wavelengths, words[1:]))))
    return samples


def run_spec2cie(samples, first, last, step, workdir):
    grid = list(range(first, last + 1, step))
    source = os.path.join(workdir, "in.ti3")
    target = os.path.join(workdir, "out.ti3")
    with open(source, "w", encoding="ascii") as out:
        out.write("CTI3\n\nDESCRIPTOR \"CIE test colour samples\"\n")
        out.write("DEVICE_CLASS \"OUTPUT\"\nCOLOR_REP \"RGB_XYZ\"\n")
        out.write("SPECTRAL_BANDS \"%d\"\n" % len(grid))
        out.write("SPECTRAL_START_NM \"%d.000000\"\n" % first)
        out.write("SPECTRAL_END_NM \"%d.000000\"\n" % last)
        out.write("SPECTRAL_NORM \"100.000000\"\n\n")
        out.write("NUMBER_OF_FIELDS %d\nBEGIN_DATA_FORMAT\n" % (7 + len(grid)))
        out.write("SAMPLE_ID RGB_R RGB_G RGB_B XYZ_X XYZ_Y XYZ_Z ")
        out.write(" ".join("SPEC_%d" % nm for nm in grid) + "\nEND_DATA_FORMAT\n\n")
        out.write("NUMBER_OF_SETS %d\nBEGIN_DATA\n" % len(samples))
        for number, (_, values) in enumerate(samples, 1):
            out.write("%d 0 0 0 0 0 0 " % number)
            # The tool reads reflectance in percent.
            out.write(" ".join(str(Decimal(values[nm]) * 100) for nm in grid) + "\n")
        out.write("END_DATA\n")
    subprocess.run(["spec2cie", "-i", "D50", "-o", "1931_2", "-n", source, target],
                   check=True, stdout=subprocess.DEVNULL)
    lines = open(target, encoding="ascii").read().splitlines()
    fields = lines[lines.index("BEGIN_DATA_FORMAT") + 1].split()
    at = fields.index("LAB_L")
    rows = lines[lines.index("BEGIN_DATA") + 1:lines.index("END_DATA")]
    return [row.split()[at:at + 3] for row in rows], grid


def main():
    samples = read_tcs(SOURCE)
    version = subprocess.run(["dpkg-query", "-W", "-f=${Version}", "argyll"],
                             capture_output=True, text=True, check=True).stdout
    data_version = subprocess.run(["dpkg-query", "-W", "-f=${Version}", "colord-data"],
                                  capture_output=True, text=True, check=True).stdout
    with tempfile.TemporaryDirectory() as workdir, open(OUTPUT, "w", encoding="ascii") as out:
        out.write(
            "# Reference CIE L*a*b* (D50, CIE 1931 2 degree observer) of the 15 CIE test\n"
            "# colour samples, taken on several wavelength grids and ranges.\n"
            "#\n"
            "# Provenance\n"
            "#   spectra:  %s (Debian package colord-data %s),\n"
            "#             measured reflectance factors, 360..830 nm in 5 nm steps; each set\n"
            "#             below takes the published values at its own wavelengths\n"
            "#   tool:     spec2cie from ArgyllCMS (Debian package argyll %s)\n"
            "#   command:  spec2cie -i D50 -o 1931_2 -n in.ti3 out.ti3, one run per set\n"
            "#   script:   make_reference_lab.py beside this file writes this file anew\n"
            "#\n"
            "# \"set NAME FIRST LAST STEP\" starts a set (wavelengths in nm); each line after\n"
            "# it is one sample: name, L*, a*, b* as printed by the tool, then the\n"
            "# reflectance factors (1.0 = perfect white) from FIRST to LAST nm.\n"
            % (SOURCE, data_version, version))
        for name, first, last, step in SETS:
            labs, grid = run_spec2cie(samples, first, last, step, workdir)
            out.write("set %s %d %d %d\n" % (name, first, last, step))
            for (sample, values), lab in zip(samples, labs):
                out.write(" ".join([sample] + lab + [values[nm] for nm in grid]) + "\n")
    print("wrote", OUTPUT)


if __name__ == "__main__":
    sys.exit(main())
