"""Compares what a command printed with what a document says that it prints."""

import difflib
import re

LEFT_OUT = "..."

# What may differ from one build or run to the next: the lines of the source and the addresses of records.
MASKS = (
    (re.compile(r"\b(edid_composer|edid_decode_encode|utility|linked_list):\d+:(?=\w+\(\))"), r"\1:N:"),
    (re.compile(r"( \t\t\t\w+\(\)):\d+$"), r"\1:N"),
    (re.compile(r"\b0x[0-9a-f]{10,16}\b"), "0xADDRESS"),
)


def masked_lines(text):
    """The lines of a text, without what may differ, without blanks at their ends and without empty lines at its end."""
    lines = []
    for line in text.splitlines():
        for pattern, replacement in MASKS:
            line = pattern.sub(replacement, line)
        lines.append(line.rstrip())
    while lines and not lines[-1]:
        lines.pop()
    return lines


def _segments(lines):
    """The runs of lines between the lines that mark left-out ones."""
    segments = [[]]
    for line in lines:
        if line == LEFT_OUT:
            segments.append([])
        else:
            segments[-1].append(line)
    return segments


def _find(segment, lines, start):
    for position in range(start, len(lines) - len(segment) + 1):
        if lines[position : position + len(segment)] == segment:
            return position
    return None


def matches(expected, actual):
    """Whether a document's lines match the lines that were printed; '...' matches any number of lines."""
    first, *others = _segments(expected)
    if not others:
        return first == actual
    if actual[: len(first)] != first:
        return False
    position = len(first)
    *middle, last = others
    for segment in middle:
        found = _find(segment, actual, position)
        if found is None:
            return False
        position = found + len(segment)
    return len(actual) - len(last) >= position and actual[len(actual) - len(last) :] == last


def difference(expected_text, actual_text):
    """None when the texts match, else the difference to show."""
    expected = masked_lines(expected_text)
    actual = masked_lines(actual_text)
    if matches(expected, actual):
        return None
    return "\n".join(difflib.unified_diff(expected, actual, "the document says", "was printed", lineterm=""))
