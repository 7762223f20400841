#!/usr/bin/env python3
"""Breaks the library in the ways that mutations.toml lists, one at a time, and tells whether the tests notice.

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
SUITES = ("unit_tests", "end_to_end_tests", "limits_without_assertions_tests", "robustness_tests")


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
        configure = ["cmake", "-S", self.tree, "-B", self.build, "-G", "Ninja", "-DCMAKE_BUILD_TYPE=Debug",
                     "-DEDID_COMPOSER_SANITIZE=ON", "-DEDID_COMPOSER_HOST=OFF"]
        if run(configure, self.log, 300) != 0:
            sys.exit(f"mutate: configuring failed, see {self.log}")

    def suites(self):
        """The programs of tests that this tree has."""
        return [suite for suite in SUITES if self.has(suite)]

    def has(self, suite):
        listed = subprocess.run(["ninja", "-C", self.build, "-t", "query", f"bin/{suite}"], capture_output=True, check=False)
        return listed.returncode == 0

    def compile(self):
        return run(["cmake", "--build", self.build, "-j", str(self.jobs), "--target", *self.suites()], self.log, 1200) == 0

    def verdict(self):
        """What the tests say of the tree as it is."""
        if not self.compile():
            return "does not compile"
        for suite in self.suites():
            if run([self.build / "bin" / suite, "--gtest_brief=1", "--gtest_fail_fast"], self.log, 600) != 0:
                return f"killed by {suite}"
        return "survives"


def original(mutation, tree):
    """The file that a mutation changes, and its text."""
    path = tree / mutation["file"]
    text = path.read_text()
    found = text.count(mutation["before"])
    if found != 1:
        sys.exit(f"mutate: \"{mutation['name']}\": its text stands {found} times in {mutation['file']}")
    return path, text


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--only", default="", help="mutations whose name contains this text")
    parser.add_argument("--check", action="store_true", help="only check that each mutation can be applied")
    parser.add_argument("--jobs", type=int, default=os.cpu_count())
    arguments = parser.parse_args()
    with open(HERE / "mutations.toml", "rb") as file:
        mutations = [m for m in tomllib.load(file)["mutation"] if arguments.only in m["name"]]
    if arguments.check:
        for mutation in mutations:
            original(mutation, TREE)
        print(f"{len(mutations)} mutations can be applied")
        return 0

    workshop = Workshop(TREE / "build" / "mutation", arguments.jobs)
    if workshop.verdict() != "survives":
        sys.exit(f"mutate: the tests fail on the unbroken tree, see {workshop.log}")
    unexpected = 0
    for mutation in mutations:
        path, text = original(mutation, workshop.tree)
        path.write_text(text.replace(mutation["before"], mutation["after"]))
        verdict = workshop.verdict()
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
