#!/usr/bin/env python3
"""Breaks the library and the program in the ways that mutations.toml lists, one at a time; reports if the tests notice.

The work is done in copies of the tree, so that the tree itself is never broken: one for the library and one for the
program, side by side. Exit status 0: the tests noticed each mutation.
"""

import argparse
import concurrent.futures
import os
import pathlib
import shutil
import subprocess
import sys
import time
import tomllib

HERE = pathlib.Path(__file__).resolve().parent
TREE = HERE.parent.parent
# By the folder that a mutation is in, the programs of tests that are to notice it: the most likely first. One is built
# only when those before it passed.
SUITES = {
    "src": ("unit_tests_sanitized", "end_to_end_tests_sanitized", "limits_without_assertions_tests",
            "robustness_tests_sanitized"),
    "host/config_store": ("config_store_tests", "cli_tests"),
    "host/cli": ("explain_tests", "cli_tests", "golden_tests"),
}
# A broken program that runs this many times as long as the unbroken one has no end.
PATIENCE = 10


def suites_of(mutation):
    return next(suites for folder, suites in SUITES.items() if mutation["file"].startswith(folder + "/"))


def run(command, log, timeout):
    with open(log, "ab") as output:
        try:
            return subprocess.run(command, stdout=output, stderr=output, timeout=timeout, check=False).returncode
        except subprocess.TimeoutExpired:
            return -1


def files_of(tree):
    """The paths below a tree, without what git and builds keep there."""
    for folder, folders, names in os.walk(tree):
        folders[:] = [name for name in folders if name not in (".git", "build")]
        yield from (pathlib.Path(folder, name).relative_to(tree) for name in names)


def bring_up_to_date(copy):
    """Makes a folder a copy of the tree. Files that are right already keep their times, so that they need no compiler;
    what a run that was broken off left broken is made right."""
    names = set(files_of(TREE))
    for name in names:
        content = (TREE / name).read_bytes()
        if not (copy / name).is_file() or (copy / name).read_bytes() != content:
            (copy / name).parent.mkdir(parents=True, exist_ok=True)
            shutil.copy(TREE / name, copy / name)
    for name in set(files_of(copy)) - names:
        (copy / name).unlink()


def applicable(mutation, tree):
    """What keeps a mutation from being applied; empty: nothing."""
    path = tree / mutation["file"]
    found = path.read_text().count(mutation["before"]) if path.exists() else 0
    return "" if found == 1 else f"\"{mutation['name']}\": its text stands {found} times in {mutation['file']}"


class Workshop:
    """A copy of the tree with a build of its own."""

    def __init__(self, folder, jobs):
        self.tree = folder / "tree"
        self.build = folder / "build"
        self.log = folder / "log.txt"
        self.jobs = jobs
        self.seconds = {}
        folder.mkdir(parents=True, exist_ok=True)
        self.log.write_bytes(b"")
        bring_up_to_date(self.tree)
        configure = ["cmake", "-S", self.tree, "-B", self.build, "-G", "Ninja", "-DCMAKE_BUILD_TYPE=RelWithDebInfo",
                     "-DEDID_COMPOSER_SANITIZED_TESTS=ON"]
        if run(configure, self.log, 300) != 0:
            raise RuntimeError(f"configuring failed, see {self.log}")

    def compile(self, suites):
        return run(["cmake", "--build", self.build, "-j", str(self.jobs), "--target", *suites], self.log, 1200) == 0

    def test(self, suite, timeout):
        return run([self.build / "bin" / suite, "--gtest_brief=1", "--gtest_fail_fast"], self.log, timeout)

    def prepare(self, suites):
        """Builds the unbroken tree and measures its tests, which have to pass."""
        passed = self.compile(suites)
        for suite in suites:
            begin = time.monotonic()
            passed = passed and self.test(suite, 600) == 0
            self.seconds[suite] = time.monotonic() - begin
        if not passed:
            raise RuntimeError(f"the tests fail on the unbroken tree, see {self.log}")

    def verdict(self, suites):
        """What the tests say of the tree as it is."""
        for suite in suites:
            if not self.compile([suite]):
                return "does not compile"
            result = self.test(suite, max(60, PATIENCE * self.seconds[suite]))
            if result != 0:
                return f"killed by {suite}" + (", which has no end" if result == -1 else "")
        return "survives"

    def break_and_test(self, mutation):
        problem = applicable(mutation, self.tree)
        if problem:
            raise RuntimeError(problem)
        path = self.tree / mutation["file"]
        text = path.read_text()
        path.write_text(text.replace(mutation["before"], mutation["after"]))
        try:
            return self.verdict(suites_of(mutation))
        finally:
            path.write_text(text)


def work_off(mutations, part, jobs):
    """Carries out those in a part of the tree; returns how many the tests did not notice."""
    mutations = [mutation for mutation in mutations if mutation["file"].startswith(part + "/")]
    if not mutations:
        return 0
    workshop = Workshop(TREE / "build" / "mutation" / part, jobs)
    workshop.prepare(sorted({suite for mutation in mutations for suite in suites_of(mutation)}))
    unnoticed = 0
    for mutation in mutations:
        begin = time.monotonic()
        verdict = workshop.break_and_test(mutation)
        noticed = verdict.startswith("killed")
        unnoticed += not noticed
        seconds = time.monotonic() - begin
        print(f"{'ok  ' if noticed else 'BAD '} {mutation['name']}: {verdict}, {seconds:.0f} s", flush=True)
    return unnoticed


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--only", default="", help="mutations whose name or file contains this text")
    parser.add_argument("--check", action="store_true", help="only check that each mutation can be applied")
    parser.add_argument("--jobs", type=int, default=os.cpu_count(), help="compilers at once")
    arguments = parser.parse_args()
    with open(HERE / "mutations.toml", "rb") as file:
        mutations = [m for m in tomllib.load(file)["mutation"] if arguments.only in m["name"] + "\n" + m["file"]]
    if arguments.check:
        stale = [problem for problem in (applicable(mutation, TREE) for mutation in mutations) if problem]
        print("\n".join(stale) or f"{len(mutations)} mutations can be applied")
        return 1 if stale else 0

    begin = time.monotonic()
    jobs = max(1, arguments.jobs // 2)
    with concurrent.futures.ThreadPoolExecutor() as pool:
        parts = [pool.submit(work_off, mutations, part, jobs) for part in ("src", "host")]
        try:
            unnoticed = sum(part.result() for part in parts)
        except RuntimeError as error:
            sys.exit(f"mutate: {error}")
    print(f"{len(mutations)} mutations, {unnoticed} not noticed, {(time.monotonic() - begin) / 60:.0f} minutes")
    return 1 if unnoticed else 0


if __name__ == "__main__":
    sys.exit(main())
