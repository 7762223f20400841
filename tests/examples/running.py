"""Runs the examples and the command-line program in a folder of their own."""

import os
import pathlib
import subprocess
import sys
import tempfile
import unittest

import edid_bytes


class ExampleTest(unittest.TestCase):
    """A test with a scratch folder; what it runs stands in the environment."""

    def setUp(self):
        folder = tempfile.TemporaryDirectory(prefix="edid_composer_examples.")
        self.addCleanup(folder.cleanup)
        self.folder = pathlib.Path(folder.name)
        self.examples = pathlib.Path(os.environ["EXAMPLES_DIR"])
        self.sinks = edid_bytes.samples(self.examples / "sinks")
        self.assertGreaterEqual(len(self.sinks), 5)

    def run_in_folder(self, command, **environment):
        """Runs a command in the folder; its status, standard output and standard error."""
        done = subprocess.run([str(word) for word in command], cwd=self.folder, env={**os.environ, **environment},
                              stdin=subprocess.DEVNULL, capture_output=True, text=True, timeout=60, check=False)
        return done.returncode, done.stdout, done.stderr

    def compose(self, *options):
        """What the command-line program composes."""
        target = self.folder / "composed.bin"
        program = os.environ["EDID_COMPOSER"]
        status, printed, complaints = self.run_in_folder([program, "compose", *options, "-o", target])
        self.assertEqual(status, 0, printed + complaints)
        composed = target.read_bytes()
        target.unlink()
        return composed

    def write(self, name, content):
        path = self.folder / name
        path.write_bytes(content if isinstance(content, bytes) else content.encode())
        return path


def main():
    sys.exit(0 if unittest.main(exit=False).result.wasSuccessful() else 1)
