"""The Debian packages that cpack makes: contents, dependencies, and that they install and go again without a trace.

All of it happens in a scratch root of its own, with fakeroot, so that nothing of the machine is touched.
"""

import os
import pathlib
import re
import unittest

import contents
import scratch

PACKAGES = {
    "runtime": f"libedid-composer{contents.MAJOR}",
    "development": "libedid-composer-dev",
    "store": f"libedid-config-store{contents.MAJOR}",
    "store_development": "libedid-config-store-dev",
    "tools": "edid-composer",
}
OF_THE_SYSTEM = ("libc6", "libgcc-s1", "libstdc++6")
EXACT = f"(= {contents.VERSION})"
DEPENDS = {
    "runtime": {"libc6"},
    "development": {f"{PACKAGES['runtime']} {EXACT}"},
    "tools": {f"{PACKAGES['runtime']} {EXACT}", f"{PACKAGES['store']} {EXACT}", *OF_THE_SYSTEM},
    "store": set(OF_THE_SYSTEM),
    "store_development": {f"{PACKAGES['store']} {EXACT}", f"{PACKAGES['development']} {EXACT}"},
}


def stanza_of_the_system(package):
    """A package of the machine as dpkg's list of what is installed has it, without what that depends on itself."""
    fields = ("Package", "Version", "Architecture", "Multi-Arch", "Maintainer", "Description")
    shown = "".join(f"{field}: ${{{field}}}\\n" for field in fields)
    lines = scratch.run_or_fail(["dpkg-query", "-W", "-f", shown, package]).splitlines()
    kept = [line for line in lines if line.partition(": ")[0] in fields and line.partition(": ")[2]]
    return "\n".join([*kept, "Status: install ok installed"]) + "\n\n"


class Packages(scratch.ScratchTest):
    @classmethod
    def prepare(cls):
        cls.architecture = scratch.run_or_fail(["dpkg", "--print-architecture"]).strip()
        triplet = scratch.run_or_fail(["dpkg-architecture", "-qDEB_HOST_MULTIARCH"]).strip()
        cls.libdir = f"lib/{triplet}"
        cls.packages = pathlib.Path(os.environ["PACKAGES"])
        cls.made = sorted(cls.packages.glob("*.deb"))

    def package(self, component):
        return self.packages / f"{PACKAGES[component]}_{contents.VERSION}_{self.architecture}.deb"

    def unpacked(self, component):
        folder = self.folder / "unpacked" / component
        if not folder.exists():
            folder.mkdir(parents=True)
            scratch.run_or_fail(["dpkg-deb", "-x", self.package(component), folder])
        return folder

    def field(self, component, name):
        return scratch.run_or_fail(["dpkg-deb", "-f", self.package(component), name]).strip()

    # ---- What they are

    def test_there_is_one_for_each_component(self):
        self.assertEqual(set(self.made), {self.package(component) for component in contents.COMPONENTS})

    def test_each_holds_its_component_and_its_licence(self):
        expected = contents.installed(self.libdir, os.environ["BUILD_TYPE"])
        for component in contents.COMPONENTS:
            with self.subTest(component=component):
                files = {re.sub(r"(/man/man\d/.*)", r"\1.gz", f"usr/{path}") for path in expected[component]}
                files |= {f"usr/share/doc/{PACKAGES[component]}/{name}" for name in ("copyright", "changelog.gz")}
                self.assertEqual(scratch.files_below(self.unpacked(component)), files)
                licence = self.unpacked(component) / f"usr/share/doc/{PACKAGES[component]}/copyright"
                self.assertEqual(licence.read_text(), (self.source / "LICENSE").read_text())

    def test_each_names_what_it_depends_on(self):
        for component in contents.COMPONENTS:
            with self.subTest(component=component):
                depends = self.field(component, "Depends").split(", ")
                # Versions of the system's libraries are those of the machine that builds.
                named = {re.sub(r" \(>= .*\)", "", each) for each in depends}
                self.assertEqual(named, DEPENDS[component])
        self.assertEqual(self.field("tools", "Suggests"), PACKAGES["store_development"])

    def test_files_are_as_debian_expects_them(self):
        program = self.unpacked("tools") / "usr/bin/edid-composer"
        self.assertEqual(scratch.dynamic_entries(program, "RUNPATH") + scratch.dynamic_entries(program, "RPATH"), [])
        libraries = self.unpacked("runtime") / "usr" / self.libdir
        for binary in (program, libraries / f"libedid_composer.so.{contents.VERSION}",
                       self.unpacked("development") / "usr" / self.libdir / "libedid_composer.a"):
            self.assertNotIn(".debug_info", scratch.run_or_fail(["readelf", "-SW", binary]), binary.name)
        for component in contents.COMPONENTS:
            listed = scratch.run_or_fail(["dpkg-deb", "-c", self.package(component)]).splitlines()
            for line in listed:
                self.assertRegex(line, r"^(drwxr-xr-x|-rw-r--r--|-rwxr-xr-x|lrwxrwxrwx) root/root ", component)

    def test_debian_s_checker_accepts_them(self):
        # The licence names no year, and needs none.
        printed = scratch.run_or_fail(["lintian", "--fail-on", "error,warning", "--suppress-tags",
                                       "copyright-without-copyright-notice", *self.made])
        self.assertNotRegex(printed, r"(?m)^[EW]: ")

    def test_the_loader_is_told_of_libraries_by_a_trigger_and_no_script_runs(self):
        for component in contents.COMPONENTS:
            with self.subTest(component=component):
                control = self.folder / f"control of {component}"
                scratch.run_or_fail(["dpkg-deb", "-e", self.package(component), control])
                parts = {path.name for path in control.iterdir()}
                libraries = {"shlibs", "triggers"} if component in ("runtime", "store") else set()
                self.assertEqual(parts, {"control", "md5sums"} | libraries)
                if libraries:
                    self.assertEqual((control / "triggers").read_text(), "activate-noawait ldconfig\n")

    # ---- Installing them

    def new_root(self, name):
        root = self.folder / name
        for folder in ("var/lib/dpkg/info", "var/lib/dpkg/updates", "var/lib/dpkg/triggers", "etc"):
            (root / folder).mkdir(parents=True)
        (root / "etc/ld.so.conf").write_text("/usr/lib\n")
        (root / "var/lib/dpkg/status").write_text("".join(stanza_of_the_system(package) for package in OF_THE_SYSTEM))
        return root

    def dpkg(self, root, *arguments):
        """dpkg on a root of its own."""
        return scratch.run(["fakeroot", "dpkg", f"--root={root}", f"--log={root}/dpkg.log", "--force-unsafe-io",
                            *arguments], PATH=f"{os.environ['PATH']}:/usr/sbin:/sbin")

    def state(self, root, package):
        database = f"--admindir={root}/var/lib/dpkg"
        status, printed = scratch.run(["dpkg-query", database, "-W", "-f", "${db:Status-Status}", package])
        return printed if status == 0 else "not there"

    def test_they_install_run_and_go_without_a_trace(self):
        cache_of_the_machine = pathlib.Path("/etc/ld.so.cache")
        before = cache_of_the_machine.stat().st_mtime_ns
        root = self.new_root("root")
        status, printed = self.dpkg(root, "--install", *(self.package(component) for component in contents.COMPONENTS))
        self.assertEqual(status, 0, printed)
        for package in PACKAGES.values():
            self.assertEqual(self.state(root, package), "installed")

        program = root / "usr/bin/edid-composer"
        output = self.folder / "new.bin"
        scratch.run_or_fail([program, "compose", "-o", output], LD_LIBRARY_PATH=str(root / "usr" / self.libdir))
        self.assertEqual(output.stat().st_size, 256)

        status, printed = self.dpkg(root, "--purge", *PACKAGES.values())
        self.assertEqual(status, 0, printed)
        for package in PACKAGES.values():
            self.assertEqual(self.state(root, package), "not there")
        self.assertEqual({path for path in scratch.files_below(root) if path.startswith("usr/")}, set())
        self.assertEqual(cache_of_the_machine.stat().st_mtime_ns, before)

    def test_the_program_is_not_set_up_without_the_libraries(self):
        root = self.new_root("root_without_libraries")
        status, printed = self.dpkg(root, "--install", self.package("tools"))
        self.assertNotEqual(status, 0)
        self.assertIn(f"edid-composer depends on {PACKAGES['runtime']}", printed)
        self.assertNotEqual(self.state(root, PACKAGES["tools"]), "installed")

    def test_a_library_that_the_program_needs_is_not_removed(self):
        root = self.new_root("root_of_the_program")
        needed = ("runtime", "store", "tools")
        self.assertEqual(self.dpkg(root, "--install", *(self.package(component) for component in needed))[0], 0)
        status, printed = self.dpkg(root, "--remove", PACKAGES["store"])
        self.assertNotEqual(status, 0)
        self.assertIn(f"edid-composer depends on {PACKAGES['store']}", printed)
        self.assertEqual(self.state(root, PACKAGES["store"]), "installed")


if __name__ == "__main__":
    unittest.main()
