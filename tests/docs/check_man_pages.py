#!/usr/bin/env python3
"""Holds the manual pages to the program and the header, and has them formatted without a warning.

edid-composer(1) names every command and option of --help, and no other; the synopsis of edid_composer(3) is compiled
against the header. Examples are compared with --help, compiled, or loaded.
"""

import argparse
import pathlib
import re
import shutil
import sys

import command_lines
import platform_keys
import scratch as scratch_folder
import snippets

MACRO_WORDS = re.compile(r'"[^"]*"|\S+')
EXAMPLE_CONTEXT = """
void example(const u8 *sink, u32 sink_size, void (*show)(const u8 *));
void example(const u8 *sink, u32 sink_size, void (*show)(const u8 *)) {
"""


def words(line):
    """The arguments of a macro line."""
    return [word.strip('"') for word in MACRO_WORDS.findall(line)][1:]


def displays(text):
    """The literal displays of a page."""
    return re.findall(r"^\.Bd -literal.*?\n(.*?)^\.Ed$", text, re.MULTILINE | re.DOTALL)


def display_lines(text):
    """Its displays of a single line."""
    return re.findall(r"^\.Dl (.*)$", text, re.MULTILINE)


def declarations(text):
    """The synopsis of a page as C declarations."""
    found = []
    result = None
    opened = None
    for line in text.splitlines():
        macro = line.split(" ", 1)[0]
        if macro == ".Ft":
            result = " ".join(words(line))
        elif macro == ".Fn" and result:
            name, *parameters = words(line)
            found.append(f"{result} {name}({', '.join(parameters)});")
            result = None
        elif macro == ".Fo":
            opened = (words(line)[0], [])
        elif macro == ".Fa" and opened:
            opened[1].append(words(line)[0])
        elif macro == ".Fc":
            found.append(f"{result} {opened[0]}({', '.join(opened[1])});")
            result, opened = None, None
        elif macro == ".Vt":
            found.append(f"{line.removeprefix('.Vt ').removesuffix(' ;')};")
    return found


def options_of_page(text):
    """The options that a page's list names, written as on the command line."""
    options = set()
    for line in re.findall(r"^\.It (Fl .*)$", text, re.MULTILINE):
        macro = ""
        for word in line.split():
            if word in ("Fl", "Ar", "Cm"):
                macro = word
            elif macro == "Fl" and word != ",":
                options.add(f"-{word}")
    return options


def commands_of_page(text):
    return set(re.findall(r"^\.It Cm (\S+)$", text, re.MULTILINE))


def formatting_problems(scratch, page):
    """What man and groff warn about, as far as they are installed."""
    for command in ("man --warnings=w -E UTF-8 -l", "groff -mandoc -ww -Tutf8"):
        if shutil.which(command.split()[0]) is None:
            print(f"formatting is not checked with {command.split()[0]}, which is not installed")
            continue
        status, printed = scratch.run(["sh", "-c", f'exec {command} "$1" >/dev/null', "sh", str(page)])
        yield from printed.splitlines()
        if status != 0:
            yield f"{command} ended with status {status}"


def program_problems(scratch, text):
    told = command_lines.Help(scratch)
    options = set().union(*told.options.values())
    yield from (f"the command {name} is missing" for name in sorted(set(told.commands) - commands_of_page(text)))
    yield from (f"there is no command {name}" for name in sorted(commands_of_page(text) - set(told.commands)))
    yield from (f"the option {name} is missing" for name in sorted(options - options_of_page(text)))
    yield from (f"there is no option {name}" for name in sorted(options_of_page(text) - options))
    examples = [line for part in (*displays(text), *display_lines(text)) for line in command_lines.invocations(part)]
    if not examples:
        yield "there is no example"
    for line in examples:
        yield from told.problems(line)


def header_problems(scratch, text, compiler):
    declared = declarations(text)
    if len(declared) < 10:
        yield f"only {len(declared)} declarations found in the synopsis"
    lines = [snippets.C_HEADER, *declared]
    for number, example in enumerate(displays(text)):
        lines += [EXAMPLE_CONTEXT.replace("example", f"example_{number}"), example, "}"]
    source = scratch.write("synopsis.c", "\n".join(lines))
    status, printed = scratch.run([compiler, *snippets.C_FLAGS, "-fsyntax-only", str(source)])
    if status != 0:
        yield f"the synopsis or the example is not as the header has it:\n{printed}"


def configuration_problems(scratch, text):
    known = platform_keys.asked_for(scratch)
    examples = [example for example in displays(text) if example.startswith("[")]
    if not examples:
        yield "there is no example"
    for example in examples:
        yield from platform_keys.problems(scratch, example, known)


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--source", type=pathlib.Path, required=True)
    parser.add_argument("--prefix", type=pathlib.Path, required=True)
    parser.add_argument("--libdir", default="lib")
    parser.add_argument("--cc", default="cc")
    arguments = parser.parse_args()

    pages = arguments.source / "docs" / "man"
    with scratch_folder.Scratch(arguments.source, arguments.prefix, arguments.libdir) as scratch:
        checks = {
            "edid-composer.1": lambda text: program_problems(scratch, text),
            "edid_composer.3": lambda text: header_problems(scratch, text, arguments.cc),
            "edid-platform.toml.5": lambda text: configuration_problems(scratch, text),
        }
        found = []
        for name, check in checks.items():
            page = pages / name
            for problem in (*formatting_problems(scratch, page), *check(page.read_text())):
                found.append(f"{name}: {problem}")
    for problem in found:
        print(problem, file=sys.stderr)
    print(f"{len(checks)} manual pages: {len(found)} problems")
    return 1 if found else 0


if __name__ == "__main__":
    sys.exit(main())
