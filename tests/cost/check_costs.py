#!/usr/bin/env python3
"""Compares what the workloads of cost_workloads cost with the figures that are kept of them, and with what is promised.

Heap calls, heap bytes and printed lines must be the same as kept. Instructions, which callgrind counts, and stack may be
up to 10 % more; they are compared only in the environment that the figures were made in, as another compiler or C library
makes others. In every environment, what hostile sinks cost is linear in their size, and within LIMITS.

Exit status 0: as the figures say, or better. 1: not. 77: all that was compared holds, instructions were not.
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
EXACT = ("allocations", "heap_bytes", "lines")
TOLERANT = ("instructions", "stack")
MEASURED = "cost_measured_run"

SMALL, LARGE = 4096, 32768
# A little more than 8, as a quadratic cost has 64.
LINEAR = 9
# What SECURITY.md promises: for each byte of a hostile sink, and of stack altogether.
LIMITS_PER_BYTE = {"lines": 6, "heap_bytes": 100}
STACK_LIMIT = 8192


def environment(compiler):
    return f"{compiler}, {os.confstr('CS_GNU_LIBC_VERSION')}, {platform.machine()}"


def workloads(program):
    return subprocess.run([program], capture_output=True, text=True, check=True).stdout.split()


def cost(program, workload):
    """All figures but the instructions."""
    run = subprocess.run([program, workload], capture_output=True, text=True, check=True)
    return json.loads(run.stderr)


def profile(program, workload, file):
    """Writes callgrind's profile of the measured run; returns the number of instructions."""
    command = [
        "valgrind",
        "--tool=callgrind",
        f"--toggle-collect={MEASURED}*",
        f"--callgrind-out-file={file}",
        program,
        workload,
        "once",
    ]
    run = subprocess.run(command, capture_output=True, text=True, check=True)
    return int(re.search(r"Collected : (\d+)", run.stderr).group(1))


def instructions(program, workload):
    with tempfile.TemporaryDirectory() as folder:
        return profile(program, workload, pathlib.Path(folder) / "profile")


def measure(program, names):
    """The costs of each workload; without instructions where there is no valgrind."""
    costs = {}
    for name in names:
        costs[name] = cost(program, name)
        if shutil.which("valgrind"):
            costs[name]["instructions"] = instructions(program, name)
    return costs


def differences(measured, expected, comparable):
    """Yields what is worse than the kept figures."""
    for name in sorted(measured.keys() | expected.keys()):
        if name not in expected or name not in measured:
            yield f"{name}: {'no figure is kept' if name in measured else 'there is no such workload'}"
            continue
        for kind in EXACT:
            value, kept = measured[name][kind], expected[name][kind]
            if value != kept:
                yield f"{name}: {value} {kind}, not {kept}"
        for kind in TOLERANT if comparable else ():
            value, kept = measured[name][kind], expected[name][kind]
            if value >= kept * (1 + TOLERANCE):
                yield f"{name}: {value} {kind}, {value / kept - 1:.1%} more than {kept}"


def broken_promises(measured):
    """Yields what the costs of hostile sinks are beyond, whatever the kept figures say."""
    for name, figures in measured.items():
        if figures["stack"] > STACK_LIMIT:
            yield f"{name}: {figures['stack']} bytes of stack, more than {STACK_LIMIT}"
        workload, _, size = name.rpartition("/")
        if not size.isdigit():
            continue
        for kind, limit in LIMITS_PER_BYTE.items():
            if figures[kind] > limit * int(size):
                yield f"{name}: {figures[kind]} {kind}, more than {limit} for each of {size} bytes"
        small = measured.get(f"{workload}/{SMALL}")
        if int(size) != LARGE or small is None:
            continue
        for kind in ("instructions", *LIMITS_PER_BYTE):
            if kind in figures and figures[kind] > LINEAR * small[kind]:
                yield f"{name}: {figures[kind]} {kind}, more than {LINEAR} x {small[kind]} of {SMALL} bytes: not linear"


def show(measured, expected):
    print(f"{'workload':44}{'heap calls':>11}{'heap bytes':>12}{'lines':>8}{'stack':>7}{'instructions':>14}{'kept':>12}")
    for name, figures in measured.items():
        counted = figures.get("instructions")
        kept = expected.get(name, {}).get("instructions", "")
        print(f"{name:44}{figures['allocations']:11}{figures['heap_bytes']:12}{figures['lines']:8}{figures['stack']:7}"
              f"{counted or 'not counted':>14}{kept:>12}", end="")
        print(f"  {counted / kept - 1:+.1%}" if counted and kept else "")


def parse_arguments(arguments):
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--program", required=True, help="the built cost_workloads")
    parser.add_argument("--figures", required=True, type=pathlib.Path, help="the file of the figures")
    parser.add_argument("--compiler", required=True, help="name, version and mode of what compiled the library")
    parser.add_argument("--only", help="one workload")
    parser.add_argument("--update", action="store_true", help="write the figures anew")
    return parser.parse_args(arguments)


def update(options):
    if not shutil.which("valgrind"):
        print("valgrind is not installed (Debian: valgrind)")
        return 1
    costs = measure(options.program, workloads(options.program))
    document = {"environment": environment(options.compiler), "workloads": costs}
    options.figures.write_text(json.dumps(document, indent=2) + "\n")
    show(costs, costs)
    return 0


def main(arguments=None):
    options = parse_arguments(arguments)
    if options.update:
        return update(options)
    figures = json.loads(options.figures.read_text())
    expected = figures["workloads"]
    if options.only:
        expected = {options.only: expected[options.only]}
    has_valgrind = shutil.which("valgrind") is not None
    here = environment(options.compiler)
    comparable = has_valgrind and figures["environment"] == here
    measured = measure(options.program, [options.only] if options.only else workloads(options.program))
    show(measured, expected)
    broken = list(broken_promises(measured))
    different = list(differences(measured, expected, comparable))
    print("\n".join(broken + different))
    if different:
        print("If this is meant: cmake --build <build folder> --target update_cost_figures, and commit figures.json.")
    if broken or different:
        return 1
    if not comparable:
        other = f"the figures are of {figures['environment']}, this is {here}"
        print(f"instructions not compared: {other if has_valgrind else 'valgrind is not installed'}")
        return 77
    return 0


if __name__ == "__main__":
    sys.exit(main())
