#!/usr/bin/env python3
"""Compares what the library has put out on other machines with what it has on the first one, and shows it as a table, or
writes that into a page between its marks. Exit status 0: all of it is equal, and all tests passed."""

import argparse
import pathlib
import re
import sys

BEGIN, END = "<!-- table of scripts/test_targets.sh -->", "<!-- end of the table -->"
# The one line of a composition that shows an address, which is another one wherever memory is.
ADDRESS = re.compile(r"(contains no entries\. List:)0x[0-9a-f]+")


def outputs(build):
    """Each composition's bytes and other lines, in order."""
    text = ADDRESS.sub(r"\1ADDRESS", (build / "outputs.txt").read_text(encoding="latin-1"))
    compositions = []
    for composition in re.split(r"(?m)^composition \d+\n", text)[1:]:
        lines = composition.split("\n")
        compositions.append(([line for line in lines if line.startswith("bytes:")],
                             [line for line in lines if not line.startswith("bytes:")]))
    return compositions


def tests_of(build):
    """How many tests, compositions not counted, have passed of how many."""
    log = (build / "Testing/Temporary/LastTest.log").read_text(encoding="utf-8", errors="replace")
    passed = [int(count) for count in re.findall(r"(?m)^\[  PASSED  \] (\d+) tests?\.", log)]
    run = [int(count) for count in re.findall(r"(?m)^\[==========\] (\d+) tests? from", log)]
    seeds = [int(count) for count in re.findall(r"(?m)^replayed (\d+) inputs", log)]
    failed = len(re.findall(r"(?m)^Test Failed\.", log))
    return sum(passed), sum(run), sum(seeds), failed


def row(target, build, reference):
    """A row of the table, and whether all is well."""
    passed, run, seeds, failed = tests_of(build)
    other = outputs(build)
    count = len(reference)
    equal_bytes = sum(mine[0] == theirs[0] for mine, theirs in zip(other, reference, strict=False))
    equal_lines = sum(mine[1] == theirs[1] for mine, theirs in zip(other, reference, strict=False))
    stripped = build / "stripped.so"
    size = f"{stripped.stat().st_size:,}" if stripped.exists() else "static"
    tests = f"{passed:,} of {run:,}" if run else "-"
    well = passed == run and seeds > 0 and not failed and (equal_bytes, equal_lines, len(other)) == (count,) * 3
    cells = (f"`{target}`", tests, f"{seeds:,}", f"{equal_bytes:,} of {count:,}", f"{equal_lines:,} of {count:,}", size)
    return f"| {' | '.join(cells)} |", well


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--builds", type=pathlib.Path, required=True, help="folder with a build for each target")
    parser.add_argument("--page", type=pathlib.Path, help="the page to write the table into")
    parser.add_argument("targets", nargs="+", help="what the others are compared with first")
    arguments = parser.parse_args()

    reference = outputs(arguments.builds / arguments.targets[0])
    rows = [row(target, arguments.builds / target, reference) for target in arguments.targets]
    printed = sum(len(lines) for _, lines in reference)
    table = "\n".join([f"{len(reference):,} compositions print {printed:,} lines.", "",
                       "| Target | Tests passed | Fuzz seeds | Bytes equal | Lines equal | Stripped, bytes |",
                       "| --- | ---: | ---: | ---: | ---: | ---: |", *(cells for cells, _ in rows)])
    print(table)
    if not reference or not all(well for _, well in rows):
        print("Something differs or has failed.", file=sys.stderr)
        return 1
    if arguments.page:
        text = arguments.page.read_text(encoding="utf-8")
        before, _, rest = text.partition(BEGIN)
        _, _, after = rest.partition(END)
        arguments.page.write_text(f"{before}{BEGIN}\n{table}\n{END}{after}", encoding="utf-8")
    return 0


if __name__ == "__main__":
    sys.exit(main())
