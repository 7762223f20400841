"""What "explain --want" tells to do has the effect that it promises, for everything that can stand in the way."""

import json
import re
import unittest

import explaining
import instructions
import offers
import sinks

DOMAIN = "platform.software.drivers.vorex.edid"
ALL_AUDIO_TYPES = [*range(1, 15), 16, 17, 18]


def platform(video=("16", "4", "3", "1"), video_addition=("16", "4", "3", "1"), other=("31", "19", "18", "1"),
             other_addition=("31", "19", "18", "1"), modes_4k=(1, 2, 3, 4), addition_4k=(), audio=(0x077F09, 0x500715),
             pass_through=0, keys="", name="monitor_name = \"Box\""):
    """A platform's text, an entry a line. "Other" are the lists of the 50 Hz family."""
    text = f"[{DOMAIN}]\n{name}\n{keys}\n"
    for name, entries in (("60_hz_priority_list", video), ("60_hz_addition_list", video_addition),
                          ("50_hz_priority_list", other), ("50_hz_addition_list", other_addition)):
        if entries is not None:
            text += f"{name} = [\n" + "".join(f'  "{entry}",\n' for entry in entries) + "]\n"
    text += f"4k_x_2k_priority_list = {list(modes_4k)}\n4k_x_2k_addition_list = {list(addition_4k)}\n"
    text += f"[{DOMAIN}.audio]\npass_through = {pass_through}\n"
    return text + "".join(f"entry_{chr(ord('a') + place)} = 0x{entry:06X}\n" for place, entry in enumerate(audio))


def sink_50():
    return sinks.sink(vics=[19, 18, 17])


class WantTest(explaining.ExplainTest):
    def ask(self, text, sink, arguments, wanted):
        files = ["--platform", self.write("box.toml", text)]
        files += ["--sink", self.write("sink.bin", sink)] if sink else []
        status, printed, complaints = self.run_program("explain", "--json", *files, *arguments, "--want", wanted)
        self.assertIn(status, (0, 1), complaints)
        return status, json.loads(printed)["answers"]

    def offered(self, text, sink, arguments):
        files = ["--platform", self.write("box.toml", text)]
        files += ["--sink", self.write("sink.bin", sink)] if sink else []
        edid = self.composed(*files, *arguments)
        return {"vic": offers.video_modes(edid), "4k": offers.modes_4k(edid), "audio": offers.audio_types(edid),
                "channels": offers.audio_entries(edid), "3d": [1] if offers.has_3d(edid) else [],
                "depth": [bits for bits in (30, 36, 48) if offers.has_depth(edid, bits)]}

    def check(self, wanted, kind, code, text, sink=None, arguments=(), told=()):
        """It isn't offered; what is told contains @p told, in order; that done, it is offered."""
        self.assertNotIn(code, self.offered(text, sink, arguments)[kind])
        status, (answer,) = self.ask(text, sink, arguments, wanted)
        self.assertEqual((status, answer["offered"]), (1, False))
        steps = [step["text"] for step in answer["steps"]]
        self.assertEqual(len(steps), len(told), steps)
        for step, expected in zip(steps, told):
            self.assertIn(expected, step)

        for way in [answer["steps"], *answer["other_ways"]]:
            changed = instructions.Instructions(text, arguments)
            changed.follow(way)
            self.assertIn(code, self.offered(changed.platform(), sink, changed.arguments)[kind])
            status, (after,) = self.ask(changed.platform(), sink, changed.arguments, wanted)
            self.assertEqual((status, after["offered"], after["steps"]), (0, True, []))
        return {**answer, "after": after["reasons"]}

    @staticmethod
    def line_of(text, beginning):
        """The line, counted from 1, that begins so."""
        return next(number for number, line in enumerate(text.splitlines(), 1) if line.startswith(beginning))


class VideoModes(WantTest):
    def test_one_that_the_sink_has_and_the_priority_list_does_not_name(self):
        text = platform()
        line = self.line_of(text, "60_hz_priority_list")
        self.check("32", "vic", 32, text, sinks.sink(vics=[16, 32]),
                   told=[f'add "32" to 60_hz_priority_list (box.toml:{line})'])

    def test_one_that_only_the_addition_list_has(self):
        text = platform(video_addition=("16", "5"))
        self.check("1920x1080i60", "vic", 5, text, told=['add "5" to 60_hz_priority_list (box.toml:4)'])

    def test_one_that_neither_the_sink_nor_the_platform_has(self):
        text = platform(video=("16", "32"))
        line = self.line_of(text, "60_hz_addition_list")
        self.check("1920x1080p24", "vic", 32, text, sinks.sink(vics=[16]),
                   told=[f'add "32" to 60_hz_addition_list (box.toml:{line})'])

    def test_one_that_nobody_names(self):
        self.check("63", "vic", 63, platform(), sinks.sink(vics=[16]),
                   told=['add "63" to 60_hz_priority_list', 'add "63" to 60_hz_addition_list'])

    def test_one_of_the_other_refresh_family(self):
        self.check("16", "vic", 16, platform(), sink_50(),
                   told=['add "16" to 50_hz_priority_list', 'add "16" to 50_hz_addition_list'])

    def test_one_of_the_other_refresh_family_that_the_sink_has(self):
        self.check("4", "vic", 4, platform(), sinks.sink(vics=[19, 4]), told=['add "4" to 50_hz_priority_list'])

    def test_one_that_is_taller_than_the_sink(self):
        text = platform(keys="geometry_limit = 1")
        answer = self.check("16", "vic", 16, text, sinks.sink(vics=[4]), told=["set geometry_limit = 0 (box.toml:3)"])
        self.assertIn("60_hz_addition_list", answer["after"][0])

    def test_one_that_is_interlaced_and_taller_than_the_sink(self):
        text = platform(video=("5", "4"), video_addition=("5",), keys="geometry_limit = 1")
        self.check("5", "vic", 5, text, sinks.sink(vics=[4]), told=["set geometry_limit = 0"])

    def test_one_that_is_taller_and_not_named(self):
        text = platform(video=("4",), video_addition=("4",), keys="geometry_limit = 1")
        self.check("16", "vic", 16, text, sinks.sink(vics=[4]),
                   told=['add "16" to 60_hz_priority_list', 'add "16" to 60_hz_addition_list',
                         "set geometry_limit = 0"])

    def test_one_that_there_is_no_room_for(self):
        vics = [str(vic) for vic in range(1, 36)]
        text = platform(video=vics, video_addition=vics)
        line = self.line_of(text, '  "34"')
        self.check("35", "vic", 35, text,
                   told=[f'take "34" out of 60_hz_priority_list (box.toml:{line})', 'take "33" out', 'take "32" out',
                         'take "31" out'])

    def test_one_that_would_be_one_too_many(self):
        vics = [str(vic) for vic in range(1, 32)]
        text = platform(video=vics, video_addition=[*vics, "40"])
        self.check("40", "vic", 40, text, told=['add "40" to 60_hz_priority_list', 'take "31" out'])

    def test_one_in_a_block_that_is_too_long_by_one(self):
        vics = [str(vic) for vic in range(1, 33)]
        self.check("1", "vic", 1, platform(video=vics, video_addition=vics), told=['take "32" out'])

    def test_one_whose_list_is_not_there(self):
        text = platform(video=None)
        self.check("16", "vic", 16, text, sinks.sink(vics=[16]),
                   told=[f'add 60_hz_priority_list = ["16"] to the table {DOMAIN} of box.toml'])

    def test_entries_that_are_skipped_do_not_shift_the_lines_that_are_told(self):
        vics = [str(vic) for vic in range(1, 33)]
        text = platform(video=["99", "16 XY", *vics], video_addition=vics)
        line = self.line_of(text, '  "31"')
        self.check("32", "vic", 32, text, told=[f"(box.toml:{line})"])

    def test_one_whose_extension_is_not_announced(self):
        text = platform(name='monitor_name = ""')
        answer = self.check("3", "vic", 3, text, told=['set monitor_name = "Box" (box.toml:2)'])
        self.assertIn("Without a monitor name", answer["reasons"][-1])

    def test_one_whose_extension_is_not_announced_for_want_of_the_key(self):
        text = platform(name="")
        self.check("3", "vic", 3, text, told=['add monitor_name = "Box" to the table'])

    def test_one_that_is_a_detailed_timing_needs_no_extension(self):
        status, (answer,) = self.ask(platform(name=""), None, (), "16")
        self.assertEqual((status, answer["offered"]), (0, True))

    def test_one_that_is_offered_says_so(self):
        status, (answer,) = self.ask(platform(), sinks.sink(vics=[16]), (), "16")
        self.assertEqual((status, answer["offered"], answer["steps"]), (0, True, []))
        self.assertEqual(answer["reasons"], ["60_hz_priority_list names it, and the sink has it."])

    def test_a_mode_of_two_aspect_ratios_is_offered_if_one_of_them_is(self):
        text = platform(video=("3", "4", "16", "1"))
        status, answers = self.ask(text, None, (), "720x480p60")
        self.assertEqual((status, [answer["offered"] for answer in answers]), (0, [False, True]))
        status, answers = self.ask(platform(video=("16",), video_addition=("16",)), None, (), "720x480p60")
        self.assertEqual((status, [answer["offered"] for answer in answers]), (1, [False, False]))


class Modes4k(WantTest):
    def test_one_that_the_sink_has_and_the_priority_list_does_not_name(self):
        text = platform(modes_4k=(3,))
        line = self.line_of(text, "4k_x_2k_priority_list")
        self.check("4k:1", "4k", 1, text, sinks.sink(vics=[16], vics_4k=[1]),
                   told=[f"add 1 to 4k_x_2k_priority_list (box.toml:{line})"])

    def test_one_that_the_sink_does_not_have(self):
        self.check("3840x2160p30", "4k", 1, platform(), told=["add 1 to 4k_x_2k_addition_list"])

    def test_one_that_nobody_names(self):
        self.check("4k:4", "4k", 4, platform(modes_4k=()),
                   told=["add 4 to 4k_x_2k_priority_list", "add 4 to 4k_x_2k_addition_list"])

    def test_one_in_a_block_that_3d_formats_make_too_long(self):
        vics = [f"{vic} FP SBSH TBH" for vic in range(1, 16)]
        text = platform(video=vics, video_addition=vics)
        if 1 in self.offered(text, sinks.sink(vics=[16], vics_4k=[1], has_3d=True), ())["4k"]:
            self.skipTest("the block's length happens to hold the mode")
        self.check("4k:1", "4k", 1, text, sinks.sink(vics=[16], vics_4k=[1], has_3d=True), told=["give --3d off"])

    def test_one_whose_extension_is_not_announced(self):
        self.check("4k:1", "4k", 1, platform(name=""), sinks.sink(vics=[16], vics_4k=[1]), told=["monitor_name"])

    def test_one_that_the_list_has_no_place_for(self):
        self.check("4k:2", "4k", 2, platform(modes_4k=(1,) * 7), sinks.sink(vics=[16], vics_4k=[1, 2]),
                   told=["write 2 in place of 1 in 4k_x_2k_priority_list"])


class AudioFormats(WantTest):
    def test_one_that_nobody_has_of_every_type(self):
        for wanted in ALL_AUDIO_TYPES:
            entry = 0x077F09 if wanted != 1 else 0x500715
            with self.subTest(type=wanted):
                text = platform(audio=(entry,))
                if wanted == 1:  # Basic audio is always there.
                    self.assertEqual(self.ask(text, None, (), "audio:1")[0], 0)
                else:
                    self.check(f"audio:{wanted}", "audio", wanted, text, told=["entry_b = 0x"])

    def test_one_for_a_platform_without_formats(self):
        text = platform(audio=())
        line = self.line_of(text, f"[{DOMAIN}.audio]")
        self.check("ac3", "audio", 2, text, told=[f"after line {line + 1}"])

    def test_one_that_the_sink_has_while_only_the_platforms_are_taken(self):
        text = platform()
        answer = self.check("dts", "audio", 7, text, sinks.sink(vics=[16], audio=[(0x3D, 0x06, 0xC0)]),
                            told=["add entry_c = 0xC0063D"])
        # The sink's own entry, not a cut bit rate; letting all of the sink's formats through comes after it.
        self.assertIn("the sink's own: DTS, 6 channels, 44.1kHz 48kHz, 1536 kbit/s", answer["steps"][0]["remark"])
        line = self.line_of(text, "pass_through")
        self.assertEqual([[(step["action"], step["key"], step["value"], step["line"]) for step in way]
                          for way in answer["other_ways"]], [[("set", "audio.pass_through", "1", line)]])

    def test_one_that_the_platform_has_while_only_the_sinks_are_taken(self):
        self.check("ac3", "audio", 2, platform(pass_through=2), sinks.sink(vics=[16], audio=[(0x3D, 0x06, 0xC0)]),
                   told=["set audio.pass_through = 1"])

    def test_one_that_nobody_has_while_only_the_sinks_are_taken(self):
        self.check("eac3", "audio", 10, platform(pass_through=2), sinks.sink(vics=[16]),
                   told=["entry_c = 0x", "set audio.pass_through = 1"])

    def test_one_that_the_mask_excludes(self):
        self.check("ac3", "audio", 2, platform(), arguments=["--audio-mask", "0x1"], told=["give --audio-mask 0x3"])

    def test_one_of_the_extension_types_that_the_mask_excludes(self):
        self.check("audio:16", "audio", 16, platform(audio=(0x077F09, 0x08077D)), arguments=["--audio-mask", "1"],
                   told=["give --audio-mask 0x4001"])

    def test_one_that_the_sink_filter_takes_away(self):
        self.check("ac3", "audio", 2, platform(), sinks.sink(vics=[16], audio=[(0x09, 0x07, 0x07)]),
                   arguments=["--audio-sink-filter"], told=["leave --audio-sink-filter away"])

    def test_one_whose_sample_rates_the_sink_does_not_have(self):
        text = platform(audio=(0x077F09, 0x504015))  # AC-3 at 192 kHz
        self.check("ac3", "audio", 2, text, sinks.sink(vics=[16], audio=[(0x09, 0x07, 0x07), (0x15, 0x07, 0x50)]),
                   arguments=["--audio-sink-filter"], told=["leave --audio-sink-filter away"])

    def test_one_whose_extension_is_not_announced(self):
        self.check("ac3", "audio", 2, platform(name=""), told=["monitor_name"])

    def test_one_that_much_stands_in_the_way_of(self):
        self.check("mlp", "audio", 12, platform(pass_through=2), sinks.sink(vics=[16]),
                   arguments=["--audio-sink-filter", "--audio-mask", "0x1"],
                   told=["add entry_c", "set audio.pass_through = 1", "give --audio-mask 0x801",
                         "leave --audio-sink-filter away"])

    def test_one_that_there_is_no_room_for(self):
        # Types 1 to 12; byte 1 is the type and 2 channels.
        text = platform(audio=[0x070700 | kind << 3 | 1 for kind in range(1, 13)])
        line = self.line_of(text, "entry_k")
        self.check("audio:12", "audio", 12, text,
                   told=[f"take audio.entry_k out (box.toml:{line})", "take audio.entry_j out"])

    def test_one_that_would_be_one_too_many(self):
        text = platform(audio=[0x070700 | kind << 3 | 1 for kind in range(1, 11)])
        self.check("dts-hd", "audio", 11, text, told=["add entry_k", "take audio.entry_j out"])

    def test_one_that_another_covers_is_offered(self):
        status, (answer,) = self.ask(platform(audio=(0x077F09, 0x500715, 0x500711)), None, (), "ac3")
        self.assertEqual((status, answer["offered"]), (0, True))


class Usage(WantTest):
    def test_what_is_no_mode_is_refused_with_status_2(self):
        for wanted in ("0", "128", "192", "220", "99999999999", "4k:0", "4k:5", "4k:", "audio:0", "audio:15", "audio:19", "audio:x",
                       "1920x1080", "1920x1080p61", "vorbis", ""):
            with self.subTest(wanted=wanted):
                status, printed, complaints = self.run_program("explain", "--want", wanted)
                self.assertEqual((status, printed), (2, ""))
                self.assertTrue(re.match(r"edid-composer: --want: .*\n\Z", complaints), complaints)

    def test_every_audio_type_can_be_asked_for_by_name(self):
        names = {"pcm": 1, "AC3": 2, "mpeg1": 3, "mp3": 4, "mpeg2": 5, "aac": 6, "dts": 7, "atrac": 8, "dsd": 9,
                 "eac3": 10, "dts-hd": 11, "truehd": 12, "dst": 13, "wma-pro": 14, "he-aac": 16, "he-aacv2": 17,
                 "mpeg-surround": 18}
        for name, kind in names.items():
            _, (answer,) = self.ask(platform(), None, (), name)
            self.assertTrue(answer["name"].endswith(f"(audio:{kind})"), answer["name"])

    def test_every_vic_can_be_asked_for_by_its_own_name(self):
        for vic in range(1, 65):
            status, (answer,) = self.ask(platform(), None, (), str(vic))
            name = answer["name"].split(" ")[0].replace("(1440)", "")
            status, answers = self.ask(platform(), None, (), name)
            self.assertIn(answer["name"], [found["name"] for found in answers])

    def test_text_tells_the_same_as_json(self):
        box = self.write("box.toml", platform())
        status, printed, _ = self.run_program("explain", "--platform", box, "--want", "1080p120")
        self.assertEqual(status, 1)
        self.assertEqual(printed.splitlines(), [
            "1920x1080p120 16:9 (VIC 63) is not offered.",
            "  Neither the sink nor any list of the platform names it.",
            "To have it offered:",
            '  - add "63" to 60_hz_priority_list (box.toml:4)',
            '  - add "63" to 60_hz_addition_list (box.toml:10): the platform must be able to take it without the sink',
        ])

    def test_the_platform_may_come_from_standard_input_and_hold_anything(self):
        text = platform(keys='monitor_serial = "a\\"b\\\\c\\u0001é"\nserial = 4294967295\nunknown = [[1], "x"]')
        self.check("32", "vic", 32, text, sinks.sink(vics=[16, 32]), told=['add "32" to 60_hz_priority_list'])


class OwnWords(WantTest):
    """What people call things, and what the library cannot do."""

    def test_each_is_understood_and_proved(self):
        sink = sinks.sink(vics=[16, 63, 4], vics_4k=[1, 3], audio=[(0x0F, 0x7F, 0x07), (0x15, 0x07, 0x50)], has_3d=True)
        bare = platform(video=("3", "1"), video_addition=("3", "1"), modes_4k=())
        for wanted, kind, code in (("1080p120", "vic", 63), ("720p60", "vic", 4), ("vic 16", "vic", 16),
                                   ("1080p59.94", "vic", 16), ("4k30", "4k", 1), ("2160p24", "4k", 3),
                                   ("vic 95", "4k", 1), ("pcm8", "channels", (1, 8)), ("deep-color", "depth", 36),
                                   ("30bit", "depth", 30)):
            with self.subTest(wanted=wanted):
                _, (answer,) = self.ask(bare, sink, (), wanted)
                self.check(wanted, kind, code, bare, sink, told=[step["text"] for step in answer["steps"]])

    def test_3d_is_taken_of_the_sink_before_it_is_always_offered(self):
        with_3d, without = sinks.sink(vics=[16], has_3d=True), sinks.sink(vics=[16])
        self.check("3d", "3d", 1, platform(), with_3d, arguments=["--3d", "off"], told=["give --3d sink"])
        self.check("3d", "3d", 1, platform(), without, told=["give --3d on"])

    def test_what_the_library_cannot_do_is_said_so(self):
        for wanted, reason in (("8k60", "VIC 199 needs a fixed rate link"),
                               ("2160p120", "it needs 1188 MHz"), ("dolby-vision", "only passed on from a sink"),
                               ("48bit", "no configuration of this library offers it")):
            status, (answer,) = self.ask(platform(), sinks.sink(vics=[16, 97]), (), wanted)
            self.assertEqual((status, answer["offered"], answer["steps"], answer["other_ways"]), (1, False, [], []))
            self.assertIn(reason, answer["no_way"])

    def hdmi2_steps(self, wanted, sink, keys=""):
        """The steps as key and value, after checking that the program itself offers it once they are taken."""
        table = f"\n[platform.software.drivers.vorex.edid.hdmi2]\n{keys}" if keys else ""
        _, (answer,) = self.ask(platform() + table, self.sample(sink).read_text(), (), wanted)
        self.assertFalse(answer["offered"])
        changed = platform() + self.changed_table(keys, answer["steps"])
        status, (after,) = self.ask(changed, self.sample(sink).read_text(), (), wanted)
        self.assertEqual((status, after["offered"]), (0, True), changed)
        return [(step["key"].removeprefix("hdmi2."), step["value"]) for step in answer["steps"]]

    @staticmethod
    def changed_table(keys, steps):
        values = dict(line.split(" = ") for line in keys.splitlines())
        for step in steps:
            key = step["key"].removeprefix("hdmi2.")
            if step["action"] == "add to list":
                inner = values.get(key, "[]")[1:-1]
                values[key] = f"[{inner}{', ' if inner else ''}{step['value']}]"
            else:
                values[key] = step["value"]
        lines = "".join(f"{key} = {value}\n" for key, value in values.items())
        return f"\n[platform.software.drivers.vorex.edid.hdmi2]\n{lines}"

    def test_what_hdmi_2_added_is_turned_on_with_its_own_keys(self):
        on = ("enable", "1")
        for sink, wanted, steps in (
                ("tv_4k_hdr", "2160p60", [on, ("vic_priority_list", "97"), ("tmds_limit", "595")]),
                ("tv_4k_hdr", "97", [on, ("vic_priority_list", "97"), ("tmds_limit", "595")]),
                ("tv_4k_hdr", "hdr10", [on, ("hdr_pq", "2")]),
                ("tv_4k_hdr", "hlg", [on, ("hdr_hlg", "2")]),
                ("tv_4k_hdr", "dolby-vision", [on, ("pass_dolby_vision", "1")]),
                ("tv_4k_hdr", "allm", [on, ("allm", "1")]),
                ("gaming_monitor", "vrr", [on, ("vrr", "2")]),
                ("gaming_monitor", "allm", [on, ("allm", "2")]),
                ("gaming_monitor", "freesync", [on, ("pass_freesync", "1"), ("vrr", "2")]),
                ("projector_420", "2160p60", [on, ("vic_priority_list", "97"), ("y420", "2")]),
                ("projector_420", "4:2:0", [on, ("y420", "2"), ("vic_priority_list", "97")])):
            with self.subTest(sink=sink, wanted=wanted):
                self.assertEqual(self.hdmi2_steps(wanted, sink), steps)

    def test_a_sink_that_is_too_slow_leaves_it_to_the_box(self):
        steps = self.hdmi2_steps("2160p60", "tv_4k", "enable = 1\ntmds_limit = 600\nvic_priority_list = [97]\n")
        self.assertEqual(steps, [("vic_addition_list", "97")])

    def test_a_platform_that_no_edid_can_be_composed_with_is_mended_first(self):
        text = platform(audio=(0x077F7F, 0x500715), pass_through=2)
        self.check("ac3", "audio", 2, text, sinks.sink(vics=[16]),
                   told=["set audio.pass_through = 1", "take audio.entry_a out"])

    def test_fewer_channels_of_a_type_are_replaced(self):
        self.check("ac36", "channels", (2, 6), platform(audio=(0x077F09, 0x500711)),
                   told=["set audio.entry_b = 0x500715"])

    def test_what_a_sink_has_more_of_than_there_is_room_for(self):
        audio = [(kind << 3 | 1, 0x07, 0x01) for kind in range(3, 13)]
        text = platform(audio=(0x077F09,), pass_through=2)
        self.check("truehd", "audio", 12, text, sinks.sink(vics=[16], audio=audio),
                   told=["add entry_b", "set audio.pass_through = 1"])


if __name__ == "__main__":
    unittest.main()
