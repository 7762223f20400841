"""The results of one run of edid_composer_bench.

Of the repetitions of a benchmark the fastest counts: what disturbs a run makes it slower, never faster. Ratios are of
times of the same run.
"""

import json
import math


class Results:
    def __init__(self, file):
        with open(file, encoding="utf-8") as text:
            document = json.load(text)
        self.context = document["context"]
        self._times = {}
        self._counters = {}
        for run in document["benchmarks"]:
            if run["run_type"] != "iteration":
                continue
            if run["time_unit"] != "ns":
                raise ValueError(f"{run['name']}: not in nanoseconds")
            self._times.setdefault(run["name"], []).append(run["cpu_time"])
            self._counters[run["name"]] = run

    def time(self, name):
        """Nanoseconds of processor time."""
        return min(self._times[name])

    def counter(self, name, counter):
        return int(self._counters[name][counter])

    def of(self, family):
        """What stands behind "family/" in the names, in their order; numbers as numbers, ascending."""
        found = [name[len(family) + 1 :] for name in self._times if name.startswith(family + "/")]
        return sorted(map(int, found)) if all(part.isdigit() for part in found) else sorted(found)

    def series(self, family):
        """Points (length, nanoseconds) of a growing list."""
        return [(length, self.time(f"{family}/{length}")) for length in self.of(family)]

    def heap_floor(self, allocations):
        """The time of that many heap calls of list entries and their frees, between or beyond the measured numbers."""
        points = [(self.counter(f"heap/entries/{n}", "allocations"), self.time(f"heap/entries/{n}"))
                  for n in self.of("heap/entries")]
        below = max((point for point in points if point[0] <= allocations), default=None)
        above = min((point for point in points if point[0] > allocations), default=None)
        if below is None:
            return above[1] * allocations / above[0]
        if above is None:
            return below[1] * allocations / below[0]
        share = (allocations - below[0]) / (above[0] - below[0])
        return below[1] + share * (above[1] - below[1])


def exponent(points):
    """The exponent p of (time beyond that of the shortest list) = c * (entries beyond it) ** p, fitted to the lengths
    from a quarter of the longest on. What doesn't depend on the list would hide its growth, and is left out so."""
    shortest, base = points[0]
    longest = points[-1][0]
    logs = [(math.log(length - shortest), math.log(max(time - base, 1)))
            for length, time in points if length >= longest / 4]
    mean_x = sum(x for x, _ in logs) / len(logs)
    mean_y = sum(y for _, y in logs) / len(logs)
    return sum((x - mean_x) * (y - mean_y) for x, y in logs) / sum((x - mean_x) ** 2 for x, _ in logs)
