#!/usr/bin/env python3
"""Writes the figures of one measurement into docs/performance.md, between its markers."""

import argparse
import json
import pathlib
import platform
import re
import shlex
import subprocess
import sys

import callgrind_profile
from page import number, replace_section, table

ROOT = pathlib.Path(__file__).resolve().parent.parent
FIGURES = ROOT / "tests" / "cost" / "figures.json"
SINK = "tv_4k"
# Operations with their goals: times of one sink of 256 bytes, of what the peer takes to parse and destroy it.
GOALS = [
    ("decode", "Decode and destroy", 0.5),
    ("compose", "Compose, values read beforehand", 1.2),
    ("compose_with_store", "Compose, values from the configuration store", 3.0),
    ("compose_observed", "Compose, observed, values read beforehand", 3.0),
]
OPERATIONS = [(name, label) for name, label, _ in GOALS] + [("print", "Decode and print the long report")]
HOSTILE = [("compose_observed", "composed"), ("print", "printed")]


def microseconds(nanoseconds):
    return number(nanoseconds / 1000)


def processor():
    rows = pathlib.Path("/proc/cpuinfo").read_text(encoding="utf-8").splitlines()
    return next((row.split(":", 1)[1].strip() for row in rows if row.startswith("model name")), platform.machine())


def machine(options):
    system = re.search(r'PRETTY_NAME="(.*)"', pathlib.Path("/etc/os-release").read_text(encoding="utf-8")).group(1)
    commands = json.loads((options.build / "compile_commands.json").read_text(encoding="utf-8"))
    command = next(entry["command"] for entry in commands if entry["file"].endswith("linked_list/linked_list.cpp"))
    words = shlex.split(command)
    compiler = next(word for word in words if not word.endswith("ccache"))
    version = subprocess.run([compiler, "--version"], capture_output=True, text=True, check=True).stdout
    flags = " ".join(word for word in words if re.match(r"-(O|D_FORTIFY)", word))
    yield f"- Processor: {processor()}, one core"
    yield f"- System: {system}, {' '.join(platform.libc_ver())}"
    yield f"- Compiler: {version.splitlines()[0]}, {flags}"
    yield f"- Library file, stripped: {options.library.stat().st_size:,} bytes"


def goals(peer):
    """Yields label, goal, measured ratio and nanoseconds."""
    for name, label, goal in GOALS:
        measured = peer["operations"][name]
        yield label, goal, measured["ratio"], measured["ns"]


def goal_table(peer):
    rows = [(label, f"{goal:g}", f"{ratio:.2f}", "met" if ratio <= goal else "**missed**", microseconds(ns))
            for label, goal, ratio, ns in goals(peer)]
    peer_label = f"libdisplay-info: parse and destroy ({peer['sinks']} sinks)"
    rows.append((peer_label, "", "1", "", microseconds(peer["peer_ns"])))
    return table(["Operation", "Goal", "Measured", "", "µs a sink"], rows)


def sink_table(sinks):
    heads = ["Sample sink", "Bytes", "List entries", *(label for _, label in OPERATIONS)]
    return table(heads, [(sink["name"], str(sink["bytes"]), str(sink["entries"]),
                          *(microseconds(sink[name]) for name, _ in OPERATIONS)) for sink in sinks])


def floor_table(sinks):
    heads = ["Sample sink", "Allocations", "These and their frees alone, µs", "Decode and destroy, µs"]
    return table(heads, [(sink["name"], str(2 * sink["entries"]), microseconds(sink["heap_calls"]),
                          microseconds(sink["decode"])) for sink in sinks])


def cost_table(costs):
    rows = []
    for name, label in OPERATIONS:
        figures = costs[f"{name}/{SINK}"]
        rows.append((label, *(f"{figures[kind]:,}" for kind in ("instructions", "allocations", "heap_bytes", "stack"))))
    return table([f"`{SINK}`", "Instructions", "Allocations", "Heap bytes", "Stack bytes"], rows)


def hostile_rows(measured, costs):
    """The times of each pattern, and what it prints."""
    whats = {entry["name"]: entry["what"] for entry in measured}
    times = {(entry["name"], entry["bytes"]): entry for entry in measured}
    sizes = sorted({entry["bytes"] for entry in measured})
    for operation, verb in HOSTILE:
        for name, what in whats.items():
            figures = costs.get(f"{operation}/{name}/{sizes[-1]}")
            if figures is None:
                continue
            yield (f"{what}, {verb}", *(microseconds(times[name, size][operation]) for size in sizes),
                   f"{figures['lines']:,}", f"{figures['heap_bytes'] / 1000:,.0f}")


def profile_table(program):
    columns = [(label, *callgrind_profile.shares(program, f"{name}/{SINK}")) for name, label in OPERATIONS]
    rows = [(group, *(f"{share[group]:.0%}".replace("%", " %") for _, share, _ in columns)) for group in columns[0][1]]
    return table([f"`{SINK}`", *(label for label, _, _ in columns)], rows)


def sections(options):
    measured = json.loads(options.results.read_text(encoding="utf-8"))
    costs = json.loads(FIGURES.read_text(encoding="utf-8"))["workloads"]
    yield "machine", machine(options)
    if options.peer_results:
        yield "goals", goal_table(json.loads(options.peer_results.read_text(encoding="utf-8")))
    yield "sinks", sink_table(measured["sinks"])
    yield "floor", floor_table(measured["sinks"])
    yield "costs", cost_table(costs)
    yield "profile", profile_table(options.build / "bin" / "cost_workloads")
    heads = ["The sink is full of", "256 bytes, µs", "4 KiB, µs", "32 KiB, µs", "Lines of 32 KiB", "Heap of 32 KiB, kB"]
    yield "hostile", table(heads, list(hostile_rows(measured["hostile"], costs)))


def parse_arguments():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--results", required=True, type=pathlib.Path, help="what edid_composer_bench wrote")
    parser.add_argument("--peer-results", type=pathlib.Path, help="what edid_composer_peer_comparison wrote")
    parser.add_argument("--library", required=True, type=pathlib.Path, help="the library, stripped")
    parser.add_argument("--build", required=True, type=pathlib.Path, help="the build folder")
    parser.add_argument("--page", required=True, type=pathlib.Path)
    return parser.parse_args()


def main():
    options = parse_arguments()
    for name, lines in sections(options):
        replace_section(options.page, name, list(lines))
    return 0


if __name__ == "__main__":
    sys.exit(main())
