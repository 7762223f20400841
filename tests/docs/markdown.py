"""The parts of a Markdown document that a test can hold it to: fenced blocks, tables, links and headings."""

import dataclasses
import re

FENCE = re.compile(r"^(?P<indent> *)(?P<ticks>`{3,})(?P<info>[^`]*)$")


@dataclasses.dataclass(frozen=True)
class Block:
    """A fenced block: its language, the words after it, its text, and where it begins."""

    language: str
    words: tuple
    text: str
    line: int


def blocks(text):
    """The fenced blocks of a document, in order. A fence that is never closed is an error."""
    found = []
    opened = None
    for number, line in enumerate(text.splitlines(), start=1):
        fence = FENCE.match(line)
        if opened is None:
            if fence:
                words = fence["info"].split()
                opened = (fence, words, [], number)
        elif fence and not fence["info"].strip() and len(fence["ticks"]) >= len(opened[0]["ticks"]):
            _, words, lines, start = opened
            language = words[0] if words else ""
            found.append(Block(language, tuple(words[1:]), "".join(f"{each}\n" for each in lines), start))
            opened = None
        else:
            opened[2].append(line.removeprefix(opened[0]["indent"]))
    if opened is not None:
        raise ValueError(f"line {opened[3]}: the block is not closed")
    return found


def outside_blocks(text):
    """The document with empty lines in place of its fenced blocks."""
    lines = []
    ticks = None
    for line in text.splitlines():
        fence = FENCE.match(line)
        if ticks is None:
            lines.append("" if fence else line)
            ticks = fence["ticks"] if fence else None
        else:
            lines.append("")
            if fence and not fence["info"].strip() and len(fence["ticks"]) >= len(ticks):
                ticks = None
    return lines


def tables(text):
    """The tables of a document, each a list of rows, each a dictionary by column heading."""
    found = []
    rows = []
    for line in [*outside_blocks(text), ""]:
        if line.lstrip().startswith("|"):
            cells = re.split(r"(?<!\\)\|", line.strip().strip("|"))
            rows.append([cell.strip().replace("\\|", "|") for cell in cells])
        elif rows:
            head, _, *body = rows
            found.append([dict(zip(head, cells)) for cells in body])
            rows = []
    return found


def links(text):
    """The targets of a document's links, each with its line."""
    for number, line in enumerate(outside_blocks(text), start=1):
        for target in re.findall(r"\]\(([^)\s]+)\)", re.sub(r"`[^`]*`", "", line)):
            yield number, target


def anchors(text):
    """What a link may name after a '#': one for each heading, made as the common Markdown sites make them."""
    for line in outside_blocks(text):
        heading = re.match(r"#+ +(.*)", line)
        if heading:
            plain = re.sub(r"[`*]", "", heading[1]).strip().lower()
            yield re.sub(r"[^\w\- ]", "", plain).replace(" ", "-")
