"""The host in C composes from its table what the program composes from the same configuration in a file."""

import os

import edid_bytes
import running

REPORT = """What the third input shows
	Manufacter   : ZQA
	Monitor Name : "Table Box"
	Serial Number: 0

	Vics:
	  16	1920x1080p60Hz16x9   Native
	  4	1280x720p60Hz16x9
	  3	720x480p60Hz16x9
	  1	640x480p60Hz4x3

	Audio:
	  Code: 1:PCM Channels:2 Freq:32kHz 44.1kHz 48kHz  Bits:16bits 24bits

	Address=3.0.0.0
"""

SAME_CONFIGURATION = """[platform.software.drivers.vorex.edid]
monitor_name = "Table Box"
manufacturer_id = "ZQA"
product_id = 0x1234
is_tv = 1
60_hz_priority_list = ["16", "4", "3", "1"]
60_hz_addition_list = ["16", "4", "3", "1"]
"""


class MinimalHost(running.ExampleTest):
    host = os.environ["MINIMAL_HOST"]

    def test_prints_what_its_third_input_shows(self):
        status, printed, complaints = self.run_in_folder([self.host])
        self.assertEqual((status, complaints), (0, ""))
        report = printed[printed.index(REPORT.splitlines()[0]) :]
        self.assertEqual([line.rstrip() for line in report.splitlines()], REPORT.splitlines())

    def test_warns_of_keys_that_the_table_lacks_and_of_no_other(self):
        _, printed, _ = self.run_in_folder([self.host])
        warnings = [line for line in printed.splitlines() if "WARNING" in line]
        self.assertTrue(any("edid.serial" in line for line in warnings), printed)
        for key in ("monitor_name", "manufacturer_id", "product_id", "is_tv"):
            self.assertFalse(any(f"edid.{key}" in line for line in warnings), f"{key} was not found:\n{printed}")

    def test_writes_the_bytes_that_the_program_composes_from_the_same_configuration(self):
        if not os.environ["EDID_COMPOSER"]:
            self.skipTest("the command-line program is not built")
        platform = self.write("box.toml", SAME_CONFIGURATION)
        status, printed, complaints = self.run_in_folder([self.host, "third.bin"])
        self.assertEqual(status, 0, printed + complaints)
        written = (self.folder / "third.bin").read_bytes()
        self.assertEqual(len(written), 256)
        self.assertTrue(edid_bytes.has_right_checksums(written))
        self.assertEqual(written.hex(" "), self.compose("--platform", platform, "--port", "2").hex(" "))

    def test_tells_when_the_file_cannot_be_written(self):
        status, _, complaints = self.run_in_folder([self.host, "no_such_folder/third.bin"])
        self.assertEqual(status, 1)
        self.assertIn("no_such_folder/third.bin", complaints)


if __name__ == "__main__":
    running.main()
