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
WORKLOAD = "decode"


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
        cls.measured = check_costs.measure(ARGUMENTS.program, [WORKLOAD], shutil.which("valgrind") is not None)

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
        for kind in ("allocations", "frees", "bytes"):
            for factor in (0.9, 1.1):
                with self.subTest(kind=kind, factor=factor):
                    status, output = check(self.figures(kind, factor), "another compiler")
                    self.assertEqual(status, 1)
                    self.assertRegex(output, rf"(?m)^{WORKLOAD}: \d+ {kind}, not \d+$")

    def test_instructions_of_another_compiler_are_not_compared(self):
        status, output = check(self.figures("bytes", 1), "another compiler")
        self.assertEqual(status, 77)
        self.assertIn("instructions not compared", output)


class Comparison(unittest.TestCase):
    def problems(self, measured, expected):
        return list(check_costs.problems({"w": {"instructions": measured}}, {"w": {"instructions": expected}}))

    def test_ten_percent_more_is_too_much(self):
        self.assertEqual(self.problems(1099, 1000), [])
        self.assertEqual(len(self.problems(1101, 1000)), 1)

    def test_workloads_without_figure_and_figures_without_workload_are_told(self):
        self.assertEqual(list(check_costs.problems({"new": {}}, {})), ["new: no figure is kept"])
        self.assertEqual(list(check_costs.problems({}, {"old": {}})), ["old: there is no such workload"])


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
