#!/usr/bin/env python3
"""Compares what the workloads of cost_workloads cost with the figures that are kept of them.

Heap calls and bytes must be the same. Instructions, which callgrind counts, may be up to 10 % more; they are compared
only in the environment that the figures were made in, as another compiler or C library makes others.

Exit status 0: as the figures say, or better. 1: not. 77: all heap figures hold, instructions were not compared.
"""

import argparse
import json
import os
import pathlib
import platform
import re
import shutil
import subprocess
import sys
import tempfile

TOLERANCE = 0.10
MEASURED = "cost_measured_run"


def environment(compiler):
    return f"{compiler}, {os.confstr('CS_GNU_LIBC_VERSION')}, {platform.machine()}"


def workloads(program):
    return subprocess.run([program], capture_output=True, text=True, check=True).stdout.split()


def heap_use(program, workload):
    run = subprocess.run([program, workload], capture_output=True, text=True, check=True)
    allocations, frees, size = (int(number) for number in run.stderr.split())
    return {"allocations": allocations, "frees": frees, "bytes": size}


def profile(program, workload, file):
    """Writes callgrind's profile of the measured run; answers the number of instructions."""
    command = [
        "valgrind",
        "--tool=callgrind",
        f"--toggle-collect={MEASURED}",
        f"--callgrind-out-file={file}",
        program,
        workload,
    ]
    run = subprocess.run(command, capture_output=True, text=True, check=True)
    return int(re.search(r"Collected : (\d+)", run.stderr).group(1))


def instructions(program, workload):
    with tempfile.TemporaryDirectory() as folder:
        return profile(program, workload, pathlib.Path(folder) / "profile")


def measure(program, names, count_instructions):
    costs = {}
    for name in names:
        costs[name] = heap_use(program, name)
        if count_instructions:
            costs[name]["instructions"] = instructions(program, name)
    return costs


def problems(measured, expected):
    """Yields what is worse than expected, for one or all kinds of figures that both have."""
    for name in sorted(measured.keys() | expected.keys()):
        if name not in expected or name not in measured:
            yield f"{name}: {'no figure is kept' if name in measured else 'there is no such workload'}"
            continue
        for kind, value in measured[name].items():
            limit = expected[name][kind]
            if kind != "instructions":
                if value != limit:
                    yield f"{name}: {value} {kind}, not {limit}"
            elif value >= limit * (1 + TOLERANCE):
                yield f"{name}: {value} {kind}, {value / limit - 1:.1%} more than {limit}"


def show(measured, expected):
    print(f"{'workload':22}{'allocations':>12}{'bytes':>8}{'instructions':>14}{'kept':>10}")
    for name, cost in measured.items():
        counted = cost.get("instructions")
        kept = expected.get(name, {}).get("instructions", "")
        print(f"{name:22}{cost['allocations']:12}{cost['bytes']:8}{counted or 'not counted':>14}{kept:>10}", end="")
        print(f"  {counted / kept - 1:+.1%}" if counted and kept else "")


def parse_arguments(arguments):
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--program", required=True, help="the built cost_workloads")
    parser.add_argument("--figures", required=True, type=pathlib.Path, help="the file of the figures")
    parser.add_argument("--compiler", required=True, help="name, version and mode of what compiled the library")
    parser.add_argument("--only", help="one workload")
    parser.add_argument("--update", action="store_true", help="write the figures anew")
    return parser.parse_args(arguments)


def main(arguments=None):
    options = parse_arguments(arguments)
    has_valgrind = shutil.which("valgrind") is not None
    here = environment(options.compiler)
    if options.update:
        if not has_valgrind:
            print("valgrind is not installed (Debian: valgrind)")
            return 1
        costs = measure(options.program, workloads(options.program), True)
        options.figures.write_text(json.dumps({"environment": here, "workloads": costs}, indent=2) + "\n")
        show(costs, costs)
        return 0

    figures = json.loads(options.figures.read_text())
    expected = figures["workloads"]
    if options.only:
        expected = {options.only: expected[options.only]}
    comparable = has_valgrind and figures["environment"] == here
    measured = measure(options.program, [options.only] if options.only else workloads(options.program), comparable)
    show(measured, expected)
    found = list(problems(measured, expected))
    for problem in found:
        print(problem)
    if found:
        print("If this is meant: cmake --build <build folder> --target update_cost_figures, and commit figures.json.")
        return 1
    if not comparable:
        other = f"the figures are of {figures['environment']}, this is {here}"
        print(f"instructions not compared: {other if has_valgrind else 'valgrind is not installed'}")
        return 77
    return 0


if __name__ == "__main__":
    sys.exit(main())
