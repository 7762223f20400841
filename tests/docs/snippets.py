"""What is done with a document's blocks, one function for each language. Each returns None, or what is wrong."""

import command_lines
import expected_output
import platform_keys

C_FLAGS = ("-std=c11", "-Wall", "-Wextra", "-Wpedantic", "-Werror")
C_FRAGMENT_FLAGS = ("-Wno-unused-variable", "-Wno-unused-but-set-variable", "-Wno-unused-function")
C_LIBRARIES = ("-ledid_config_store", "-ledid_composer")
C_HEADER = """#include <config_store.h>
#include <edid_composer.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
"""


class Runner:
    """Runs the blocks of one document, in order, in one scratch folder."""

    def __init__(self, scratch, compiler, with_build_blocks):
        self.scratch = scratch
        self.compiler = compiler
        self.with_build_blocks = with_build_blocks
        self.help = command_lines.Help(scratch)
        self.known_keys = platform_keys.asked_for(scratch)
        self.last_program = None
        self.ran = 0
        self.only_checked = 0

    def run(self, block, expected):
        """Runs a block; @p expected is the text that it shall print, or None."""
        languages = {"sh": self._sh, "toml": self._toml, "c": self._c, "cmake": self._cmake}
        if block.language not in languages:
            return f"nothing is known of the language '{block.language}'"
        self.ran += 1
        return languages[block.language](block, expected)

    def _compare(self, status, printed, expected):
        if status != 0:
            return f"ended with status {status} and printed:\n{printed}"
        if expected is None:
            return None
        return expected_output.difference(expected, printed)

    def _sh(self, block, expected):
        for words in command_lines.invocations(block.text):
            problems = self.help.problems(words)
            if problems:
                return "\n".join(problems)
        if "hardware" in block.words or ("build" in block.words and not self.with_build_blocks):
            self.ran -= 1
            self.only_checked += 1
            status, printed = self.scratch.run(["sh", "-n"], block.text.encode())
            return self._compare(status, printed, None)
        return self._compare(*self.scratch.run(["sh", "-e", "-c", block.text]), expected)

    def _toml(self, block, expected):
        if expected is not None:
            return "a TOML block prints nothing"
        if block.words:
            self.scratch.write(block.words[0], block.text)
        problems = platform_keys.problems(self.scratch, block.text, self.known_keys)
        return "\n".join(problems) or None

    def _c(self, block, expected):
        kind = block.words[0] if block.words else ("program" if "int main(" in block.text else "fragment")
        if kind == "program":
            return self._c_program(block, expected)
        if expected is not None:
            return "only a program prints anything"
        if kind == "declarations":
            text = C_HEADER + block.text
        elif kind == "fragment":
            text = f"{C_HEADER}void fragment(void);\nvoid fragment(void) {{\n{block.text}}}\n"
        else:
            return f"a C block is a fragment, declarations or a program, not '{kind}'"
        source = self.scratch.write("snippet.c", text)
        command = [self.compiler, *C_FLAGS, *C_FRAGMENT_FLAGS, "-fsyntax-only", str(source)]
        return self._compare(*self.scratch.run(command), None)

    def _c_program(self, block, expected):
        self.last_program = block.text
        names = [word for word in block.words if word.endswith(".c")]
        source = self.scratch.write(names[0] if names else "snippet.c", block.text)
        libraries = C_LIBRARIES if "config_store.h" in block.text else ("-ledid_composer",)
        command = [self.compiler, *C_FLAGS, str(source), "-o", "snippet", *libraries]
        status, printed = self.scratch.run(command)
        if status != 0 or "run" not in block.words:
            return self._compare(status, printed, expected)
        return self._compare(*self.scratch.run(["./snippet"]), expected)

    def _cmake(self, block, expected):
        """Configures and builds a project around the fragment, with the last program that the document showed."""
        if self.last_program is None or expected is not None:
            return "a CMake block follows the C program that it builds, and prints nothing"
        lines = ["cmake_minimum_required(VERSION 3.22)", "project(host C)"]
        if "add_executable(" not in block.text:
            lines.append("add_executable(host host.c)")
        self.scratch.write("project/CMakeLists.txt", "\n".join([*lines, block.text]))
        self.scratch.write("project/host.c", self.last_program)
        for command in (["cmake", "-S", "project", "-B", "project/build"], ["cmake", "--build", "project/build"]):
            # The package itself has to say where header and libraries are.
            status, printed = self.scratch.run(command, without=("CPATH", "LIBRARY_PATH"))
            if status != 0:
                return self._compare(status, printed, None)
        return None
