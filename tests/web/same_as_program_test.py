"""The page computes with the program's own code: what it returns is what the program prints."""

import itertools
import json
import pathlib
import re
import tempfile

import page

WANTED = ("1080p60", "4k30", "2160p60", "vic 33", "4k:4", "pcm8", "truehd", "dts", "3d", "deep-color", "nonsense")
SETTINGS = (
    {},
    {"port": "3", "audio-mask": "0x3"},
    {"current-mode": "1280x720p50", "3d": "off", "latency": "20,40,30,50", "audio-sink-filter": True},
)


def options_of(settings):
    return [text for name, value in settings.items() for text in ([f"--{name}"] if value is True else [f"--{name}", value])]


class SameAsProgram(page.PageTest):
    def inputs(self):
        """Each sample sink, and none, on each platform: what the page takes, and the program's options for it."""
        for sink, platform in itertools.product([None, *page.SINKS], [None, *page.PLATFORMS]):
            members = {"sink": None, "platform": None}
            options = []
            if sink:
                # The program says what a sink is called with its folders.
                members["sink"] = self.read(str(sink), sink.read_bytes())
                options += ["--sink", sink]
            if platform:
                members["platform"] = {"name": platform.name, "text": platform.read_text()}
                options += ["--platform", platform]
            yield members, options

    def test_explanations_and_edids(self):
        number = 0
        with tempfile.TemporaryDirectory() as folder:
            hex_file = pathlib.Path(folder) / "composed.hex"
            for members, options in self.inputs():
                for settings in SETTINGS:
                    given = [*options, *options_of(settings)]
                    answer = self.ask("compose", settings=settings, **members)
                    self.assertEqual(answer["problems"], [])
                    self.assertEqual(answer["explanation"], json.loads(page.run_program("explain", "--json", *given)))
                    page.run_program("compose", "--format", "hex", "-o", hex_file, *given)
                    self.assertEqual(answer["hex"], hex_file.read_text())
                    number += 1
        self.assertEqual(number, (len(page.SINKS) + 1) * (len(page.PLATFORMS) + 1) * len(SETTINGS))
        print(f"{number} explanations and EDIDs are the program's")

    def test_reports(self):
        for members, options in self.inputs():
            if not members["sink"]:
                continue
            # Their headings name what each of them knows the sink by.
            page_title, program_title = "Sink", pathlib.Path(members["sink"]["name"]).name
            report = self.ask("compose", **members)["sink_report"]
            printed = page.run_program("print", members["sink"]["name"])
            self.assertEqual(report.partition("\n")[2].replace(f"{page_title}: HDMI 2\n", "HDMI 2\n"),
                             printed.partition("\n")[2].replace(f"{program_title}: HDMI 2\n", "HDMI 2\n"))

    def test_answers(self):
        for members, options in self.inputs():
            for wanted in WANTED:
                printed = self.ask("want", want=wanted, **members)
                if wanted == "nonsense":
                    self.assertIn('--want: "nonsense" is not a VIC such as 16', printed["refused"])
                    continue
                answers = printed["answer"]
                status = 0 if any(answer["offered"] for answer in answers["answers"]) else 1
                expected = page.run_program("explain", "--json", "--want", wanted, *options, status=status)
                self.assertEqual(answers, json.loads(expected))

    def test_comparisons(self):
        for left, right in itertools.permutations(page.SINKS, 2):
            rows = self.ask("compare", left=self.read(left.name, left.read_bytes()),
                            right=self.read(right.name, right.read_bytes()))["rows"]
            printed = page.run_program("diff", left, right, status=1).splitlines()
            marked = [line for line in printed if line.startswith("*")]
            self.assertEqual(len([row for row in rows if row["left"] != row["right"]]), len(marked))

    def test_findings(self):
        text = page.default_platform()
        wrong = {
            "week": text.replace("week = 1\n", "week = 99\n"),
            "key": text.replace("native_bit =", "native_bite ="),
            "VIC": text.replace('"16",        #', '"16", "77", #'),
            "setting": text + "[edid-composer]\nport = 77\nportt = 1\n",
        }
        with tempfile.TemporaryDirectory() as folder:
            file = pathlib.Path(folder) / "box.toml"
            for name, text in wrong.items():
                with self.subTest(name):
                    file.write_text(text)
                    found = self.ask("compose", platform={"name": "box.toml", "text": text})["findings"]
                    shown = [f"{one['line']}:{one['column']}: {one['severity']}: {one['key']}: {one['text']}" for one in found]
                    printed = page.run_program("check-platform", file, status=1 if name == "setting" else 0)
                    expected = re.findall(rf"^{re.escape(str(file))}:(\d+:\d+: .*)$", printed, re.MULTILINE)
                    self.assertEqual(shown, expected)
                    self.assertGreater(len(shown), 0)

    def test_what_cannot_be_read_is_refused_alike(self):
        with tempfile.TemporaryDirectory() as folder:
            file = pathlib.Path(folder) / "file"
            for content in (b"", b"hello", b"00 ff 0", b"\0" * 100, b"\0" * (128 * 257), b"0x00 0xgg", b"\xff\xfe1\0"):
                file.write_bytes(content)
                refusal = self.read("file", content)["refused"]
                with self.assertRaises(AssertionError) as printed:
                    page.run_program("print", file)
                self.assertIn(refusal, str(printed.exception).replace(str(file), "file"))
            for text in ("[a", "a = 1.5", "a = 1\na = 2", "[" * 100, "\0", "a.b = {"):
                file.write_text(text)
                problem, = self.ask("compose", platform={"name": "file", "text": text})["problems"]
                with self.assertRaises(AssertionError) as printed:
                    page.run_program("compose", "--platform", file, "-o", "-")
                said = f"file:{problem['line']}:{problem['column']}: {problem['text']}"
                self.assertIn(said, str(printed.exception).replace(str(file), "file"))


if __name__ == "__main__":
    page.main()
