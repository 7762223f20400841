"""The example recipes for Buildroot and Yocto, as far as can be seen without either: how they are written, the licence's
hash, the version, and that their options are options of the build."""

import hashlib
import os
import pathlib
import re
import shlex
import unittest

import contents
import scratch

# What Buildroot does with a package of CMake, as far as variables go.
SHOW = r"""
define cmake-package
$(foreach name,VERSION SITE SITE_METHOD LICENSE LICENSE_FILES INSTALL_STAGING CONF_OPTS,$(info $(name)=$(LIBEDID_COMPOSER_$(name))))
endef
BR2_EXTERNAL_EDID_COMPOSER_PATH := {place}
include {place}/external.mk
all:
"""


class Recipes(scratch.ScratchTest):
    @classmethod
    def prepare(cls):
        cls.packaging = cls.source / "packaging"
        cls.licence = (cls.source / "LICENSE").read_bytes()

    def assert_options_are_the_build_s(self, options, name):
        """CMake warns of options that nobody asks for."""
        printed = scratch.run_or_fail(["cmake", "-S", self.source, "-B", self.folder / name, "-G",
                                       os.environ["GENERATOR"], f"-DCMAKE_C_COMPILER={os.environ['CC']}",
                                       f"-DCMAKE_CXX_COMPILER={os.environ['CXX']}", *options])
        self.assertGreater(len(options), 2)
        self.assertNotIn("CMake Warning", printed)
        cache = (self.folder / name / "CMakeCache.txt").read_text()
        for option in options:
            key, _, value = option.removeprefix("-D").partition("=")
            self.assertRegex(cache, rf"(?m)^{key}:BOOL={value}$")

    # ---- Buildroot

    def test_buildroot_s_makefile(self):
        makefile = self.folder / "Makefile"
        makefile.write_text(SHOW.format(place=self.packaging / "buildroot"))
        printed = scratch.run_or_fail(["make", "-f", makefile, "--warn-undefined-variables"])
        self.assertNotIn("warning", printed)
        values = dict(line.partition("=")[::2] for line in printed.splitlines() if "=" in line)
        self.assertEqual(values["VERSION"], contents.VERSION)
        self.assertEqual(values["SITE_METHOD"], "local")
        self.assertTrue(pathlib.Path(values["SITE"]).samefile(self.source))
        self.assertEqual((values["LICENSE"], values["LICENSE_FILES"]), ("MIT", "LICENSE"))
        self.assertTrue(self.licence.startswith(b"MIT License\n"))
        self.assert_options_are_the_build_s(values["CONF_OPTS"].split(), "buildroot")

    def test_buildroot_s_hash_is_the_licence_s(self):
        hashes = (self.packaging / "buildroot/package/libedid-composer/libedid-composer.hash").read_text().splitlines()
        self.assertEqual(hashes[1].split("  "), ["sha256", hashlib.sha256(self.licence).hexdigest(), "LICENSE"])

    def test_buildroot_s_menus(self):
        root = self.packaging / "buildroot"
        description = dict(line.split(": ", 1) for line in (root / "external.desc").read_text().splitlines())
        sourced = re.fullmatch(r'source "\$(\w+)/(.*)"\n', (root / "Config.in").read_text())
        self.assertEqual(sourced.group(1), f"BR2_EXTERNAL_{description['name']}_PATH")
        for line in (root / sourced.group(2)).read_text().splitlines():
            self.assertRegex(line, r"^$|^config BR2_PACKAGE_LIBEDID_COMPOSER$|^comment \".*\"$|^\t{2}!?\w+$"
                                   r"|^\t(bool \".*\"|help|depends on (!?BR2_\w+)( \|\| \\)?( # .*)?)$|^\t  \S.{0,61}$")

    # ---- Yocto

    def test_yocto_s_recipe(self):
        recipe, = self.packaging.glob("yocto/recipes-*/*/*.bb")
        self.assertEqual(recipe.name, f"libedid-composer_{contents.VERSION}.bb")
        text = recipe.read_text().replace("\\\n", "")
        values = {}
        for line in text.splitlines():
            if line and not line.startswith("#") and not line.startswith("inherit "):
                name, value = re.fullmatch(r'([A-Z_]+) = "([^"]*)"', line).groups()
                values[name] = value
        self.assertIn("inherit cmake externalsrc", text.splitlines())
        self.assertEqual(values["LICENSE"], "MIT")
        self.assertEqual(values["LIC_FILES_CHKSUM"], f"file://LICENSE;md5={hashlib.md5(self.licence).hexdigest()}")
        steps = re.search(r"'([./]+)'", values["EXTERNALSRC"]).group(1)
        self.assertTrue((recipe.parent / steps).samefile(self.source))
        compile(re.fullmatch(r"\$\{@(.*)\}", values["EXTERNALSRC"]).group(1), str(recipe), "eval")
        self.assert_options_are_the_build_s(shlex.split(values["EXTRA_OECMAKE"]), "yocto")

    def test_yocto_s_layer_finds_the_recipe(self):
        layer = self.packaging / "yocto"
        values = dict(re.findall(r'(?m)^(\w[\w-]*) (?:\.|\+)?= "([^"]*)"$', (layer / "conf/layer.conf").read_text()))
        pattern = values["BBFILES"].removeprefix("${LAYERDIR}/")
        self.assertEqual(len(list(layer.glob(pattern))), 1)
        collection = values["BBFILE_COLLECTIONS"]
        for name in ("BBFILE_PATTERN", "BBFILE_PRIORITY", "LAYERDEPENDS", "LAYERSERIES_COMPAT"):
            self.assertIn(f"{name}_{collection}", values)


if __name__ == "__main__":
    unittest.main()
