"""A place to run a document's snippets in: a folder with the examples and the names of the source tree's other folders
in it, and the program, header and libraries found as if they were installed in the system's own places."""

import os
import pathlib
import shutil
import subprocess
import tempfile


class Scratch:
    """The folder, its environment, and running things in it."""

    def __init__(self, source, prefix, libdir, timeout=60):
        self.timeout = timeout
        self._folder = tempfile.TemporaryDirectory(prefix="edid_composer_docs.")
        self.path = pathlib.Path(self._folder.name)
        # A reader is in a clone: what a snippet writes must not have the name of one of its folders.
        for folder in source.iterdir():
            if folder.is_dir():
                (self.path / folder.name).mkdir()
        shutil.copytree(source / "examples", self.path / "examples", dirs_exist_ok=True)
        self.environment = self._environment(prefix, prefix / libdir)

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self._folder.cleanup()

    def _environment(self, prefix, libraries):
        environment = {
            "HOME": str(self.path),
            "LC_ALL": "C",
            "TZ": "UTC",
            "CPATH": f"{prefix}/include:{prefix}/include/edid_composer",
            "LIBRARY_PATH": str(libraries),
            "LD_LIBRARY_PATH": str(libraries),
            "PKG_CONFIG_PATH": f"{libraries}/pkgconfig",
            "CMAKE_PREFIX_PATH": str(prefix),
            "MANPATH": f"{prefix}/share/man:",
        }
        return {**os.environ, **environment, "PATH": f"{prefix}/bin:{os.environ['PATH']}"}

    def copy_tree(self, source):
        """Makes the folder a copy of the source tree, as a fresh clone is one. Building in it takes minutes."""
        self.timeout = 1800
        shutil.copytree(source, self.path, ignore=shutil.ignore_patterns("build", ".git"), dirs_exist_ok=True)

    def write(self, name, text):
        path = self.path / name
        path.parent.mkdir(parents=True, exist_ok=True)
        path.write_text(text)
        return path

    def run(self, command, given=None, without=()):
        """Runs a command; its exit status and what it printed, standard error in its place among standard output.

        @p without names variables of the environment that it shall not have."""
        environment = {name: value for name, value in self.environment.items() if name not in without}
        try:
            done = subprocess.run(command, cwd=self.path, env=environment, input=given, stdout=subprocess.PIPE,
                                  stderr=subprocess.STDOUT, timeout=self.timeout, check=False)
        except subprocess.TimeoutExpired:
            return None, f"still running after {self.timeout} seconds"
        return done.returncode, done.stdout.decode(errors="replace")
