"""The library inside of a parent project: what it builds there, and that it keeps to itself."""

import os
import re
import unittest

import scratch

HOST_SHOWS = 'Monitor Name : "Table Box"'
# Of CMake, and of what the library looks for.
OF_OTHERS = re.compile(r"_?(CMAKE|FETCHCONTENT|TOMLPLUSPLUS|CLI11|nlohmann_json|utf8cpp|Threads|FIND_PACKAGE_MESSAGE)_"
                       r"|(parent|libedid_composer)_[A-Z_]*(BINARY|SOURCE|TOP_LEVEL|LIB_DEPENDS)|edid_composer_[a-z_]*LIB_DEPENDS"
                       r"|(LIBRARY_SOURCE|HOST|FETCHED)$")


class Parent(scratch.ScratchTest):
    @classmethod
    def prepare(cls):
        cls.host = cls.source / "examples" / "minimal_host.c"

    def configured(self, name, *options):
        folder = self.folder / name
        scratch.run_or_fail(["cmake", "-S", self.source / "tests/install/parent", "-B", folder, "-G",
                             os.environ["GENERATOR"], f"-DCMAKE_C_COMPILER={os.environ['CC']}",
                             f"-DCMAKE_CXX_COMPILER={os.environ['CXX']}", "-DCMAKE_BUILD_TYPE=Release",
                             f"-DLIBRARY_SOURCE={self.source}", f"-DHOST={self.host}", *options])
        return folder

    def assert_keeps_to_itself(self, folder):
        targets = (folder / "targets.txt").read_text().split(";")
        self.assertIn("edid_composer", targets)
        self.assertEqual([name for name in targets if not name.startswith("edid_composer")], [])
        cached = (folder / "cached.txt").read_text().split(";")
        self.assertIn("EDID_COMPOSER_HARDENING", cached)
        others = [name for name in cached if not name.startswith("EDID_COMPOSER_") and not OF_OTHERS.match(name)]
        self.assertEqual(others, [])

    def assert_host_runs(self, folder):
        scratch.run_or_fail(["cmake", "--build", folder], timeout=900)
        for host in ("host_shared", "host_static"):
            with self.subTest(host=host):
                program = folder / "programs" / host
                self.assertIn(HOST_SHOWS, scratch.run_or_fail([program]))
                self.assertEqual("libedid_composer.so.1" in scratch.dynamic_entries(program, "NEEDED"),
                                 host == "host_shared")
        self.assertEqual({path.name for path in (folder / "programs").iterdir()}, {"host_shared", "host_static"})
        scratch.run_or_fail(["cmake", "--install", folder, "--prefix", folder / "prefix"])
        self.assertEqual(scratch.files_below(folder / "prefix"), {"bin/host_static"})
        self.assertFalse((folder / "CPackConfig.cmake").exists())

    def test_a_subdirectory(self):
        folder = self.configured("subdirectory")
        self.assert_keeps_to_itself(folder)
        self.assert_host_runs(folder)

    def test_a_subdirectory_without_shared_libraries(self):
        folder = self.configured("static", "-DBUILD_SHARED_LIBS=OFF")
        scratch.run_or_fail(["cmake", "--build", folder, "--target", "host_shared"], timeout=900)
        self.assertIn(HOST_SHOWS, scratch.run_or_fail([folder / "programs" / "host_shared"]))
        self.assertEqual(list(folder.rglob("*.so*")), [])

    def test_fetched_content(self):
        folder = self.configured("fetched", "-DFETCHED=ON")
        self.assert_keeps_to_itself(folder)
        self.assert_host_runs(folder)

    def test_the_store_is_there_when_the_parent_asks_for_it(self):
        folder = self.configured("with_store", "-DEDID_COMPOSER_HOST=ON")
        self.assert_keeps_to_itself(folder)
        targets = (folder / "targets.txt").read_text().split(";")
        self.assertIn("edid_composer_config_store", targets)
        self.assertNotIn("edid_composer_cli", targets)


if __name__ == "__main__":
    unittest.main()
