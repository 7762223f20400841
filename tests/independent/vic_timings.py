"""The listing that the library's timings of VICs above 64 are tested against: it must be what edid-decode prints."""

import argparse
import difflib
import pathlib
import subprocess
import sys

import edid_decode

VICS = [*range(65, 128), *range(193, 220)]


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--listing", type=pathlib.Path, required=True)
    listing = parser.parse_args().listing.read_text()
    edid_decode.skip_if_absent()
    options = [word for vic in VICS for word in ("--vic", str(vic))]
    printed = subprocess.run([edid_decode.PROGRAM, *options], capture_output=True, text=True, check=True).stdout
    if listing == printed:
        print(f"{len(VICS)} VICs are as listed")
        return 0
    sys.stdout.writelines(difflib.unified_diff(listing.splitlines(True), printed.splitlines(True), "listed", "printed"))
    return 1


if __name__ == "__main__":
    sys.exit(main())
