#!/usr/bin/env python3
"""Shows that check_costs.py fails when it should: with figures that are doctored, the real workloads miss them.

Takes the arguments of check_costs.py.
"""

import contextlib
import copy
import io
import json
import pathlib
import shutil
import sys
import tempfile
import unittest

import check_costs

ARGUMENTS = check_costs.parse_arguments(sys.argv[1:])
WORKLOAD = "decode/tv_4k"


def check(figures, compiler=ARGUMENTS.compiler):
    """Status and output of a check of one workload."""
    with tempfile.TemporaryDirectory() as folder:
        file = pathlib.Path(folder) / "figures.json"
        file.write_text(json.dumps(figures))
        output = io.StringIO()
        with contextlib.redirect_stdout(output):
            status = check_costs.main(
                ["--program", ARGUMENTS.program, "--figures", str(file), "--compiler", compiler, "--only", WORKLOAD]
            )
        return status, output.getvalue()


class DoctoredFigures(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.measured = check_costs.measure(ARGUMENTS.program, [WORKLOAD])

    def figures(self, kind, factor):
        workloads = copy.deepcopy(self.measured)
        workloads[WORKLOAD][kind] = round(workloads[WORKLOAD][kind] * factor)
        return {"environment": check_costs.environment(ARGUMENTS.compiler), "workloads": workloads}

    def need_instructions(self):
        if "instructions" not in self.measured[WORKLOAD]:
            self.skipTest("valgrind is not installed")

    def test_more_instructions_than_allowed_fail(self):
        self.need_instructions()
        status, output = check(self.figures("instructions", 1 / 1.12))
        self.assertEqual(status, 1)
        self.assertRegex(output, rf"(?m)^{WORKLOAD}: \d+ instructions, 1[12]\.\d% more than \d+$")

    def test_instructions_within_the_tolerance_pass(self):
        self.need_instructions()
        self.assertEqual(check(self.figures("instructions", 1 / 1.05))[0], 0)

    def test_fewer_instructions_pass(self):
        self.need_instructions()
        self.assertEqual(check(self.figures("instructions", 2))[0], 0)

    def test_other_heap_figures_fail(self):
        for kind in ("allocations", "heap_bytes"):
            for factor in (0.9, 1.1):
                with self.subTest(kind=kind, factor=factor):
                    status, output = check(self.figures(kind, factor), "another compiler")
                    self.assertEqual(status, 1)
                    self.assertRegex(output, rf"(?m)^{WORKLOAD}: \d+ {kind}, not \d+$")

    def test_instructions_of_another_compiler_are_not_compared(self):
        status, output = check(self.figures("heap_bytes", 1), "another compiler")
        self.assertEqual(status, 77)
        self.assertIn("instructions not compared", output)


class Differences(unittest.TestCase):
    FIGURES = {"allocations": 1, "heap_bytes": 1, "lines": 1, "stack": 1, "instructions": 1000}

    def differences(self, kind, value, comparable=True):
        return list(check_costs.differences({"w": self.FIGURES | {kind: value}}, {"w": self.FIGURES}, comparable))

    def test_ten_percent_more_instructions_are_too_many(self):
        self.assertEqual(self.differences("instructions", 1099), [])
        self.assertEqual(len(self.differences("instructions", 1101)), 1)

    def test_another_line_is_a_difference_in_every_environment(self):
        self.assertEqual(self.differences("lines", 2, comparable=False), ["w: 2 lines, not 1"])
        self.assertEqual(self.differences("instructions", 2000, comparable=False), [])

    def test_workloads_without_figure_and_figures_without_workload_are_named(self):
        self.assertEqual(list(check_costs.differences({"new": {}}, {}, True)), ["new: no figure is kept"])
        self.assertEqual(list(check_costs.differences({}, {"old": {}}, True)), ["old: there is no such workload"])


class Promises(unittest.TestCase):
    """Hostile sinks of 4096 and of 32768 bytes that cost as much as they may, with one figure changed."""

    SMALL = {"lines": 6 * 4096, "heap_bytes": 100 * 4096, "stack": 8192, "instructions": 1000}
    LARGE = {"lines": 6 * 32768, "heap_bytes": 100 * 32768, "stack": 8192, "instructions": 9000}

    def broken(self, **changed):
        return list(check_costs.broken_promises({"w/4096": self.SMALL, "w/32768": self.LARGE | changed}))

    def test_what_is_within_all_bounds_passes(self):
        self.assertEqual(self.broken(), [])

    def test_each_bound_can_be_broken(self):
        for kind, value, words in [("instructions", 9001, "not linear"), ("lines", 6 * 32768 + 1, "for each of 32768"),
                                   ("heap_bytes", 100 * 32768 + 1, "for each of 32768"), ("stack", 8193, "of stack")]:
            with self.subTest(kind=kind):
                broken = self.broken(**{kind: value})
                self.assertEqual(len(broken), 1, broken)
                self.assertIn(words, broken[0])


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
