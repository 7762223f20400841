"""The script for a capture device composes from a connector's EDID and hands the result to v4l2-ctl.

A stand-in for v4l2-ctl notes how it is called and keeps the file, which is gone when the script has ended.
"""

import os
import pathlib
import re
import shutil
import unittest

import running

STAND_IN = """#!/bin/sh
for word in "$@"; do printf '%s\\n' "$word"; done >"$CALLS"
for word in "$@"; do
  case $word in
    --set-edid=*) cp "$(printf '%s' "$word" | sed 's/.*file=\\([^,]*\\).*/\\1/')" "$KEPT" ;;
  esac
done
exit "${STAND_IN_STATUS:-0}"
"""
DEVICE = "/dev/video7"


class V4l2Capture(running.ExampleTest):
    def setUp(self):
        super().setUp()
        self.script = self.examples / "v4l2_capture.sh"
        (self.folder / "bin").mkdir()
        (self.folder / "tmp").mkdir()
        self.write("bin/v4l2-ctl", STAND_IN).chmod(0o755)
        os.symlink(os.environ["EDID_COMPOSER"], self.folder / "bin" / "edid-composer")
        self.calls = self.folder / "calls"
        self.kept = self.folder / "kept.bin"

    def run_script(self, *arguments, **environment):
        places = {"PATH": f"{self.folder}/bin:{os.environ['PATH']}", "TMPDIR": str(self.folder / "tmp"),
                  "CALLS": str(self.calls), "KEPT": str(self.kept)}
        return self.run_in_folder(["sh", self.script, *arguments], **places, **environment)

    def assert_nothing_left_behind(self):
        self.assertEqual(list((self.folder / "tmp").iterdir()), [])

    def test_hands_the_composed_bytes_to_the_device(self):
        connector = self.write("edid", self.sinks["tv_4k"])
        status, printed, complaints = self.run_script(connector, DEVICE)
        self.assertEqual((status, complaints), (0, ""), printed)
        option, device, edid = self.calls.read_text().splitlines()
        self.assertEqual((option, device), ("-d", DEVICE))
        self.assertRegex(edid, r"^--set-edid=pad=0,file=[^,]+,format=raw$")
        self.assertEqual(self.kept.read_bytes(), self.compose("--sink", connector))
        self.assert_nothing_left_behind()

    def test_hands_options_on_to_compose(self):
        connector = self.write("edid", self.sinks["av_receiver"])
        platform = self.examples / "platforms" / "receiver_50hz.toml"
        options = ["--platform", platform, "--port", "3", "--3d", "off"]
        self.assertEqual(self.run_script(connector, DEVICE, *options)[0], 0)
        self.assertEqual(self.kept.read_bytes(), self.compose("--sink", connector, *options))

    def test_composes_without_a_sink_where_nothing_is_plugged_in(self):
        status, printed, complaints = self.run_script(self.write("edid", b""), DEVICE)
        self.assertEqual((status, complaints), (0, ""), printed)
        self.assertEqual(self.kept.read_bytes(), self.compose())

    def test_leaves_the_device_alone_when_there_is_no_such_connector(self):
        status, _, complaints = self.run_script("no_such_connector/edid", DEVICE)
        self.assertNotEqual(status, 0)
        self.assertIn("no_such_connector/edid", complaints)
        self.assertFalse(self.calls.exists())
        self.assert_nothing_left_behind()

    def test_leaves_the_device_alone_when_composing_fails(self):
        connector = self.write("edid", self.sinks["tv_4k"])
        status, _, complaints = self.run_script(connector, DEVICE, "--platform", "no_such_platform.toml")
        self.assertEqual(status, 2)
        self.assertIn("no_such_platform.toml", complaints)
        self.assertFalse(self.calls.exists())
        self.assert_nothing_left_behind()

    def test_ends_with_the_status_of_the_device_program(self):
        connector = self.write("edid", self.sinks["tv_4k"])
        self.assertEqual(self.run_script(connector, DEVICE, STAND_IN_STATUS="3")[0], 3)
        self.assert_nothing_left_behind()

    def test_tells_its_usage(self):
        status, _, complaints = self.run_script("edid")
        self.assertEqual(status, 2)
        self.assertIn("usage:", complaints)

    @unittest.skipUnless(shutil.which("v4l2-ctl"), "v4l2-ctl is not installed")
    def test_uses_options_that_the_real_program_has(self):
        _, help_text, _ = self.run_in_folder(["v4l2-ctl", "--help-edid"])
        self.assertRegex(help_text, r"--set-edid pad=<pad>.*file=<file>.*format=<fmt>")
        self.assertRegex(help_text, r"raw:\s+raw binary EDID")

    @unittest.skipUnless(shutil.which("shellcheck"), "shellcheck is not installed")
    def test_shellcheck_finds_nothing(self):
        status, findings, _ = self.run_in_folder(["shellcheck", self.script])
        self.assertEqual(status, 0, findings)

    def test_documents_show_the_same_command(self):
        command = re.compile(r"v4l2-ctl -d \S+ --set-edid=pad=0,file=\S+,format=raw")
        guide = pathlib.Path(os.environ["SOURCE_DIR"]) / "docs" / "integration.md"
        self.assertRegex(guide.read_text(), command)
        self.assertRegex(self.script.read_text(), command)


if __name__ == "__main__":
    running.main()
