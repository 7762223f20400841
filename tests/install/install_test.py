"""What `cmake --install` puts where, and that hosts outside of the tree build on it and run."""

import os
import pathlib
import shutil
import unittest

import contents
import scratch

TABLE_HOST_SHOWS = 'Monitor Name : "Table Box"'
STORE_HOST_SHOWS = 'Monitor Name : "Media Box"'
C_FLAGS = ["-Wall", "-Wextra", "-Wpedantic", "-Werror"]
C = [os.environ["CC"], "-std=c11", "-x", "c"]
# In C++, members that are left out are 0, too, but are warned of.
CXX = [os.environ["CXX"], "-std=c++20", "-x", "c++"]
CXX_FLAGS = [*C_FLAGS, "-Wno-missing-field-initializers"]


class Install(scratch.ScratchTest):
    @classmethod
    def prepare(cls):
        cls.expected = contents.installed(cls.libdir, os.environ["BUILD_TYPE"])
        cls.prefixes = {component: cls.install(component, [component]) for component in contents.COMPONENTS}
        # Moved: only pkg-config's files know their prefix.
        installed = cls.install("anywhere", contents.COMPONENTS)
        cls.everything = installed.rename(cls.folder / "somewhere else")
        cls.without_store = cls.install("without_store", ["runtime", "development"])
        cls.table_host = cls.source / "examples" / "minimal_host.c"
        cls.store_host = cls.source / "tests" / "install" / "consumer" / "store_host.c"

    @classmethod
    def install(cls, name, components):
        for component in components:
            scratch.run_or_fail(["cmake", "--install", cls.build, "--prefix", cls.folder / name, "--component",
                                 component])
        return cls.folder / name

    # ---- What is there

    def test_each_component_is_what_it_says(self):
        for component in contents.COMPONENTS:
            with self.subTest(component=component):
                self.assertEqual(scratch.files_below(self.prefixes[component]), self.expected[component])

    def test_all_components_together_are_what_an_install_without_naming_one_gives(self):
        scratch.run_or_fail(["cmake", "--install", self.build, "--prefix", self.folder / "all"])
        self.assertEqual(scratch.files_below(self.folder / "all"), set().union(*self.expected.values()))

    def test_libraries_have_versioned_names(self):
        for name in ("edid_composer", "edid_config_store"):
            with self.subTest(library=name):
                library = self.everything / self.libdir / f"lib{name}.so"
                soname = f"lib{name}.so.{contents.MAJOR}"
                self.assertEqual(scratch.dynamic_entries(library, "SONAME"), [soname])
                self.assertEqual(os.readlink(library), soname)
                self.assertEqual(os.readlink(library.with_name(soname)), f"lib{name}.so.{contents.VERSION}")

    def test_nothing_that_is_installed_names_the_source_or_the_prefix(self):
        texts = [path for path in scratch.files_below(self.everything) if path.endswith((".cmake", ".h"))]
        self.assertGreater(len(texts), 6)
        for path in texts:
            text = (self.everything / path).read_text()
            for place in (self.source, self.build, self.folder):
                self.assertNotIn(str(place), text, path)

    def test_the_program_runs_from_any_prefix(self):
        program = self.everything / "bin" / "edid-composer"
        self.assertEqual(scratch.run(["env", "-u", "LD_LIBRARY_PATH", program, "audio-mask", "1"])[0], 0)
        sink = self.source / "examples" / "sinks" / "tv_4k.txt"
        scratch.run_or_fail([program, "compose", "--sink", sink, "-o", self.folder / "new.bin"])
        self.assertEqual((self.folder / "new.bin").stat().st_size, 256)

    def test_the_installed_platform_is_the_program_s_own(self):
        platform = self.everything / "share" / "edid_composer" / "platform.toml"
        program = self.everything / "bin" / "edid-composer"
        self.assertEqual(scratch.run_or_fail([program, "platform"]), platform.read_text())

    # ---- Hosts with pkg-config

    def pkg_config(self, prefix, *arguments, **environment):
        path = str(prefix / self.libdir / "pkgconfig")
        moved = ["--define-prefix"] if prefix == self.everything else []
        flags = scratch.run_or_fail(["pkg-config", *moved, *arguments], PKG_CONFIG_PATH=path, PKG_CONFIG_LIBDIR=path,
                                    **environment).strip()
        # pkg-config writes a blank of a path as "\ ".
        return [flag.replace("\0", " ") for flag in flags.replace("\\ ", "\0").split()]

    def build_and_run(self, prefix, compiler, source, flags):
        program = self.folder / "program"
        warnings = C_FLAGS if compiler is C else CXX_FLAGS
        scratch.run_or_fail([*compiler, *warnings, source, "-x", "none", "-o", program, *flags])
        printed = scratch.run_or_fail([program], LD_LIBRARY_PATH=str(prefix / self.libdir))
        return printed, {name.partition(".so")[0] for name in scratch.dynamic_entries(program, "NEEDED")}

    @unittest.skipUnless(shutil.which("pkg-config"), "pkg-config is not installed")
    def test_hosts_with_their_own_configuration_build_with_pkg_config(self):
        for prefix in (self.everything, self.without_store):
            for compiler in (C, CXX):
                with self.subTest(prefix=prefix.name, compiler=compiler):
                    flags = self.pkg_config(prefix, "--cflags", "--libs", "edid_composer")
                    printed, needed = self.build_and_run(prefix, compiler, self.table_host, flags)
                    self.assertIn(TABLE_HOST_SHOWS, printed)
                    self.assertIn("libedid_composer", needed)

    @unittest.skipUnless(shutil.which("pkg-config"), "pkg-config is not installed")
    def test_hosts_link_the_static_variant_with_pkg_config(self):
        for compiler in (C, CXX):
            with self.subTest(compiler=compiler):
                flags = [*self.pkg_config(self.without_store, "--cflags", "edid_composer"),
                         *self.pkg_config(self.without_store, "--variable=archive", "edid_composer")]
                printed, needed = self.build_and_run(self.without_store, compiler, self.table_host, flags)
                self.assertIn(TABLE_HOST_SHOWS, printed)
                self.assertNotIn("libedid_composer", needed)
                if compiler is C:
                    # The C library, of which the dynamic loader is a part.
                    self.assertEqual(needed - {"ld-linux-x86-64"}, {"libc"})

    @unittest.skipUnless(shutil.which("pkg-config"), "pkg-config is not installed")
    def test_hosts_on_the_store_build_with_pkg_config(self):
        archive = self.pkg_config(self.everything, "--variable=archive", "edid_composer")
        archive = [" ".join(archive)]  # A variable is given as it is, blanks included.
        for compiler in (C, CXX):
            for static in (False, True):
                with self.subTest(compiler=compiler, static=static):
                    flags = ["-Wl,--as-needed", *(archive if static else []),
                             *self.pkg_config(self.everything, "--cflags", "--libs", "edid_config_store")]
                    printed, needed = self.build_and_run(self.everything, compiler, self.store_host, flags)
                    self.assertIn(STORE_HOST_SHOWS, printed)
                    self.assertIn("address FFFF", printed)
                    self.assertIn("libedid_config_store", needed)
                    self.assertEqual("libedid_composer" in needed, not static)

    @unittest.skipUnless(shutil.which("pkg-config"), "pkg-config is not installed")
    def test_pkg_config_s_files_name_the_prefix_only_so_that_a_sysroot_can_stand_before_it(self):
        sysroot = self.folder / "sysroot"
        for component in contents.COMPONENTS:
            scratch.run_or_fail(["cmake", "--install", self.build, "--prefix", "/usr", "--component", component],
                                DESTDIR=str(sysroot))
        for name in ("edid_composer", "edid_config_store"):
            with self.subTest(package=name):
                text = (sysroot / "usr" / self.libdir / "pkgconfig" / f"{name}.pc").read_text()
                self.assertIn("\nprefix=/usr\n", "\n" + text)
                # Every version puts the sysroot before what begins with the prefix, and 0.29 twice where it stands already.
                self.assertNotIn("pcfiledir", text)
                self.assertNotIn(str(sysroot), text)
        in_sysroot = {"PKG_CONFIG_SYSROOT_DIR": str(sysroot)}
        flags = self.pkg_config(sysroot / "usr", "--cflags", "--libs", "edid_config_store", **in_sysroot)
        self.assertIn(f"-I{sysroot}/usr/include/edid_composer", flags)
        printed, _ = self.build_and_run(sysroot / "usr", C, self.store_host, flags)
        self.assertIn(STORE_HOST_SHOWS, printed)
        archive = self.pkg_config(sysroot / "usr", "--variable=archive", "edid_composer", **in_sysroot)
        self.assertTrue(pathlib.Path(archive[0]).samefile(sysroot / "usr" / self.libdir / "libedid_composer.a"), archive)

    @unittest.skipUnless(shutil.which("pkg-config"), "pkg-config is not installed")
    def test_hosts_link_the_static_store_with_pkg_config(self):
        flags = ["-static", *self.pkg_config(self.everything, "--cflags", "--static", "--libs", "edid_config_store")]
        printed, needed = self.build_and_run(self.everything, C, self.store_host, flags)
        self.assertIn(STORE_HOST_SHOWS, printed)
        self.assertEqual(needed, set())

    # ---- Hosts with CMake

    def configure(self, name, prefix, *options):
        project = self.source / "tests" / "install" / "consumer"
        compilers = [f"-DCMAKE_C_COMPILER={os.environ['CC']}", f"-DCMAKE_CXX_COMPILER={os.environ['CXX']}"]
        return scratch.run(["cmake", "-S", project, "-B", self.folder / name, "-G", os.environ["GENERATOR"], *compilers,
                            f"-DCMAKE_PREFIX_PATH={prefix}", f"-DTABLE_HOST={self.table_host}", *options])

    def assert_hosts_run(self, name, prefix, hosts, *options):
        status, printed = self.configure(name, prefix, *options)
        self.assertEqual(status, 0, printed)
        scratch.run_or_fail(["cmake", "--build", self.folder / name])
        for host, shows in hosts.items():
            for language in ("c", "cxx"):
                for variant in ("edid_composer", "edid_composer_static"):
                    with self.subTest(host=host, language=language, variant=variant):
                        program = self.folder / name / f"{host}_{language}_{variant}"
                        self.assertIn(shows, scratch.run_or_fail([program]))
                        needed = [each.partition(".so")[0] for each in scratch.dynamic_entries(program, "NEEDED")]
                        self.assertEqual("libedid_composer" in needed, variant == "edid_composer")

    def test_hosts_build_with_cmake(self):
        hosts = {"table": TABLE_HOST_SHOWS, "store": STORE_HOST_SHOWS}
        self.assert_hosts_run("with_store_build", self.everything, hosts, "-DWITH_STORE=ON")

    def test_hosts_build_with_cmake_where_the_store_is_not_installed(self):
        self.assert_hosts_run("without_store_build", self.without_store, {"table": TABLE_HOST_SHOWS})

    def test_cmake_refuses_a_host_that_needs_a_store_that_is_not_there(self):
        status, printed = self.configure("refused_build", self.without_store, "-DWITH_STORE=ON")
        self.assertNotEqual(status, 0)
        self.assertIn("The configuration store (component config_store) is not installed.", " ".join(printed.split()))


if __name__ == "__main__":
    unittest.main()
