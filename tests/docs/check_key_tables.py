#!/usr/bin/env python3
"""Holds what is written of the configuration's keys to what the library does.

The tables of platform-configuration.md and the list of edid-platform.toml(5) name every key that the library reads and
no other; limits and defaults are compared with those that it names itself when values are missing, too small and too
large. So is the library's own table, as "edid-composer platform --keys" prints it, and the comments of the default
platform are compared with that.
"""

import argparse
import pathlib
import re
import sys

import markdown
import platform_keys
import scratch as scratch_folder

RANGE = re.compile(r"(-?\d+) to (-?\d+)")
SMALLEST, LARGEST = -2147483648, 4294967295


def of_markdown(text):
    """Each key's limits and default as a table has them; None if they are not numbers."""
    keys = {}
    for table in markdown.tables(text):
        for row in table:
            if "Key" not in row:
                continue
            limits = RANGE.fullmatch(row["Limits"])
            is_number = row["Type"] == "integer" and limits is not None
            keys[row["Key"].split("`")[1]] = (limits[1], limits[2], row["Default"]) if is_number else None
    return keys


def of_man_page(text):
    """The same from a manual page: an item for each key, and the sentence after it."""
    keys = {}
    for name, sentence in re.findall(r"^\.It Ic (\S+)\n(.*)$", text, re.MULTILINE):
        number = re.match(rf"Integer, {RANGE.pattern}; default (\S+)\.$", sentence)
        keys[name] = (number[1], number[2], number[3]) if number else None
    return keys


def of_library(scratch):
    """The same from the library itself."""
    asked = platform_keys.asked_for(scratch)
    numbers = [path for path, (kind, _) in asked.items() if kind == "number"]
    limits = {}
    for value in (SMALLEST, 2147483647, LARGEST):
        text = "".join(f"{path} = {value}\n" for path in numbers)
        limits.update(platform_keys.limits(platform_keys.compose(scratch, text)[1]))
    keys = {}
    for path, (kind, default) in asked.items():
        # A number that nothing is too large for is unsigned and may be any.
        low, high = limits.get(path, ("0", str(LARGEST)))
        keys[path.removeprefix(f"{platform_keys.DOMAIN}.")] = (low, high, default) if kind == "number" else None
    return keys


def of_hdmi2(scratch):
    """The same of the table hdmi2, whose missing keys have their defaults without a word: the traces have them."""
    table = f"[{platform_keys.DOMAIN}.hdmi2]\n"
    read = re.compile(rf"Platform config read\. Path:{re.escape(platform_keys.DOMAIN)}\.(hdmi2\.\S+) val:(-?\d+)")
    limited = re.compile(r"The value of (hdmi2\.\S+) is \w+ than .* Min:(-?\d+) Val:-?\d+ Max:(-?\d+)")
    in_list = re.compile(r"(hdmi2\.\S+) holds a VIC that is not supported")

    def compose(text):
        return scratch.run(["edid-composer", "compose", "--debug", "--platform", "-", "-o", "-"], text.encode())[1]

    defaults = dict(read.findall(compose(table + "enable = 1\n")))
    names = [name.removeprefix("hdmi2.") for name in defaults]
    limits = {}
    for value in (SMALLEST, 2147483647):
        enable = max(value, 1)  # Without it, no other key is read.
        text = table + f"enable = {enable}\n" + "".join(f"{name} = {value}\n" for name in names)
        limits.update({name: (low, high) for name, low, high in limited.findall(compose(text))})
    keys = {name: (*limits[name], default) for name, default in (defaults | {"hdmi2.enable": "0"}).items()}
    lists = compose(table + "enable = 1\nvic_priority_list = [1]\nvic_addition_list = [1]\n")
    return keys | dict.fromkeys(in_list.findall(lists))


def of_table(text):
    """The same from the library's own table."""
    keys = {}
    for line in text.splitlines()[1:]:
        name, kind, limits, default = re.split(r"  +", line)[:4]
        number = RANGE.fullmatch(limits)
        is_number = kind == "integer" and number is not None
        keys[name.split(" to ")[0]] = (number[1], number[2], default) if is_number else None
    return keys


def limits_in_words(low, high):
    """How the default platform's comments may write limits."""
    values = [str(value) for value in range(int(low), int(high) + 1)] if int(high) - int(low) <= 2 else []
    upper = rf"(?:{high}|0x{int(high):X})"
    listed = [", ".join(values[:-1]) + " or " + values[-1]] if len(values) > 1 else []
    return "|".join([*map(re.escape, listed), rf"\b{low} to {upper}\b", rf"\b{low} or {high}\b"])


def comment_problems(text, library):
    """What the default platform's comments lack about the keys below them."""
    for block in re.split(r"\n\n", text):
        comment = " ".join(line.lstrip("# ") for line in block.splitlines() if line.startswith("#"))
        for name in re.findall(r"^(\w+) = ", block, re.MULTILINE):
            key = next((key for key in (name, f"audio.{name}", f"hdmi2.{name}") if library.get(key)), None)
            if key is None:
                continue
            low, high, default = library[key]
            if not re.search(limits_in_words(low, high), comment):
                yield f"platform.toml: the comment of {name} does not have its limits, {low} to {high}: {comment}"
            if not re.search(rf"[Dd]efault {default}\b", comment):
                yield f"platform.toml: the comment of {name} does not have its default, {default}: {comment}"


def problems(documented, library, name):
    audio_entries = {key for key in documented if platform_keys.AUDIO_ENTRY.fullmatch(f"{platform_keys.DOMAIN}.{key}")}
    if not audio_entries:
        yield f"{name}: the audio entries are missing"
    for key in sorted(library.keys() - documented.keys()):
        yield f"{name}: {key} is missing"
    for key in sorted(documented.keys() - library.keys() - audio_entries):
        yield f"{name}: {key} is read by nobody"
    for key in sorted(documented.keys() & library.keys()):
        if documented[key] != library[key]:
            yield f"{name}: {key} is documented as {documented[key]}, but is {library[key]}"


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--source", type=pathlib.Path, required=True)
    parser.add_argument("--prefix", type=pathlib.Path, required=True)
    parser.add_argument("--libdir", default="lib")
    arguments = parser.parse_args()

    documents = {
        "docs/platform-configuration.md": of_markdown,
        "docs/man/edid-platform.toml.5": of_man_page,
    }
    with scratch_folder.Scratch(arguments.source, arguments.prefix, arguments.libdir) as scratch:
        library = of_library(scratch) | of_hdmi2(scratch)
        table = of_table(scratch.run(["edid-composer", "platform", "--keys"], b"")[1])
    found = list(problems(table, library, "edid-composer platform --keys"))
    for platform in ("platform.toml", "platform_hdmi2.toml"):
        found += comment_problems((arguments.source / "host/config_store" / platform).read_text(), library)
    for name, reader in documents.items():
        found += problems(reader((arguments.source / name).read_text()), library, name)
    for problem in found:
        print(problem, file=sys.stderr)
    numbers = sum(1 for value in library.values() if value)
    print(f"{len(library)} keys, {numbers} of them numbers with limits and default: {len(found)} problems")
    return 1 if found else 0


if __name__ == "__main__":
    sys.exit(main())
