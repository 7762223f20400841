"""The program's table of VICs above the library's, row by row, against edid-decode's."""

import argparse
import pathlib
import re
import shutil
import subprocess
import sys

SKIPPED = 77
ROW = re.compile(r"\{(\d+), (\d+), (\d+), \"([\d:]+)\", (\d+), (\d+)\}")
LISTED = re.compile(r"VIC\s+(\d+):\s+(\d+)x(\d+)(i?)\s+([\d.]+) Hz\s+([\d:]+)\s+[\d.]+ kHz\s+([\d.]+) MHz")
FIRST_VIC = 65


def own_rows(table):
    return {int(vic): (int(width), int(lines), aspect, int(clock), int(rate))
            for vic, width, lines, aspect, clock, rate in ROW.findall(table.read_text())}


def listed_rows():
    listing = subprocess.run(["edid-decode", "--list-vics"], capture_output=True, text=True, check=True).stdout
    rows = {}
    for vic, width, lines, interlaced, rate, aspect, clock in LISTED.findall(listing):
        if int(vic) >= FIRST_VIC and not interlaced:
            rows[int(vic)] = (int(width), int(lines), aspect, round(float(clock) * 1000), round(float(rate) * 1000))
    return rows


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--table", type=pathlib.Path, required=True)
    own = own_rows(parser.parse_args().table)
    if shutil.which("edid-decode") is None:
        print("skipped: edid-decode not installed (Debian: edid-decode)")
        return SKIPPED
    listed = listed_rows()
    if len(listed) < 90:
        print(f"edid-decode lists {len(listed)} VICs from {FIRST_VIC} on only")
        return 1
    wrong = [vic for vic in sorted(own.keys() | listed.keys()) if own.get(vic) != listed.get(vic)]
    for vic in wrong:
        print(f"VIC {vic}: {own.get(vic)}, and edid-decode has {listed.get(vic)}")
    print(f"{len(own)} VICs compared, {len(wrong)} differ")
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main())
