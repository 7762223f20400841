#!/usr/bin/env python3
"""Breaks the library and the program in the ways that mutations.toml lists, one at a time, and tells whether the tests notice.

The work is done in a copy of the tree, so that the tree itself is never broken. Exit status 0: each mutation ended as it
was expected to.
"""

import argparse
import os
import pathlib
import shutil
import subprocess
import sys
import tomllib

HERE = pathlib.Path(__file__).resolve().parent
TREE = HERE.parent.parent
# By the folder that a mutation is in, the programs of tests that are to notice it.
SUITES = {
    "src": ("unit_tests_sanitized", "end_to_end_tests_sanitized", "limits_without_assertions_tests",
            "robustness_tests_sanitized"),
    "host": ("config_store_tests", "explain_tests", "golden_tests", "cli_tests"),
}


def run(command, log, timeout):
    with open(log, "ab") as output:
        try:
            return subprocess.run(command, stdout=output, stderr=output, timeout=timeout, check=False).returncode
        except subprocess.TimeoutExpired:
            return -1


class Workshop:
    """A copy of the tree with a build of its own."""

    def __init__(self, folder, jobs):
        self.tree = folder / "tree"
        self.build = folder / "build"
        self.log = folder / "log.txt"
        self.jobs = jobs
        folder.mkdir(parents=True, exist_ok=True)
        self.log.write_bytes(b"")
        shutil.rmtree(self.tree, ignore_errors=True)
        # Files as new as the copy: what a run that was broken off compiled of a broken file is compiled again.
        shutil.copytree(TREE, self.tree, ignore=shutil.ignore_patterns("build", ".git"), copy_function=shutil.copy)
        configure = ["cmake", "-S", self.tree, "-B", self.build, "-G", "Ninja", "-DCMAKE_BUILD_TYPE=RelWithDebInfo",
                     "-DEDID_COMPOSER_SANITIZED_TESTS=ON"]
        if run(configure, self.log, 300) != 0:
            sys.exit(f"mutate: configuring failed, see {self.log}")

    def compile(self, suites):
        return run(["cmake", "--build", self.build, "-j", str(self.jobs), "--target", *suites], self.log, 1200) == 0

    def verdict(self, folder):
        """What the tests say of the tree as it is."""
        if not self.compile(SUITES[folder]):
            return "does not compile"
        for suite in SUITES[folder]:
            if run([self.build / "bin" / suite, "--gtest_brief=1", "--gtest_fail_fast"], self.log, 600) != 0:
                return f"killed by {suite}"
        return "survives"


def applicable(mutation, tree):
    """What keeps a mutation from being applied; empty: nothing."""
    path = tree / mutation["file"]
    found = path.read_text().count(mutation["before"]) if path.exists() else 0
    return "" if found == 1 else f"\"{mutation['name']}\": its text stands {found} times in {mutation['file']}"


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--only", default="", help="mutations whose name contains this text")
    parser.add_argument("--check", action="store_true", help="only check that each mutation can be applied")
    parser.add_argument("--jobs", type=int, default=os.cpu_count())
    arguments = parser.parse_args()
    with open(HERE / "mutations.toml", "rb") as file:
        mutations = [m for m in tomllib.load(file)["mutation"] if arguments.only in m["name"]]
    if arguments.check:
        stale = [problem for problem in (applicable(mutation, TREE) for mutation in mutations) if problem]
        print("\n".join(stale) or f"{len(mutations)} mutations can be applied")
        return 1 if stale else 0

    workshop = Workshop(TREE / "build" / "mutation", arguments.jobs)
    if any(workshop.verdict(folder) != "survives" for folder in SUITES):
        sys.exit(f"mutate: the tests fail on the unbroken tree, see {workshop.log}")
    unexpected = 0
    for mutation in mutations:
        problem = applicable(mutation, workshop.tree)
        if problem:
            sys.exit(f"mutate: {problem}")
        path = workshop.tree / mutation["file"]
        text = path.read_text()
        path.write_text(text.replace(mutation["before"], mutation["after"]))
        verdict = workshop.verdict(pathlib.PurePath(mutation["file"]).parts[0])
        path.write_text(text)
        expected = mutation.get("expect", "killed")
        as_expected = verdict.startswith(expected)
        unexpected += not as_expected
        reason = f" ({mutation['why']})" if "why" in mutation else ""
        print(f"{'ok  ' if as_expected else 'BAD '} {mutation['name']}: {verdict}{reason}", flush=True)
    print(f"{len(mutations)} mutations, {unexpected} not as expected")
    return 1 if unexpected else 0


if __name__ == "__main__":
    sys.exit(main())
