#!/usr/bin/env python3
"""Holds docs/quirks.md to the sources: each `kept:` comment of src/ has its row and each row its comment, in the same
words; each failure that edid-decode may find in the goldens has its row, and no other row says that they have it."""

import argparse
import collections
import pathlib
import re
import sys

import markdown

KEPT = re.compile(r"(?://+|\.) kept: (.*?)\.?$", re.MULTILINE)
LINK = re.compile(r"\[[^]]*\]\(\.\./(\S+)\)")


def kept_in_sources(source):
    """Each quirk as file and words, with how often it is there."""
    return collections.Counter((str(file.relative_to(source)), words)
                               for file in sorted((source / "src").rglob("*"))
                               if file.suffix in (".cpp", ".h")
                               for words in KEPT.findall(file.read_text()))


def kept_in_page(text):
    rows = [row for table in markdown.tables(text) for row in table if "Kept" in row]
    return collections.Counter((LINK.search(row["Where"])[1], row["Kept"].strip("`")) for row in rows)


def failure_of_golden(message):
    """The message without what differs from one EDID to the next."""
    return re.sub(r"(Vertical Freq|Maximum Clock):.*", r"\1", message.replace("#3", "#?"))


def failures_of_goldens(text):
    rows = [line.split(" | ") for line in text.splitlines() if line.startswith("failure |")]
    return {failure_of_golden(row[2]) for row in rows}


def failures_in_page(text):
    rows = [row for table in markdown.tables(text) for row in table if "Failure" in row]
    return {row["Failure"].strip("`") for row in rows if row["In the samples"] == "yes"}


def differences(here, there, name_here, name_there):
    yield from (f"only in {name_here}: {entry}" for entry in here - there)
    yield from (f"only in {name_there}: {entry}" for entry in there - here)


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--source", type=pathlib.Path, required=True)
    source = parser.parse_args().source
    page = (source / "docs" / "quirks.md").read_text()
    deviations = (source / "tests" / "independent" / "deviations.txt").read_text()

    kept, failures = kept_in_sources(source), failures_of_goldens(deviations)
    found = list(differences(kept, kept_in_page(page), "src", "quirks.md"))
    found += differences(failures, failures_in_page(page), "deviations.txt", "quirks.md")
    if not kept or not failures:
        found.append("no kept comment or no failure was found: is this script still right?")
    for problem in found:
        print(problem, file=sys.stderr)
    print(f"{kept.total()} quirks, {len(failures)} failures of edid-decode: {len(found)} problems")
    return 1 if found else 0


if __name__ == "__main__":
    sys.exit(main())
