"""What a packager's build switches do to library, store and program: seen in the macros that a compiler sets by its flags."""

import json
import os
import re
import unittest

import scratch

# A file of each that is installed, and those that are otherwise optimised less.
FILES = ("src/utility/timing.cpp", "host/config_store/config_tree.cpp", "host/config_store/toml_reader.cpp",
         "host/cli/io/atomic_file.cpp", "host/cli/commands/option_parser.cpp")


class Switches(scratch.ScratchTest):
    @classmethod
    def prepare(cls):
        cls.builds = 0

    def configured(self, *options, **environment):
        """A build folder that was configured with these options, and no others."""
        type(self).builds += 1
        folder = self.folder / f"build {self.builds}"
        compilers = [f"-DCMAKE_C_COMPILER={os.environ['CC']}", f"-DCMAKE_CXX_COMPILER={os.environ['CXX']}"]
        scratch.run_or_fail(["cmake", "-S", self.source, "-B", folder, "-G", os.environ["GENERATOR"], *compilers,
                             "-DBUILD_TESTING=OFF", *options], **environment)
        return folder

    def macros(self, folder):
        """The macros of each of FILES, by name."""
        commands = {entry["file"]: entry for entry in json.loads((folder / "compile_commands.json").read_text())}
        for name in FILES:
            entry = commands[str(self.source / name)]
            # Nothing is included, so that only the flags matter and generated headers need not be there.
            command = re.sub(r" -o \S+ -c \S+$", " -E -dM -x c++ /dev/null", entry["command"])
            status, printed = scratch.run(["sh", "-c", command])
            self.assertEqual(status, 0, printed)
            lines = printed.splitlines()
            self.assertEqual([line for line in lines if not line.startswith("#define ")], [])  # No complaint.
            yield name, dict((line.split(" ", 2) + [""])[1:3] for line in lines if line.startswith("#define "))

    def cached(self, folder, name):
        return re.search(rf"^{name}:[A-Z]+=(.*)$", (folder / "CMakeCache.txt").read_text(), re.MULTILINE).group(1)

    def test_without_a_word_all_is_optimised_and_hardened(self):
        folder = self.configured()
        self.assertEqual(self.cached(folder, "CMAKE_BUILD_TYPE"), "RelWithDebInfo")
        for name, macros in self.macros(folder):
            with self.subTest(file=name):
                self.assertEqual("__SSP_STRONG__" in macros, True)
                self.assertEqual(macros.get("_FORTIFY_SOURCE"), "2" if "__OPTIMIZE__" in macros else None)
                self.assertEqual("_GLIBCXX_ASSERTIONS" in macros, not name.startswith("src/"))
                if "option_parser" not in name:
                    self.assertIn("__OPTIMIZE__", macros)

    def test_the_user_s_flags_win(self):
        folder = self.configured(
            "-DCMAKE_CXX_FLAGS=-Os -fno-stack-protector -D_FORTIFY_SOURCE=3 -U_GLIBCXX_ASSERTIONS -Werror")
        self.assertEqual(self.cached(folder, "CMAKE_BUILD_TYPE"), "")
        for name, macros in self.macros(folder):
            with self.subTest(file=name):
                self.assertIn("__OPTIMIZE_SIZE__", macros)
                self.assertEqual(macros["_FORTIFY_SOURCE"], "3")
                self.assertNotIn("__SSP_STRONG__", macros)
                self.assertNotIn("_GLIBCXX_ASSERTIONS", macros)

    def test_flags_of_the_environment_and_of_a_build_type_win_too(self):
        folder = self.configured("-DCMAKE_BUILD_TYPE=RelWithDebInfo", "-DCMAKE_CXX_FLAGS_RELWITHDEBINFO=-Os -g",
                                 CXXFLAGS="-fstack-protector-all")
        for name, macros in self.macros(folder):
            with self.subTest(file=name):
                self.assertIn("__OPTIMIZE_SIZE__", macros)
                self.assertIn("__SSP_ALL__", macros)
                self.assertEqual(macros["_FORTIFY_SOURCE"], "2")

    def test_calls_are_not_fortified_where_nothing_is_optimised(self):
        for options in (["-DCMAKE_CXX_FLAGS=-O0"], ["-DCMAKE_BUILD_TYPE=Debug"]):
            with self.subTest(options=options):
                for name, macros in self.macros(self.configured(*options)):
                    self.assertNotIn("_FORTIFY_SOURCE", macros, name)
                    self.assertIn("__SSP_STRONG__", macros, name)

    def test_hardening_is_one_switch(self):
        by_itself = scratch.run_or_fail([os.environ["CXX"], "-O2", "-E", "-dM", "-x", "c++", "/dev/null"])
        protected = re.compile(r"(_FORTIFY_SOURCE|__SSP_\w+|_GLIBCXX_ASSERTIONS|__CET__)")
        folder = self.configured("-DEDID_COMPOSER_HARDENING=OFF")
        for name, macros in self.macros(folder):
            with self.subTest(file=name):
                hardened = {macro for macro in macros if protected.fullmatch(macro) and macro not in by_itself}
                self.assertEqual(hardened, set())
        self.assertNotIn("-z,now", (folder / "CMakeCache.txt").read_text())
        rules = "".join(path.read_text() for path in folder.glob("build.ninja"))
        self.assertNotIn("-z,now", rules)

    def test_a_static_only_build_makes_no_shared_library(self):
        folder = self.configured("-DBUILD_SHARED_LIBS=OFF")
        scratch.run_or_fail(["cmake", "--build", folder], timeout=900)
        self.assertEqual({path.name for path in folder.rglob("*.so*")}, set())
        prefix = self.folder / "static_prefix"
        scratch.run_or_fail(["cmake", "--install", folder, "--prefix", prefix])
        self.assertEqual({path for path in scratch.files_below(prefix) if ".so" in path or path.endswith(".a")},
                         {f"{self.libdir}/libedid_composer.a", f"{self.libdir}/libedid_config_store.a"})
        self.assertEqual(scratch.run_or_fail([prefix / "bin/edid-composer", "platform"]),
                         (prefix / "share/edid_composer/platform.toml").read_text())
        # Hosts find it by the same names.
        project = self.source / "tests" / "install" / "consumer"
        scratch.run_or_fail(["cmake", "-S", project, "-B", self.folder / "hosts", "-G", os.environ["GENERATOR"],
                             f"-DCMAKE_PREFIX_PATH={prefix}", "-DWITH_STORE=ON",
                             f"-DTABLE_HOST={self.source}/examples/minimal_host.c"])
        scratch.run_or_fail(["cmake", "--build", self.folder / "hosts"])
        for host in ("table_c_edid_composer", "store_c_edid_composer"):
            self.assertIn("Monitor Name", scratch.run_or_fail([self.folder / "hosts" / host]))
        path = f"{prefix}/{self.libdir}/pkgconfig"
        flags = scratch.run_or_fail(["pkg-config", "--cflags", "--libs", "edid_config_store"], PKG_CONFIG_LIBDIR=path)
        scratch.run_or_fail([os.environ["CC"], project / "store_host.c", "-o", self.folder / "host", *flags.split()])
        self.assertIn("Monitor Name", scratch.run_or_fail([self.folder / "host"]))


if __name__ == "__main__":
    unittest.main()
