#!/usr/bin/env python3
"""Measures `edid-composer compose --sink FOLDER -o FOLDER --jobs N` over thousands of sinks: sinks a second, peak
memory, and that the results do not depend on the number of jobs.

Peak memory is sampled. Exit status 1: the results of two numbers of jobs differ, or an EDID is missing.
"""

import argparse
import hashlib
import pathlib
import re
import subprocess
import sys
import tempfile
import time

import made_sinks
import page

ROOT = pathlib.Path(__file__).resolve().parent.parent
SAMPLING = 0.005


def peak_memory(process):
    """KiB; 0 when the process is gone. Not the usage that wait4() returns: that begins with the memory of this program,
    before the child became another."""
    try:
        status = pathlib.Path(f"/proc/{process}/status").read_text()
    except OSError:
        return 0
    found = re.search(r"^VmHWM:\s+(\d+)", status, re.MULTILINE)
    return int(found.group(1)) if found else 0


def run(program, sinks, output, jobs):
    """(seconds, KiB, exit status)"""
    command = [program, "compose", "--sink", sinks, "-o", output, "--jobs", str(jobs)]
    begin = time.monotonic()
    memory = 0
    with subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL) as child:
        while child.poll() is None:
            memory = max(memory, peak_memory(child.pid))
            time.sleep(SAMPLING)
    return time.monotonic() - begin, memory, child.returncode


def digest(folder):
    """Of names and contents of all files."""
    total = hashlib.sha256()
    for file in sorted(pathlib.Path(folder).rglob("*")):
        if file.is_file():
            content = file.read_bytes()
            total.update(f"{file.relative_to(folder)}\0{len(content)}\0".encode() + content)
    return total.hexdigest()


def measure(program, count, all_jobs, repetitions, folder):
    """Yields a row for each number of jobs. Exits when a composition fails or the results differ."""
    sinks = folder / "sinks"
    made_sinks.make(sinks, count, ROOT / "examples" / "sinks")
    results = set()
    for jobs in all_jobs:
        runs = []
        for repetition in range(repetitions):
            output = folder / f"composed_{jobs}_{repetition}"
            runs.append(run(program, sinks, output, jobs))
            if runs[-1][2] != 0 or len(list(output.glob("*.bin"))) != count:
                sys.exit(f"{count} sinks, {jobs} jobs: a composition failed or an EDID is missing")
            results.add(digest(output))
        fastest, slowest = min(each[0] for each in runs), max(each[0] for each in runs)
        memory = max(each[1] for each in runs) / 1024
        yield (f"{count:,}", f"{jobs}", f"{fastest:.2f} to {slowest:.2f}", f"{count / fastest:,.0f}", f"{memory:.1f}")
    if len(results) > 1:
        sys.exit(f"{count} sinks: the results differ between numbers of jobs")


def parse_arguments():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--program", default=ROOT / "build" / "bench" / "bin" / "edid-composer")
    parser.add_argument("--sinks", type=int, nargs="+", default=[1000, 10000])
    parser.add_argument("--jobs", type=int, nargs="+", default=[1, 2])
    parser.add_argument("--repetitions", type=int, default=3)
    parser.add_argument("--folder", help="where sinks and EDIDs are written; the system's temporary folder otherwise")
    parser.add_argument("--page", type=pathlib.Path, help="also write the table into this page")
    return parser.parse_args()


def main():
    options = parse_arguments()
    rows = []
    for count in options.sinks:
        with tempfile.TemporaryDirectory(prefix="desk_scale_", dir=options.folder) as folder:
            rows += measure(options.program, count, options.jobs, options.repetitions, pathlib.Path(folder))
    heads = ["Sinks", "Jobs", "Seconds", "Sinks a second (fastest)", "Memory, MiB"]
    lines = list(page.table(heads, rows, left=0))
    print("\n".join([*lines, "", "The results are equal for all numbers of jobs."]))
    if options.page:
        page.replace_section(options.page, "desk_scale", lines)
    return 0


if __name__ == "__main__":
    sys.exit(main())
