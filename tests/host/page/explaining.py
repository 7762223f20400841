"""Runs "explain" and "compose" in a folder of their own."""

import json
import os
import pathlib
import subprocess
import tempfile
import unittest

PROGRAM = os.environ["EDID_COMPOSER"]
SOURCE = pathlib.Path(os.environ["SOURCE_DIR"])
DEFAULT_PLATFORM = (SOURCE / "host/config_store/platform.toml").read_text()


class ExplainTest(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory(prefix="edid_composer_explain.")
        self.addCleanup(folder.cleanup)
        self.folder = pathlib.Path(folder.name)

    def sample(self, name):
        return SOURCE / "examples/sinks" / f"{name}.txt"

    def write(self, name, content):
        path = self.folder / name
        path.write_bytes(content if isinstance(content, bytes) else content.encode())
        return path

    def run_program(self, *arguments):
        """Status, standard output and standard error."""
        done = subprocess.run([PROGRAM, *map(str, arguments)], cwd=self.folder, stdin=subprocess.DEVNULL,
                              capture_output=True, timeout=60, check=False)
        return done.returncode, done.stdout.decode("utf-8", "strict"), done.stderr.decode("utf-8", "replace")

    def explain_json(self, *arguments):
        status, printed, complaints = self.run_program("explain", "--json", *arguments)
        self.assertEqual(status, 0, complaints)
        return json.loads(printed)

    def composed(self, *arguments):
        status, _, complaints = self.run_program("compose", "-o", "composed.bin", *arguments)
        self.assertEqual(status, 0, complaints)
        return (self.folder / "composed.bin").read_bytes()
