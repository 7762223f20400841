"""The EDID that docs/composed-edid.md explains line by line is the one that its command composes."""

import os
import pathlib
import shlex
import sys

import edid_bytes
import running

sys.path.insert(0, str(pathlib.Path(os.environ["SOURCE_DIR"]) / "tests" / "docs"))
import markdown  # noqa: E402  (a module of the documentation's tests)

REST = "00 ... 00"


def explained(text):
    """The bytes of the explained EDID; `00 ... 00` stands for as many zero bytes as there is room for."""
    before, rest, behind = text.partition(REST)
    known = edid_bytes.from_hex_text(before), edid_bytes.from_hex_text(behind.partition("\n")[2])
    return known[0] + bytes(256 - len(known[0]) - len(known[1]) if rest else 0) + known[1]


class ExplainedEdid(running.ExampleTest):
    def setUp(self):
        super().setUp()
        page = pathlib.Path(os.environ["SOURCE_DIR"]) / "docs" / "composed-edid.md"
        blocks = markdown.blocks(page.read_text())
        (position,) = [i for i, block in enumerate(blocks) if block.words[:2] == ("figure", "edid")]
        self.command, self.figure = blocks[position - 1], blocks[position]

    def test_its_bytes_are_those_that_the_command_before_it_composes(self):
        words = shlex.split(self.command.text)
        self.assertEqual((words[:2], words[-2]), (["edid-composer", "compose"], "-o"))
        options = [word if not word.startswith("examples/") else self.examples.parent / word for word in words[2:-2]]
        self.assertEqual(explained(self.figure.text).hex(" "), self.compose(*options).hex(" "))

    def test_every_line_of_bytes_is_explained(self):
        for line in filter(None, self.figure.text.splitlines()):
            shown, _, explanation = line.partition("#")
            self.assertRegex(shown, r"^(([0-9A-F]{2}|\.\.\.) +)+$")
            self.assertRegex(explanation, r"^ (  |[PDBA] )\S")


if __name__ == "__main__":
    running.main()
