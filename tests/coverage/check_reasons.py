#!/usr/bin/env python3
"""Compares the branches that no test takes with those that docs/testing.md gives a reason for.

usage: check_reasons.py COVERAGE.json TREE

COVERAGE.json is what gcovr --json writes. Branches are named by their file and the text of their line, as line numbers
don't last. Exit status 0: both lists are the same.
"""

import json
import pathlib
import re
import sys

ROW = re.compile(r"^\| `(?P<file>src/[^`]+)` \| `(?P<line>.+)` \| (?P<reason>.+) \|$")


def open_branches(report, tree):
    """File and line text of each branch that was never taken."""
    found = set()
    for file in report["files"]:
        lines = (tree / file["file"]).read_text().splitlines()
        for line in file["lines"]:
            if any(branch["count"] == 0 and not branch.get("throw") for branch in line["branches"]):
                found.add((file["file"], lines[line["line_number"] - 1].strip()))
    return found


def explained_branches(page):
    """Those of the page's table."""
    matches = (ROW.match(line) for line in page.read_text().splitlines())
    # A table takes a | of the code as \|.
    return {(match["file"], match["line"].replace("\\|", "|")) for match in matches if match}


def main():
    report = json.loads(pathlib.Path(sys.argv[1]).read_text())
    tree = pathlib.Path(sys.argv[2])
    measured = open_branches(report, tree)
    explained = explained_branches(tree / "docs" / "testing.md")
    for file, line in sorted(measured - explained):
        print(f"not taken, and docs/testing.md has no reason: {file}: {line}")
    for file, line in sorted(explained - measured):
        print(f"docs/testing.md has a reason for what is taken or gone: {file}: {line}")
    print(f"{len(measured)} lines with branches that no test takes, {len(explained)} of docs/testing.md")
    return 0 if measured == explained else 1


if __name__ == "__main__":
    sys.exit(main())
