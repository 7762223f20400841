#!/usr/bin/env python3
"""Runs every command and snippet of a Markdown document, in order, as a reader would, and compares what they print.

What is done with a fenced block depends on its language and the words after it:

- sh: run by `sh -e` in a scratch folder that keeps what earlier blocks of the document wrote. `sh hardware` needs a
  connector or a capture device and `sh build` the source tree: these are parsed, and the options of edid-composer in
  them compared with its --help; the latter are run with --source-tree.
- text: what the block before it prints. A line `...` stands for any number of lines. `text figure` is a picture.
- toml: composed from, by itself when it names its table, else under the domain's. A word is the file to keep it in.
- c: `c fragment` (statements), `c declarations`, `c program` (linked) or `c program run` (and run). A word that ends in
  .c is the file to keep it in.
- cmake: a project around the document's last program is built with it.

Exit status 0: all of it holds.
"""

import argparse
import pathlib
import sys

import markdown
import scratch as scratch_folder
import snippets


def is_picture(block):
    return block.language == "mermaid" or (block.language == "text" and "figure" in block.words)


def pairs(blocks):
    """Each block that is run, with the text that it shall print."""
    position = 0
    while position < len(blocks):
        block = blocks[position]
        position += 1
        if is_picture(block):
            continue
        expected = None
        if position < len(blocks) and blocks[position].language == "text" and not is_picture(blocks[position]):
            expected = blocks[position]
            position += 1
        yield block, expected


def link_problems(document, text):
    """Links to files that aren't there, and to headings that aren't in them."""
    for line, target in markdown.links(text):
        if "://" in target or target.startswith("mailto:"):
            continue
        name, _, anchor = target.partition("#")
        file = (document.parent / name) if name else document
        if not file.exists():
            yield f"{document}:{line}: the link goes to {target}, which is not there"
        elif anchor and anchor not in markdown.anchors(file.read_text()):
            yield f"{document}:{line}: the link goes to {target}, but {file.name} has no such heading"


def run(document, runner, show):
    """Yields what is wrong."""
    text = document.read_text()
    yield from link_problems(document, text)
    for block, expected in pairs(markdown.blocks(text)):
        problem = runner.run(block, expected.text if expected else None)
        if problem:
            yield f"{document}:{block.line}: {problem}"
        if show:
            print(f"{document}:{block.line}: {block.language} {' '.join(block.words)}: {'FAILED' if problem else 'ok'}")


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("document", type=pathlib.Path)
    parser.add_argument("--source", type=pathlib.Path, required=True, help="the source tree, for its examples")
    parser.add_argument("--prefix", type=pathlib.Path, required=True, help="where everything is installed")
    parser.add_argument("--libdir", default="lib", help="where under it the libraries are")
    parser.add_argument("--cc", default="cc", help="C compiler")
    parser.add_argument("--source-tree", action="store_true", help="run in a copy of the source tree, build blocks too")
    parser.add_argument("--show", action="store_true", help="list each block")
    arguments = parser.parse_args()

    with scratch_folder.Scratch(arguments.source, arguments.prefix, arguments.libdir) as scratch:
        if arguments.source_tree:
            scratch.copy_tree(arguments.source)
        runner = snippets.Runner(scratch, arguments.cc, arguments.source_tree)
        problems = list(run(arguments.document, runner, arguments.show))
    for problem in problems:
        print(problem, file=sys.stderr)
    counts = f"{runner.ran} snippets run, {runner.only_checked} only checked, {len(problems)} problems"
    print(f"{arguments.document.name}: {counts}")
    return 1 if problems else 0


if __name__ == "__main__":
    sys.exit(main())
