"""Lets edid-decode check every composed EDID: it may find nothing but the listed deviations, and exactly where listed."""

import argparse
import fnmatch
import pathlib
import sys

import edid_decode
import edid_text

# The list of deviations holds the words of this one.
VERSION = "2022-03-30"


def read_deviations(path):
    """Tuples of severity, part, message pattern, name patterns, reason."""
    deviations = []
    for number, line in enumerate(pathlib.Path(path).read_text(encoding="utf-8").splitlines(), start=1):
        if not line.strip() or line.startswith("#"):
            continue
        fields = [field.strip() for field in line.split("|")]
        if len(fields) != 5 or not all(fields) or fields[0] not in ("failure", "warning"):
            sys.exit(f"{path}:{number}: not a severity, a part, a message, names and a reason")
        deviations.append((fields[0], fields[1], fields[2], fields[3].split(), fields[4]))
    return deviations


def is_meant(deviation, finding):
    return deviation[:2] == finding[:2] and fnmatch.fnmatchcase(finding[2], deviation[2])


def check(name, edid, deviations):
    """What is wrong with one EDID, as texts."""
    due = [deviation for deviation in deviations if any(fnmatch.fnmatchcase(name, where) for where in deviation[3])]
    found = edid_decode.findings(edid)
    problems = [
        f"{name}: {severity}, not listed: {part}: {message}"
        for severity, part, message in found
        if not any(is_meant(deviation, (severity, part, message)) for deviation in due)
    ]
    problems += [
        f"{name}: listed, but not found: {deviation[1]}: {deviation[2]}"
        for deviation in due
        if not any(is_meant(deviation, finding) for finding in found)
    ]
    return problems


def check_names(names, deviations):
    """Patterns that mean no EDID at all."""
    return [
        f"no golden is called {where}: {deviation[2]}"
        for deviation in deviations
        for where in deviation[3]
        if not fnmatch.filter(names, where)
    ]


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--goldens", required=True)
    parser.add_argument("--deviations", required=True)
    arguments = parser.parse_args()
    edid_decode.skip_if_absent()
    if edid_decode.version() != VERSION:
        edid_decode.skip(f"the deviations are listed for the edid-decode of {VERSION} (Debian 12), not for this one")

    deviations = read_deviations(arguments.deviations)
    goldens = edid_text.names_and_bytes(arguments.goldens, ".hex")
    problems = check_names([name for name, _ in goldens], deviations)
    for name, edid in goldens:
        problems += check(name, edid, deviations)
    print("\n".join(problems) or f"{len(goldens)} EDIDs, {len(deviations)} kinds of deviation, all of them listed")
    sys.exit(1 if problems else 0)


if __name__ == "__main__":
    main()
