"""What the host in C++ makes of one composition by patching the address is, for each input, what is composed for it."""

import os

import edid_bytes
import running

INPUTS = 15
UNPLUGGED = "-"


class HotplugHost(running.ExampleTest):
    host = os.environ["HOTPLUG_HOST"]

    def setUp(self):
        super().setUp()
        _, default_platform, _ = self.run_in_folder([os.environ["EDID_COMPOSER"], "platform"])
        self.default_platform = self.write("default.toml", default_platform)
        (self.folder / "shown").mkdir()

    def run_host(self, platform, inputs, *events):
        return self.run_in_folder([self.host, platform, inputs, "shown", *events])

    def shown(self, event, used_input):
        return (self.folder / "shown" / f"{event}.input{used_input}.bin").read_bytes()

    def write_sinks(self, sinks):
        return [self.write(f"{name}.bin", content) for name, content in sinks.items()]

    def assert_shows_what_is_composed(self, platform, events, inputs):
        """Each input shows what is composed for it alone, at each event."""
        status, printed, complaints = self.run_host(platform, INPUTS, *events)
        self.assertEqual((status, complaints), (0, ""), printed)
        for number, event in enumerate(events, start=1):
            sink = [] if event == UNPLUGGED else ["--sink", event]
            for used_input in inputs:
                composed = self.compose("--platform", platform, *sink, "--port", used_input)
                shown = self.shown(number, used_input)
                self.assertEqual(shown.hex(" "), composed.hex(" "), f"{event}, input {used_input}")

    def test_every_input_shows_what_is_composed_for_it(self):
        events = [*self.write_sinks(self.sinks), UNPLUGGED]
        self.assert_shows_what_is_composed(self.default_platform, events, range(INPUTS))

    def test_so_it_does_on_other_platforms(self):
        events = [*self.write_sinks(self.sinks), UNPLUGGED]
        for name in ("minimal", "receiver_50hz"):
            with self.subTest(platform=name):
                platform = self.examples / "platforms" / f"{name}.toml"
                self.assert_shows_what_is_composed(platform, events, (0, 1, INPUTS - 1))

    def test_so_it_does_behind_sinks_at_every_level_of_the_tree(self):
        addresses = ("0.0.0.0", "1.0.0.0", "15.0.0.0", "1.2.0.0", "1.2.3.0", "15.15.15.0", "1.2.3.4", "1.0.3.0",
                     "15.15.15.15")
        sinks = {address: edid_bytes.with_address(self.sinks["tv_4k"], address) for address in addresses}
        self.assert_shows_what_is_composed(self.default_platform, self.write_sinks(sinks), (0, 1, 2, INPUTS - 1))

    def test_inputs_differ_in_address_and_checksum_only(self):
        status, printed, _ = self.run_host(self.default_platform, 4, *self.write_sinks({"tv": self.sinks["tv_4k"]}))
        self.assertEqual(status, 0, printed)
        first, third = self.shown(1, 0), self.shown(1, 2)
        address = first.index(edid_bytes.HDMI_OUI, 128) + 3
        differing = [i for i in range(256) if first[i] != third[i]]
        self.assertEqual(differing, [address, 255])
        self.assertEqual((first[address], third[address]), (0x21, 0x23))
        self.assertTrue(edid_bytes.has_right_checksums(third))

    def test_the_address_of_each_input_is_that_of_the_last_event(self):
        tv, receiver = self.write_sinks({"tv": self.sinks["tv_4k"], "receiver": self.sinks["av_receiver"]})
        _, printed, _ = self.run_host(self.default_platform, 2, tv, UNPLUGGED, receiver)
        self.assertEqual(printed.splitlines()[-2:], ["input 0: 3.1.1.0", "input 1: 3.1.2.0"])
        _, printed, _ = self.run_host(self.default_platform, 2, tv, UNPLUGGED)
        self.assertEqual(printed.splitlines()[-2:], ["input 0: f.f.f.f", "input 1: f.f.f.f"])

    def test_another_platform_holds_from_its_event_on(self):
        other = self.examples / "platforms" / "receiver_50hz.toml"
        (tv,) = self.write_sinks({"tv": self.sinks["tv_4k"]})
        status, printed, complaints = self.run_host(self.default_platform, 2, tv, "--platform", other, tv)
        self.assertEqual((status, complaints), (0, ""), printed)
        self.assertEqual(self.shown(1, 1), self.compose("--platform", self.default_platform, "--sink", tv, "--port", 1))
        self.assertEqual(self.shown(3, 1), self.compose("--platform", other, "--sink", tv, "--port", 1))

    def test_a_refused_platform_is_told_and_leaves_the_one_before(self):
        (tv,) = self.write_sinks({"tv": self.sinks["tv_4k"]})
        broken = self.write("broken.toml", "monitor_name = \n")
        status, _, complaints = self.run_host(self.default_platform, 1, "--platform", broken, tv)
        self.assertEqual(status, 1)
        self.assertIn(f"hotplug_host: {broken}:1", complaints)
        self.assertEqual(self.shown(2, 0), self.compose("--platform", self.default_platform, "--sink", tv))

    def test_a_display_that_cannot_be_read_counts_as_none(self):
        status, printed, _ = self.run_host(self.default_platform, 1, "no_such_file.bin")
        self.assertEqual(status, 0, printed)
        self.assertEqual(self.shown(1, 0), self.compose("--platform", self.default_platform))

    def test_an_edid_that_cannot_be_written_is_told(self):
        status, _, complaints = self.run_in_folder([self.host, self.default_platform, 1, "no_such_folder", UNPLUGGED])
        self.assertEqual(status, 1)
        self.assertIn("no_such_folder/1.input0.bin", complaints)

    def test_bad_usage_is_told(self):
        for arguments in ([], [self.default_platform, 0, "shown", "-"], [self.default_platform, 16, "shown", "-"],
                          [self.default_platform, 1, "shown", "--platform"]):
            status, _, complaints = self.run_in_folder([self.host, *arguments])
            self.assertEqual(status, 2)
            self.assertIn("usage: hotplug_host PLATFORM INPUTS FOLDER EVENT...", complaints)


if __name__ == "__main__":
    running.main()
