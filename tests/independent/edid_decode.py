"""Runs Debian's edid-decode and cuts what it writes into a tree and into findings."""

import dataclasses
import shutil
import subprocess
import sys

PROGRAM = "edid-decode"
# CTest takes this status for "skipped".
SKIPPED = 77


def skip(reason):
    print(f"skipped: {reason}")
    sys.exit(SKIPPED)


def skip_if_absent():
    if shutil.which(PROGRAM) is None:
        skip(f"{PROGRAM} is not installed (Debian: apt-get install {PROGRAM})")


def version():
    """The date of the sources that it was built from, such as "2022-03-30"."""
    words = subprocess.run([PROGRAM, "--version"], capture_output=True, text=True, check=False).stdout.split()
    return words[3] if len(words) > 3 else ""


def _run(edid, *options):
    result = subprocess.run(
        [PROGRAM, "--skip-hex-dump", *options], input=edid, capture_output=True, check=False, timeout=30
    )
    text = result.stdout.decode("utf-8", "replace")
    if "Block 0" not in text:
        raise RuntimeError(f"{PROGRAM} reads nothing: {text}{result.stderr.decode('utf-8', 'replace')}")
    return text


@dataclasses.dataclass
class Node:
    """A line and the lines that are indented below it."""

    line: str
    children: list = dataclasses.field(default_factory=list)

    def lines(self):
        return [child.line for child in self.children]

    def all(self, beginning):
        """The children whose lines begin so."""
        return [child for child in self.children if child.line.startswith(beginning)]

    def below(self, line):
        """The children of all children with this line."""
        return [grandchild for child in self.children if child.line == line for grandchild in child.children]

    def value(self, label):
        """What stands after "label: ", or None."""
        for line in self.lines():
            if line.startswith(label + ":"):
                return line[len(label) + 1 :].strip()
        return None


def _tree(text):
    root = Node("")
    open_nodes = [(-1, root)]
    for line in text.splitlines():
        if not line.strip():
            continue
        indentation = len(line) - len(line.lstrip(" "))
        while open_nodes[-1][0] >= indentation:
            open_nodes.pop()
        node = Node(line.strip())
        open_nodes[-1][1].children.append(node)
        open_nodes.append((indentation, node))
    return root


def reading(edid):
    """What it reads: a tree with a node for each block of the EDID."""
    return _tree(_run(edid))


def findings(edid):
    """What it finds wrong: triples of "failure" or "warning", the part of the EDID, and the message."""
    text = _run(edid, "--check")
    verdict = text.rpartition("EDID conformity:")
    report = _tree(text.partition("edid-decode SHA:")[2].partition("\n")[2])
    found = []
    for severity, heading in (("failure", "Failures:"), ("warning", "Warnings:")):
        # Neither the headings nor the parts below them are indented.
        for part in _section(report, heading):
            for message in part.children:
                details = message.lines() or [""]
                found += [(severity, part.line.rstrip(":"), f"{message.line} {detail}".strip()) for detail in details]
    failed = any(severity == "failure" for severity, _, _ in found)
    if verdict[2].strip() != ("FAIL" if failed else "PASS"):
        raise RuntimeError(f"the findings don't match the verdict: {text}")
    return found


def _section(report, heading):
    """The parts that stand between a heading and the next one."""
    inside = False
    for node in report.children:
        if node.line in ("Failures:", "Warnings:") or node.line.startswith("EDID conformity:"):
            inside = node.line == heading
        elif inside:
            yield node
