"""The JSON document of "explain" is valid whatever a sink and a platform say, and tells what the bytes offer."""

import html.parser
import re
import unittest

import explaining
import offers
import sinks

HOSTILE_NAMES = [b'"quoted"\\', b"\xff\xfe\x80\x00\x01", b"tab\there", b"</script>", b"\xed\xa0\x80", b"\xc0\xaf",
                 b"\xf0\x9f\x98", b"na\xc3\xafve \xe2\x82\xac", b"\x7f\x1b[31m", b"{{sink}}"]


class Cells(html.parser.HTMLParser):
    """The texts of a page's cells, facts and warnings."""

    def __init__(self):
        super().__init__()
        self.texts = []
        self._open = []

    def handle_starttag(self, tag, _):
        if tag in ("td", "th", "dt", "dd", "span", "p", "li", "h1"):
            self._open.append(tag)
            self.texts.append("")

    def handle_endtag(self, tag):
        if self._open and tag == self._open[-1]:
            self._open.pop()

    def handle_data(self, data):
        if self._open:
            self.texts[-1] += data


# What the page says of itself: headings of tables and cards, labels, and what joins the document's texts.
OWN_TEXTS = {"Verdict", "What", "Why", "From", "Offset", "Bytes", "Part", "Field", "Meaning", "Sink", "New EDID", "Key",
             "Value", "Default", "Limits", "Best video", "Preferred video", "Audio", "Lost", "Most common reasons",
             "none", "-", "Base block", "Limits and derived values",
             "Why a box shows this EDID on its HDMI input, with the verdict on every mode and format.",
             "Point at a byte, tap it or go to it with the arrow keys: its meaning appears below."}


def cells_of(page):
    parser = Cells()
    parser.feed(page.partition("<body>")[2].partition("<script>")[0])
    return [text.strip() for text in parser.texts if text.strip()]


def strings_of(value):
    if isinstance(value, dict):
        for key, inner in value.items():
            yield key
            yield from strings_of(inner)
    elif isinstance(value, list):
        for inner in value:
            yield from strings_of(inner)
    else:
        yield str(value)


def is_known(text, known):
    """In the document as it is, or bytes and numbers of it in another form."""
    forms = (text, text.removeprefix("Warning: "), re.sub(r"^\d+ times: ", "", text), re.sub(r": \d+ offered.*", "", text))
    return (text in OWN_TEXTS or any(form in known for form in forms) or
            re.fullmatch(r"(0x)?[0-9A-F]{2}( [0-9A-F]{2})*|and \d+ more", text) is not None)


class JsonTest(explaining.ExplainTest):
    def decisions(self, *arguments):
        return self.explain_json(*arguments)["decisions"]

    def test_is_version_1_with_everything_that_was_composed_from(self):
        sink = self.write("tv.bin", sinks.sink(vics=[16]))
        document = self.explain_json("--sink", sink, "--port", "2", "--audio-mask", "3", "--audio-sink-filter", "--3d",
                                     "on", "--latency", "1,2,3,4")
        self.assertEqual(document["version"], 1)
        self.assertEqual(document["platform"], "default platform")
        self.assertEqual(document["sink"]["source"], str(sink))
        self.assertEqual(bytes.fromhex(document["sink"]["bytes"]), sink.read_bytes())
        self.assertEqual(document["sink"]["name"], "Test sink")
        self.assertEqual(document["settings"], {"port": 2, "audio_mask": 3, "audio_sink_filter": True, "3d": 2,
                                                "latency": [1, 2, 3, 4]})
        self.assertIsNone(self.explain_json()["sink"])

    def test_the_edid_is_the_one_that_compose_writes(self):
        for name in ("tv_4k", "tv_1080p_3d", "tv_720p_50hz", "av_receiver", "monitor_base_block"):
            arguments = ("--sink", self.sample(name), "--port", "1")
            self.assertEqual(bytes.fromhex(self.explain_json(*arguments)["edid"]), self.composed(*arguments))

    def test_what_is_offered_is_what_the_bytes_offer_in_their_order(self):
        for name in ("tv_4k", "tv_1080p_3d", "tv_720p_50hz", "av_receiver", "monitor_base_block"):
            document = self.explain_json("--sink", self.sample(name))
            edid = bytes.fromhex(document["edid"])
            told = {"video": [], "4k": [], "audio": []}
            for decision in document["decisions"]:
                if decision["section"] in told and decision["verdict"] != "left out":
                    told[decision["section"]].append(decision["code"])
            self.assertEqual(told["video"], offers.video_modes(edid), name)
            self.assertEqual(told["4k"], offers.modes_4k(edid), name)
            self.assertEqual(told["audio"], offers.audio_types(edid), name)

    def test_offered_comes_before_left_out_in_each_section(self):
        sections = {}
        for decision in self.decisions("--sink", self.sample("tv_720p_50hz")):
            sections.setdefault(decision["section"], []).append(decision["verdict"] == "left out")
        self.assertEqual(list(sections), ["video", "audio", "derived"] if "4k" not in sections else
                         ["video", "4k", "audio", "derived"])
        for section in ("video", "4k", "audio"):
            self.assertEqual(sections[section], sorted(sections[section]), section)
        self.assertIn(True, sections["video"])

    def test_lines_are_those_of_the_entries(self):
        platform = self.write("box.toml", explaining.DEFAULT_PLATFORM)
        lines = explaining.DEFAULT_PLATFORM.splitlines()
        seen = 0
        for decision in self.decisions("--platform", platform, "--sink", self.sample("tv_720p_50hz")):
            for source in decision["sources"]:
                if source["kind"] == "platform" and decision["section"] == "video":
                    self.assertIn(f'"{decision["code"]}', lines[source["line"] - 1])
                    seen += 1
        self.assertGreater(seen, 20)

    def test_each_decision_has_a_sentence_and_every_number(self):
        for decision in self.decisions("--sink", self.sample("tv_1080p_3d"), "--audio-sink-filter"):
            self.assertTrue(decision["sentence"].endswith("."), decision)
            self.assertNotRegex(decision["sentence"], r"[{}]")
            self.assertEqual(len(decision["values"]), 4)

    def test_a_timing_of_the_sink_without_a_vic_is_told_by_its_size_and_rate(self):
        sink = self.write("tv.bin", sinks.sink(vics=[16], timings=[sinks.timing(1366, 768)]))
        (timing,) = [found for found in self.decisions("--sink", sink) if found["subject"] == "sink timing"]
        self.assertEqual((timing["verdict"], timing["values"][:2]), ("left out", [1366, 768]))
        self.assertEqual(timing["name"][:9], "1366x768p")
        self.assertEqual([source["text"] for source in timing["sources"]], ["sink: detailed timing 1"])

    def test_vics_above_the_librarys_are_named_by_their_timing(self):
        sink = self.write("tv.bin", sinks.sink(vics=[16, 97, 95, 219, 100]))
        names = {decision["code"]: (decision["name"], decision["sentence"]) for decision in self.decisions("--sink", sink)
                 if decision["subject"] == "video mode"}
        only = "The sink has it; VICs above 64 are offered with hdmi2.enable = 1 only."
        self.assertEqual(names[97], ("3840x2160p60 16:9 (VIC 97)", only))
        self.assertEqual(names[95], ("3840x2160p30 16:9 (VIC 95)", only + " HDMI 1.4 has it as 4k:1."))
        self.assertEqual(names[91], ("4096x2160p120 256:135 (VIC 219)", only + " It takes this one for VIC 91."))

    def test_standard_timings_are_named_with_their_lines(self):
        base = bytearray(sinks.sink(vics=[16]))
        base[38:44] = bytes([0x95, 0x00, 0x81, 0x40, 0x81, 0x80])  # 1440 16:10, 1280 4:3, 1280 5:4
        sink = self.write("tv.bin", sinks.with_checksum(bytes(base[:128])) + bytes(base[128:]))
        names = [decision["name"] for decision in self.decisions("--sink", sink) if decision["subject"] == "sink timing"]
        self.assertEqual(sorted(names), ["1280x1024p60", "1280x960p60", "1440x900p60"])

    def test_a_format_of_both_sides_is_one_row_with_both_decisions(self):
        sink = self.write("tv.bin", sinks.sink(vics=[16], audio=[(0x15, 0x07, 0x50), (0x67, 0x54, 0x00)]))
        formats = [decision for decision in self.decisions("--sink", sink) if decision["section"] == "audio"]
        (ac3,) = [decision for decision in formats if decision["code"] == 2]
        self.assertEqual((ac3["verdict"], ac3["sentence"]), ("offered", "The platform has it. The sink has it too."))
        self.assertEqual([merged["verdict"] for merged in ac3["merged"]], ["left out"])
        self.assertEqual([source["kind"] for source in ac3["sources"]], ["platform", "sink", "platform"])
        (truehd,) = [decision for decision in formats if decision["code"] == 12]
        self.assertEqual(truehd["verdict"], "left out")

    def test_the_summary_says_what_is_best_and_what_is_lost(self):
        sink = self.write("tv.bin", sinks.sink(vics=[16, 97, 95, 4], vics_4k=[1], audio=[(0x67, 0x54, 0x00)]))
        summary = self.explain_json("--sink", sink)["summary"]
        self.assertEqual(summary["best_video"], "3840x2160p30 (4k:1)")
        self.assertEqual(summary["preferred_video"], "1920x1080p60 16:9 (VIC 16)")
        # VIC 95 is not lost: HDMI 1.4 has it as 4k:1, which is offered.
        self.assertEqual(summary["lost"], ["3840x2160p60 16:9 (VIC 97)", "MLP/TrueHD, 8 channels"])
        self.assertIn("PCM, 8 channels", summary["audio"])
        self.assertLessEqual(len(summary["reasons"]), 3)
        counts = [reason["count"] for reason in summary["reasons"]]
        self.assertEqual(counts, sorted(counts, reverse=True))

    def test_the_page_shows_nothing_that_is_not_in_the_document(self):
        for name in ("tv_4k", "tv_1080p_3d", "av_receiver", "monitor_base_block"):
            arguments = ("--sink", self.sample(name), "--audio-sink-filter")
            known = set(strings_of(self.explain_json(*arguments)))
            _, page, _ = self.run_program("explain", "--html", "-", *arguments)
            shown = cells_of(page)
            self.assertGreater(len(shown), 300)
            self.assertEqual([text for text in shown if not is_known(text, known)], [], name)

    def test_is_valid_whatever_the_sink_is_called(self):
        for name in HOSTILE_NAMES:
            sink = self.write("tv.bin", sinks.sink(vics=[16], name=name, other_texts=[(0xFF, name), (0xFE, name)]))
            document = self.explain_json("--sink", sink)
            self.assertIsInstance(document["sink"]["name"], str)

    def test_texts_of_the_sink_keep_what_is_utf_8(self):
        sink = self.write("tv.bin", sinks.sink(vics=[16], name="naïve €".encode() + b"\n"))
        self.assertEqual(self.explain_json("--sink", sink)["sink"]["name"], "naïve €")
        sink = self.write("tv.bin", sinks.sink(vics=[16], name=b"a\xffb\n"))
        self.assertEqual(self.explain_json("--sink", sink)["sink"]["name"], "a\N{REPLACEMENT CHARACTER}b")

    def test_is_valid_whatever_the_files_are_called(self):
        platform = self.write('a"\\\n<b>.toml', explaining.DEFAULT_PLATFORM)
        sink = self.write("\u20ac'\t.bin", sinks.sink(vics=[16]))
        document = self.explain_json("--platform", platform, "--sink", sink)
        self.assertEqual(document["platform"], platform.name)
        self.assertEqual(document["sink"]["source"], str(sink))

    def test_a_broken_sink_is_told_of_on_standard_error_only(self):
        broken = bytearray(sinks.sink(vics=[16]))
        broken[127] ^= 0xFF
        sink = self.write("tv.bin", bytes(broken))
        status, printed, complaints = self.run_program("explain", "--json", "--sink", sink)
        self.assertEqual((status, printed[:1]), (0, "{"))
        self.assertIn("ERROR", complaints)

    def test_traces_go_to_standard_error(self):
        status, printed, complaints = self.run_program("explain", "--json", "--debug")
        self.assertEqual((status, printed[:1]), (0, "{"))
        self.assertIn("Setting up the new EDID:", complaints)


if __name__ == "__main__":
    unittest.main()
