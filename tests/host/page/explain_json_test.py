"""The JSON document of "explain" is valid whatever a sink and a platform say, and tells what the bytes offer."""

import unittest

import explaining
import offers
import sinks

HOSTILE_NAMES = [b'"quoted"\\', b"\xff\xfe\x80\x00\x01", b"tab\there", b"</script>", b"\xed\xa0\x80", b"\xc0\xaf",
                 b"\xf0\x9f\x98", b"na\xc3\xafve \xe2\x82\xac", b"\x7f\x1b[31m", b"{{sink}}"]


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
        self.assertIn("1366x768p", timing["sentence"])
        self.assertEqual([source["text"] for source in timing["sources"]], ["sink: detailed timing 1"])

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
