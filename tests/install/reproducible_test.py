"""The same source gives the same files, to the byte, in whatever folders it is built; the packages are left for the test
that looks at them."""

import filecmp
import os
import pathlib
import shutil
import unittest

import scratch

# A moment that SOURCE_DATE_EPOCH names.
MOMENT, ITS_DATE = "1700000000", "Nov 14 22:13:20 UTC 2023"


class Reproducible(scratch.ScratchTest):
    @classmethod
    def prepare(cls):
        cls.builds = [cls.built(cls.folder / "first" / "source", cls.folder / "first" / "build"),
                      cls.built(cls.folder / "second one, deeper" / "in" / "here", cls.folder / "2")]

    @classmethod
    def built(cls, source, build):
        """A build for Debian's prefix, with the source in one folder and all that is made of it in another."""
        shutil.copytree(cls.source, source, ignore=shutil.ignore_patterns("build", ".git"))
        # A cache of compilations would compare what it has kept of the first build with itself.
        alone = {"SOURCE_DATE_EPOCH": MOMENT, "CCACHE_DISABLE": "1"}
        scratch.run_or_fail(["cmake", "-S", source, "-B", build, "-G", os.environ["GENERATOR"],
                             f"-DCMAKE_C_COMPILER={os.environ['CC']}", f"-DCMAKE_CXX_COMPILER={os.environ['CXX']}",
                             f"-DCMAKE_BUILD_TYPE={os.environ['BUILD_TYPE']}", "-DBUILD_TESTING=OFF",
                             "-DCMAKE_INSTALL_PREFIX=/usr",
                             "-DEDID_COMPOSER_PACKAGER=Package Tester <packages@example.org>"], **alone)
        scratch.run_or_fail(["cmake", "--build", build], timeout=1500, **alone)
        scratch.run_or_fail(["cmake", "--install", build], DESTDIR=str(build / "installed"))
        if shutil.which("dpkg-shlibdeps") and shutil.which("file"):
            scratch.run_or_fail(["cpack", "--config", build / "CPackConfig.cmake", "-B", build / "packages"], **alone)
        return build

    def made(self, build):
        packages = [path.relative_to(build) for path in (build / "packages").glob("*.deb")]
        files = [path.relative_to(build) for path in (build / "installed").rglob("*")]
        return {str(path) for path in [*packages, *files] if (build / path).is_file()}

    def test_two_builds_are_equal_to_the_byte(self):
        first, second = self.builds
        files = self.made(first)
        self.assertEqual(files, self.made(second))
        self.assertGreater(len(files), 20)
        _, differing, failed = filecmp.cmpfiles(first, second, files, shallow=False)
        self.assertEqual((differing, failed), ([], []))

    def test_no_file_names_a_folder_of_the_build(self):
        for build in self.builds:
            for path in self.made(build):
                content = (build / path).read_bytes()
                for folder in (self.folder, self.source):
                    self.assertNotIn(str(folder).encode(), content, path)

    def test_the_version_has_the_date_that_was_given(self):
        library = next((self.builds[0] / "installed").rglob("libedid_composer.so.*.*"))
        self.assertIn(ITS_DATE.encode(), library.read_bytes())

    def test_packages_are_left_for_the_next_test(self):
        kept = pathlib.Path(os.environ["PACKAGES"])
        shutil.rmtree(kept, ignore_errors=True)
        kept.mkdir(parents=True)
        for package in (self.builds[0] / "packages").glob("*.deb"):
            shutil.copy(package, kept)


if __name__ == "__main__":
    unittest.main()
