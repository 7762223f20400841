"""What is installed, by component: the one list that the tests of `cmake --install` and of the packages share."""

import os

VERSION = os.environ["VERSION"]
MAJOR = VERSION.partition(".")[0]
COMPONENTS = ("runtime", "development", "store", "store_development", "tools")


def shared_library(name, libdir):
    return {f"{libdir}/lib{name}.so.{MAJOR}", f"{libdir}/lib{name}.so.{VERSION}"}


def cmake_targets(name, libdir, build_type):
    folder = f"{libdir}/cmake/edid_composer"
    return {f"{folder}/{name}-targets.cmake", f"{folder}/{name}-targets-{build_type.lower()}.cmake"}


def development_files(name, libdir, build_type):
    return {f"{libdir}/lib{name}.so", f"{libdir}/lib{name}.a", f"{libdir}/pkgconfig/{name}.pc"} | cmake_targets(
        name, libdir, build_type)


def installed(libdir, build_type):
    """The paths of each component, below the prefix."""
    package = f"{libdir}/cmake/edid_composer/edid_composer-config"
    return {
        "runtime": shared_library("edid_composer", libdir),
        "development": {
            "include/edid_composer.h",
            f"{package}.cmake",
            f"{package}-version.cmake",
            "share/man/man3/edid_composer.3",
        } | development_files("edid_composer", libdir, build_type),
        "store": shared_library("edid_config_store", libdir),
        "store_development": {
            "include/edid_composer/config_store.h",
            "share/edid_composer/platform.toml",
            "share/man/man5/edid-platform.toml.5",
        } | development_files("edid_config_store", libdir, build_type),
        "tools": {
            "bin/edid-composer",
            "share/man/man1/edid-composer.1",
            "share/bash-completion/completions/edid-composer",
        },
    }
