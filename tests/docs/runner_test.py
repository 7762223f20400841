#!/usr/bin/env python3
"""The documentation's test notices what it is there to notice."""

import argparse
import pathlib
import sys
import tempfile
import unittest

import command_lines
import expected_output
import markdown
import platform_keys
import run_documentation
import scratch as scratch_folder
import snippets

ARGUMENTS = None


class ExpectedOutput(unittest.TestCase):
    def test_equal_texts_match(self):
        self.assertIsNone(expected_output.difference("a\nb\n", "a\nb\n"))

    def test_blanks_and_empty_lines_at_the_end_do_not_count(self):
        self.assertIsNone(expected_output.difference("a\n", "a  \n\n"))

    def test_blanks_at_the_beginning_count(self):
        self.assertIsNotNone(expected_output.difference("\ta\n", "a\n"))

    def test_a_missing_and_an_additional_line_are_noticed(self):
        self.assertIsNotNone(expected_output.difference("a\nb\n", "a\n"))
        self.assertIsNotNone(expected_output.difference("a\n", "a\nb\n"))

    def test_left_out_lines_stand_for_any_number(self):
        for actual in ("a\nz\n", "a\nb\nz\n", "a\nb\nc\nz\n"):
            self.assertIsNone(expected_output.difference("a\n...\nz\n", actual))

    def test_what_stands_around_left_out_lines_is_held_to(self):
        for actual in ("x\na\nz\n", "a\nz\nx\n", "a\n", "z\na\n"):
            self.assertIsNotNone(expected_output.difference("a\n...\nz\n", actual))

    def test_lines_between_left_out_ones_stand_in_order(self):
        self.assertIsNone(expected_output.difference("...\na\nb\n...\nc\n...\n", "x\na\nb\ny\nc\nz\n"))
        self.assertIsNotNone(expected_output.difference("...\nc\n...\na\nb\n...\n", "x\na\nb\ny\nc\nz\n"))

    def test_one_line_does_not_stand_for_two(self):
        self.assertIsNotNone(expected_output.difference("a\n...\na\n", "a\n"))

    def test_lines_of_the_source_do_not_count_but_all_else_does(self):
        line = "utility:35:get_pc_int() WARNING: x\n"
        self.assertIsNone(expected_output.difference(line, line.replace("35", "36")))
        self.assertIsNotNone(expected_output.difference(line, line.replace("get_pc_int", "get_pc_uint")))
        self.assertIsNone(expected_output.difference("x \t\t\tf():1\n", "x \t\t\tf():22\n"))
        self.assertIsNotNone(expected_output.difference("mask: 0x00000643\n", "mask: 0x00000644\n"))


class Markdown(unittest.TestCase):
    def test_blocks_have_language_words_text_and_line(self):
        self.assertEqual(markdown.blocks("x\n```sh build\na\n```\n"), [markdown.Block("sh", ("build",), "a\n", 2)])

    def test_a_block_that_is_not_closed_is_refused(self):
        with self.assertRaises(ValueError):
            markdown.blocks("```sh\na\n")

    def test_tables_are_rows_by_heading(self):
        text = "| Key | Limits |\n| --- | --- |\n| `a` | 0 to 1 |\n"
        self.assertEqual(markdown.tables(text), [[{"Key": "`a`", "Limits": "0 to 1"}]])

    def test_links_in_blocks_and_code_are_none(self):
        self.assertEqual(list(markdown.links("[a](b.md)\n`[c](d)`\n```sh\n[e](f)\n```\n")), [(1, "b.md")])

    def test_headings_have_anchors(self):
        self.assertEqual(list(markdown.anchors("## TMDS clock\n### 3D, `a`\n")), ["tmds-clock", "3d-a"])


class CommandLines(unittest.TestCase):
    def test_invocations_end_at_pipes_and_redirections(self):
        script = "edid-composer platform | sed x > y\nx && build/bin/edid-composer compose \\\n  -o new.bin; true\n"
        self.assertEqual(command_lines.invocations(script), [["platform"], ["compose", "-o", "new.bin"]])

    def test_help_lists_are_read(self):
        text = "  -h,--help  Print\n  --3d off|on  Offer\n"
        self.assertEqual(command_lines.options_in(text), {"-h", "--help", "--3d"})


class Snippets(unittest.TestCase):
    """Whole documents, each with one mistake that must be reported, or none."""

    def problems(self, text):
        with tempfile.TemporaryDirectory() as folder, scratch_folder.Scratch(*ARGUMENTS[:3]) as scratch:
            document = pathlib.Path(folder) / "document.md"
            document.write_text(text)
            return list(run_documentation.run(document, snippets.Runner(scratch, ARGUMENTS[3], False), False))

    def assert_told(self, text, *words):
        problems = self.problems(text)
        self.assertEqual(len(problems), 1, problems)
        for word in words:
            self.assertIn(word, problems[0])

    def test_a_document_without_mistakes_has_no_problems(self):
        self.assertEqual(self.problems("```sh\necho a\n```\n```text\na\n```\n"), [])

    def test_the_folder_keeps_what_was_written(self):
        self.assertEqual(self.problems("```sh\necho a > b\n```\n```sh\ncat b\n```\n```text\na\n```\n"), [])

    def test_another_output_is_told(self):
        self.assert_told("```sh\necho a\n```\n```text\nb\n```\n", "+a", "-b")

    def test_a_command_that_fails_is_told(self):
        self.assert_told("```sh\nfalse\ntrue\n```\n", "status 1")

    def test_an_option_that_does_not_exist_is_told_even_where_nothing_is_run(self):
        self.assert_told("```sh hardware\nedid-composer compose --bogus -o x\n```\n", "no option --bogus")

    def test_a_key_that_nobody_reads_is_told(self):
        self.assert_told("```toml\nbogus = 1\n```\n", f"{platform_keys.DOMAIN}.bogus is read by nobody")

    def test_a_value_out_of_its_limits_is_told(self):
        self.assert_told("```toml\nyear = 1\n```\n", "smaller than the minimum")

    def test_a_value_of_another_type_is_told(self):
        self.assert_told('```toml\nyear = "1"\n```\n', "holds no number")

    def test_c_that_does_not_compile_is_told(self):
        self.assert_told("```c fragment\nbogus();\n```\n", "bogus")

    def test_what_a_program_prints_is_compared(self):
        program = '```c program run\n#include <stdio.h>\nint main(void) {\n  puts("a");\n  return 0;\n}\n```\n'
        self.assertEqual(self.problems(program + "```text\na\n```\n"), [])
        self.assert_told(program + "```text\nb\n```\n", "+a")

    def test_a_program_with_a_file_name_is_kept(self):
        program = "```c program kept.c\nint main(void) {\n  return 0;\n}\n```\n"
        self.assertEqual(self.problems(program + "```sh\ngrep -c main kept.c\n```\n```text\n1\n```\n"), [])

    def test_a_language_that_is_not_run_is_told(self):
        self.assert_told("```python\n1\n```\n", "python")
        self.assert_told("```\n1\n```\n", "language")

    def test_a_text_that_belongs_to_nothing_is_told(self):
        self.assert_told("```text\n1\n```\n", "text")

    def test_links_to_what_is_not_there_are_told(self):
        self.assert_told("[a](nowhere.md)\n", "nowhere.md")
        self.assert_told("# B\n[a](#c)\n", "no such heading")
        self.assertEqual(self.problems("# B\n[a](#b)\n"), [])


if __name__ == "__main__":
    parser = argparse.ArgumentParser()
    parser.add_argument("--source", type=pathlib.Path, required=True)
    parser.add_argument("--prefix", type=pathlib.Path, required=True)
    parser.add_argument("--libdir", default="lib")
    parser.add_argument("--cc", default="cc")
    given, rest = parser.parse_known_args()
    ARGUMENTS = (given.source, given.prefix, given.libdir, given.cc)
    unittest.main(argv=[sys.argv[0], *rest])
