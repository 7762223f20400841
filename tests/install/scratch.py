"""A folder to install into, and running things on what is installed."""

import os
import pathlib
import subprocess
import tempfile
import unittest


def run(command, timeout=120, **environment):
    """Runs a command; its exit status and what it printed, standard error in its place among standard output."""
    without = ("CPATH", "LIBRARY_PATH", "LD_LIBRARY_PATH", "CMAKE_PREFIX_PATH", "DESTDIR")
    inherited = {name: value for name, value in os.environ.items() if name not in without}
    done = subprocess.run([str(word) for word in command], env={**inherited, "LC_ALL": "C", **environment}, text=True,
                          stdin=subprocess.DEVNULL, stdout=subprocess.PIPE, stderr=subprocess.STDOUT, timeout=timeout,
                          check=False)
    return done.returncode, done.stdout


def run_or_fail(command, timeout=120, **environment):
    """Runs a command that must succeed; what it printed."""
    status, printed = run(command, timeout, **environment)
    if status != 0:
        told = " ".join(str(word) for word in command)
        raise AssertionError(f"{told}\nended with status {status} and printed:\n{printed}")
    return printed


def files_below(folder):
    """All files and links below a folder, by path."""
    return {str(path.relative_to(folder)) for path in folder.rglob("*") if path.is_symlink() or not path.is_dir()}


def dynamic_entries(file, tag):
    """The values of a tag, like NEEDED, in the dynamic section of a program or library."""
    lines = run_or_fail(["readelf", "-dW", file]).splitlines()
    return [line.partition("[")[2].rstrip("]") for line in lines if f"({tag})" in line]


class ScratchTest(unittest.TestCase):
    """Tests that share one scratch folder, made by the class's own prepare()."""

    source = pathlib.Path(os.environ["SOURCE_DIR"])
    build = pathlib.Path(os.environ["BUILD_DIR"])
    libdir = os.environ["LIBDIR"]

    @classmethod
    def setUpClass(cls):
        folder = tempfile.TemporaryDirectory(prefix="edid_composer_install.")
        cls.addClassCleanup(folder.cleanup)
        cls.folder = pathlib.Path(folder.name)
        cls.prepare()

    @classmethod
    def prepare(cls):
        raise NotImplementedError
