"""What is installed, by component: the one list that the tests of `cmake --install` and of the packages share."""

import os

VERSION = os.environ["VERSION"]
MAJOR = VERSION.partition(".")[0]
COMPONENTS = ("runtime", "development", "tools", "store")


def shared_library(name, libdir):
    return {f"{libdir}/lib{name}.so.{MAJOR}", f"{libdir}/lib{name}.so.{VERSION}"}


def cmake_targets(name, libdir, build_type):
    folder = f"{libdir}/cmake/edid_composer"
    return {f"{folder}/{name}-targets.cmake", f"{folder}/{name}-targets-{build_type.lower()}.cmake"}


def installed(libdir, build_type):
    """The paths of each component, below the prefix."""
    package = f"{libdir}/cmake/edid_composer/edid_composer-config"
    completion = {"share/bash-completion/completions/edid-composer"}
    return {
        "runtime": shared_library("edid_composer", libdir),
        "development": {
            "include/edid_composer.h",
            f"{libdir}/libedid_composer.so",
            f"{libdir}/libedid_composer.a",
            f"{libdir}/pkgconfig/edid_composer.pc",
            f"{package}.cmake",
            f"{package}-version.cmake",
            "share/man/man3/edid_composer.3",
        } | cmake_targets("edid_composer", libdir, build_type),
        "tools": {"bin/edid-composer", "share/man/man1/edid-composer.1"} | completion,
        "store": {
            "include/edid_composer/config_store.h",
            f"{libdir}/libedid_config_store.so",
            f"{libdir}/pkgconfig/edid_config_store.pc",
            "share/edid_composer/platform.toml",
            "share/man/man5/edid-platform.toml.5",
        } | shared_library("edid_config_store", libdir) | cmake_targets("edid_config_store", libdir, build_type),
    }
