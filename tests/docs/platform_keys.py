"""What the library asks of a platform configuration, found by composing without one."""

import re
import tomllib

DOMAIN = "platform.software.drivers.vorex.edid"

NUMBER = re.compile(r"Unable to find the platform path:(\S+) Defaulting to:(-?\d+)")
TEXT = re.compile(r'Error trying to read "(\S+)" from the platform config\. Using:(.*)')
LIST = re.compile(r"Unabled to find the platform node:(\S+)\.$")
LIMITED = re.compile(r"The value for platform path:(\S+) is \w+ than .* Min:(-?\d+) Val:-?\d+ Max:(-?\d+)")
AUDIO_ENTRY = re.compile(rf"{re.escape(DOMAIN)}\.audio\.entry_[a-z]")

# What an incomplete configuration gives rise to, whatever it holds.
INCOMPLETE = re.compile(
    f"{NUMBER.pattern}|{TEXT.pattern}|{LIST.pattern}|A mode list \\(\\d\\) is empty"
    "|Received a list that contains no entries|The number of video formats to be encoded is less than 4")
DIAGNOSTIC = re.compile(r"\(\) (ERROR|WARNING|BUG): ")


def compose(scratch, configuration):
    """Composes an EDID from a configuration alone; exit status and everything printed."""
    return scratch.run(["edid-composer", "compose", "--platform", "-", "-o", "-"], configuration.encode())


def missing(printed):
    """What a composition looked for in vain: full path and kind, with the default if the warning has one."""
    found = {}
    for line in printed.splitlines():
        for kind, pattern in (("number", NUMBER), ("text", TEXT), ("list", LIST)):
            match = pattern.search(line)
            if match:
                found[match[1]] = (kind, match[2] if kind != "list" else None)
    return found


def asked_for(scratch):
    """Every key that the library reads, but for the audio entries, which may be missing without a word."""
    status, printed = compose(scratch, f"[{DOMAIN}]\n")
    found = missing(printed)
    if status != 0 or not found:
        raise RuntimeError(f"composing from an empty configuration failed:\n{printed}")
    return found


def limits(printed):
    """The limits that the warnings about too small and too large values have."""
    return {match[1]: (match[2], match[3]) for match in LIMITED.finditer(printed)}


def whole(text):
    """A snippet as a file of its own: under the domain's table, unless it names its tables itself."""
    if list(tomllib.loads(text)) == ["platform"]:
        return text
    return f"[{DOMAIN}]\n{text}"


def paths(text):
    """The full paths of a configuration's keys."""

    def walk(node, prefix):
        for name, value in node.items():
            path = f"{prefix}.{name}" if prefix else name
            if isinstance(value, dict):
                yield from walk(value, path)
            else:
                yield path

    return list(walk(tomllib.loads(whole(text)), ""))


def problems(scratch, text, known):
    """What is wrong with a snippet: not loaded, keys that nobody reads, values that give rise to diagnostics."""
    status, printed = compose(scratch, whole(text))
    if status != 0:
        return [f"was refused with status {status}:\n{printed}"]
    found = []
    not_read = missing(printed)
    for path in paths(text):
        if AUDIO_ENTRY.fullmatch(path):
            continue
        if path not in known:
            found.append(f"{path} is read by nobody")
        elif path in not_read:
            found.append(f"{path} holds no {not_read[path][0]}")
    for line in printed.splitlines():
        if DIAGNOSTIC.search(line) and not INCOMPLETE.search(line):
            found.append(f"gives rise to: {line}")
    return found
