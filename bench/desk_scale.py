#!/usr/bin/env python3
"""Measures `edid-composer compose --sink FOLDER -o FOLDER --jobs N` over thousands of sinks: sinks a second, peak
memory, and that the results do not depend on the number of jobs.

Peak memory is that of the largest process, and of all processes together with shared pages counted once (sampled).
Exit status 1: the results of two numbers of jobs differ, or an EDID is missing.
"""

import argparse
import hashlib
import pathlib
import re
import subprocess
import sys
import tempfile
import threading
import time

import made_sinks
import page

ROOT = pathlib.Path(__file__).resolve().parent.parent
SAMPLING = 0.02


def processes_of(group):
    for entry in pathlib.Path("/proc").iterdir():
        if entry.name.isdigit():
            try:
                fields = (entry / "stat").read_text().rpartition(")")[2].split()
            except OSError:
                continue
            if int(fields[2]) == group:
                yield entry


def amount(file, name):
    """A number of KiB of a file in /proc; 0 when the process is gone."""
    try:
        found = re.search(rf"^{name}:\s+(\d+)", file.read_text(), re.MULTILINE)
    except OSError:
        return 0
    return int(found.group(1)) if found else 0


class Sampler(threading.Thread):
    """Watches the memory of a process group until it is told to stop. Not by the usage that wait4() tells: that begins
    with the memory of this program, before the child became another."""

    def __init__(self, group):
        super().__init__()
        self.largest = 0
        self.all = 0
        self._group = group
        self._done = threading.Event()

    def run(self):
        while not self._done.wait(SAMPLING):
            processes = list(processes_of(self._group))
            self.largest = max([self.largest, *(amount(entry / "status", "VmHWM") for entry in processes)])
            self.all = max(self.all, sum(amount(entry / "smaps_rollup", "Pss") for entry in processes))

    def stop(self):
        self._done.set()
        self.join()


def run(program, sinks, output, jobs):
    """(seconds, KiB of the largest process, KiB of all, exit status)"""
    command = [program, "compose", "--sink", sinks, "-o", output, "--jobs", str(jobs)]
    begin = time.monotonic()
    child = subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL, start_new_session=True)
    sampler = Sampler(child.pid)
    sampler.start()
    status = child.wait()
    seconds = time.monotonic() - begin
    sampler.stop()
    return seconds, sampler.largest, sampler.all, status


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
            if runs[-1][3] != 0 or len(list(output.glob("*.bin"))) != count:
                sys.exit(f"{count} sinks, {jobs} jobs: a composition failed or an EDID is missing")
            results.add(digest(output))
        fastest, slowest = min(each[0] for each in runs), max(each[0] for each in runs)
        largest, everything = (max(each[i] for each in runs) / 1024 for i in (1, 2))
        yield (f"{count:,}", f"{jobs}", f"{fastest:.2f} to {slowest:.2f}", f"{count / fastest:,.0f}",
               f"{largest:.1f}", f"{everything:.1f}")
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
    heads = ["Sinks", "Jobs", "Seconds", "Sinks a second (fastest)", "Largest process, MiB", "All processes, MiB"]
    lines = list(page.table(heads, rows, left=0))
    print("\n".join([*lines, "", "The results are equal for all numbers of jobs."]))
    if options.page:
        page.replace_section(options.page, "desk_scale", lines)
    return 0


if __name__ == "__main__":
    sys.exit(main())
