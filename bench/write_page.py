#!/usr/bin/env python3
"""Writes the figures of a benchmark run into docs/performance.md, between its markers, and the plots beside it.

Prints the targets, met or missed. Exit status: 0, with --strict 1 when a target is missed.
"""

import argparse
import json
import pathlib
import platform
import re
import shlex
import subprocess
import sys

import page
import plots
import results
import tables
import targets

SINK = "tv_4k"


def processor():
    for row in pathlib.Path("/proc/cpuinfo").read_text(encoding="utf-8").splitlines():
        if row.startswith("model name"):
            return row.split(":", 1)[1].strip()
    return platform.machine()


def system_name():
    release = pathlib.Path("/etc/os-release").read_text(encoding="utf-8")
    return re.search(r'PRETTY_NAME="(.*)"', release).group(1)


def compilation(build):
    """The compiler's name for itself, and the flags that bear on cost."""
    commands = json.loads((build / "compile_commands.json").read_text(encoding="utf-8"))
    command = next(entry["command"] for entry in commands if entry["file"].endswith("linked_list/linked_list.cpp"))
    words = shlex.split(command)
    version = subprocess.run([words[0], "--version"], capture_output=True, text=True, check=True).stdout
    flags = [word for word in words[1:] if re.match(r"-(O|f|m|std|U|DNDEBUG|D_FORTIFY)", word)]
    return version.splitlines()[0], " ".join(flags)


def machine(options):
    yield f"- Processor: {processor()}, {platform.machine()}; {system_name()}, kernel {platform.release()}, " + \
        f"{platform.libc_ver()[0]} {platform.libc_ver()[1]}"
    compiler, flags = compilation(options.build)
    yield f"- Compiler: {compiler}"
    yield f"- Flags of the list's module: `{flags}`"
    yield "- The fastest of the repetitions of a benchmark counts, in processor time"


def sections(run, all_targets, options):
    yield "machine", machine(options)
    yield "targets", tables.target_table(all_targets)
    yield "sinks", tables.sink_table(run)
    yield "stages", tables.stage_table(run, SINK)
    yield "floor", tables.floor_table(run, SINK)
    yield "observer", tables.observer_table(run)
    yield "growth", tables.growth_table(run)
    yield "size", tables.size_table(options.library)
    yield "profile", tables.profile_table(options.build / "bin" / "cost_workloads")


def parse_arguments():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--results", required=True, help="what edid_composer_bench wrote with --benchmark_out")
    parser.add_argument("--library", required=True, type=pathlib.Path, help="the library, stripped")
    parser.add_argument("--build", required=True, type=pathlib.Path, help="the build folder")
    parser.add_argument("--page", required=True, type=pathlib.Path)
    parser.add_argument("--strict", action="store_true")
    return parser.parse_args()


def main():
    options = parse_arguments()
    run = results.Results(options.results)
    all_targets = list(targets.targets(run, options.library.stat().st_size))
    for name, lines in sections(run, all_targets, options):
        page.replace_section(options.page, name, lines)
    folder = options.page.with_suffix("")
    folder.mkdir(exist_ok=True)
    (folder / "growth.svg").write_text(plots.growth(run), encoding="utf-8")
    (folder / "road.svg").write_text(plots.road(run, SINK), encoding="utf-8")
    for target in all_targets:
        status = "met   " if target.met() else "MISSED"
        print(f"{status} {target.what}: {page.number(target.measured)} {target.unit}"
              f" (at most {page.number(target.limit)}) {target.at}")
    return 1 if options.strict and not all(target.met() for target in all_targets) else 0


if __name__ == "__main__":
    sys.exit(main())
