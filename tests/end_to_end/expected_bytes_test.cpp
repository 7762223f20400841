// Whole compositions, byte for byte.
#include <gtest/gtest.h>

#include <cstring>
#include <string>

#include "composition.h"
#include "support/configuration_tree.h"
#include "support/hex_text.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using end_to_end::compose;
using test_support::append;
using test_support::append_modes;
using test_support::bytes_of_hex_text;
using test_support::hex_lines;

// A host without a sink and without a configuration still presents an EDID: 640x480 and basic audio.
const char *const bytes_of_an_empty_configuration = R"(
  00 FF FF FF FF FF FF 00                               # header
  67 39                                                 # manufacturer YYY
  00 00                                                 # product code
  00 00 00 00                                           # serial number
  01 16                                                 # week 1 of 2012
  01 03                                                 # EDID 1.3
  80                                                    # digital input
  A0 5A                                                 # 160 x 90 cm
  78                                                    # gamma 2.20
  0E                                                    # RGB colour, sRGB, preferred timing
  0D C9                                                 # red 640 348, green 287 609, blue 159 72, white 290 305:
  A0 57 47 98 27 12 48 4C                               # their low bits, their high bits
  20 00 00                                              # established timings: 640x480 at 60 Hz
  01 01 01 01 01 01 01 01 01 01 01 01 01 01 01 01       # standard timings: none
  D6 09 80 A0 20 E0 2D 10 10 60 A2 00 13 8E 21 00 00 18 # 640x480p60, 531 x 398 mm
  D6 09 80 A0 20 E0 2D 10 10 60 A2 00 13 8E 21 00 00 18 # the same once more
  00 00 00 FD 00 31 3D 0F 46 0F 00 0A 20 20 20 20 20 20 # limits: 49-61 Hz, 15-70 kHz, 150 MHz
  01 B8                                                 # no name, so these are not where they are looked for:
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00       # number of extensions and checksum
  00 00

  02 03                                                 # CEA-861 extension, revision 3
  1A                                                    # detailed timings begin at byte 26
  73                                                    # basic audio, YCbCr 4:4:4 and 4:2:2, 3 native timings
  83                                                    # speaker allocation data block, 3 bytes
  01 00 00                                              # front left and right
  44                                                    # video data block, 4 bytes
  81 01 01 01                                           # 1 (640x480p60), native; and as padding
  23                                                    # audio data block, 3 bytes
  09 07 05                                              # PCM, 2 channels, 32 to 48 kHz, 16 and 24 bits
  68                                                    # vendor-specific data block, 8 bytes
  03 0C 00                                              # HDMI
  FF FF                                                 # physical address f.f.f.f
  00                                                    # no deep colour
  00                                                    # TMDS clock not declared
  00                                                    # neither latencies nor HDMI video
  D6 09 80 A0 20 E0 2D 10 10 60 A2 00 13 8E 21 00 00 18 # 640x480p60
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00       # unused
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00
  00 00 00
  4D                                                    # checksum
)";

TEST(ExpectedBytes, OfAnEmptyConfigurationWithoutSink) {
  const test_support::configuration_tree_t tree;
  for (const bool traced : {false, true}) {
    const auto composition = compose({}, test_support::plain_settings(), nullptr, traced);
    EXPECT_TRUE(composition.composed);
    EXPECT_EQ(hex_lines(composition.bytes), hex_lines(bytes_of_hex_text(bytes_of_an_empty_configuration)));
    EXPECT_EQ(composition.spa_offset, 149);
  }
}

TEST(ExpectedBytes, OfAnEmptyConfigurationComeWithItsWarningsAndThePadding) {
  const test_support::configuration_tree_t tree;
  const std::string output = compose({}, test_support::plain_settings(), nullptr, false).output;
  EXPECT_EQ(test_support::count_of(output, "get_pc_int() WARNING: Unable to find the platform path:"), 14);
  EXPECT_EQ(test_support::count_of(output, "get_pc_uint() WARNING: Unable to find the platform path:"), 8);
  EXPECT_EQ(test_support::count_of(output, "get_pc_str() WARNING: Error trying to read "), 3);
  EXPECT_EQ(test_support::count_of(output, "ERROR: Unabled to find the platform node:"), 10);
  EXPECT_EQ(test_support::count_of(output, "ERROR: A mode list ("), 4);
  // What follows on the configuration's last line.
  const std::string last =
      "Unabled to find the platform node:platform.software.drivers.vorex.edid.standard_timings.\n\n";
  const std::size_t end = output.find(last);
  ASSERT_NE(end, std::string::npos);
  std::string expected = test_support::bug_line("edid_composer", "_maximum_pixel_clock",
                                                "\tReceived a list that contains no entries. List:PTR");
  for (const char *count : {"0", "1", "2", "3"}) {
    expected += test_support::error_line("edid_composer", "_populate_new_edid",
                                         std::string("The number of video formats to be encoded is less than 4! "
                                                     "Padding until 4 is reached. Check the platform configuration "
                                                     "file is correct. Number in the video list:") +
                                             count);
  }
  EXPECT_EQ(output.substr(end + last.size()), expected);
}

// A television with a taste of everything that the library follows.
const char *const television = R"(
  00 FF FF FF FF FF FF 00                               # header
  52 74                                                 # manufacturer TST
  01 00 01 00 00 00 01 16 01 03 80                      # product, serial number, week 1 of 2012, EDID 1.3, digital
  66 39 78 0E                                           # 102 x 57 cm, gamma 2.20, features
  EE 91 A3 54 4C 99 26 0F 50 54                         # primaries
  20 00 00                                              # established timings
  01 01 01 01 01 01 01 01 01 01 01 01 01 01 01 01       # standard timings: none
  02 3A 80 18 71 38 2D 40 58 2C 45 00 FC 3E 32 00 00 1E # 1920x1080p60, 1020 x 574 mm
  00 00 00 10 00 00 00 00 00 00 00 00 00 00 00 00 00 00 # unused
  00 00 00 10 00 00 00 00 00 00 00 00 00 00 00 00 00 00 # unused
  00 00 00 10 00 00 00 00 00 00 00 00 00 00 00 00 00 00 # unused
  01                                                    # 1 extension block
  AC                                                    # checksum

  02 03                                                 # CEA-861 extension, revision 3
  27                                                    # detailed timings begin at byte 39
  71                                                    # basic audio, YCbCr 4:4:4 and 4:2:2, 1 native timing
  44                                                    # video data block, 4 bytes
  90 04 05 1F                                           # 16 (1080p60, native), 4 (720p60), 5 (1080i60), 31 (1080p50)
  26                                                    # audio data block, 6 bytes
  09 07 07                                              # PCM, 2 channels, 32 to 48 kHz, 16 to 24 bits
  3D 06 C0                                              # DTS, 6 channels, 44.1 and 48 kHz, 1536 kbit/s
  72                                                    # vendor-specific data block, 18 bytes
  03 0C 00                                              # HDMI
  12 00                                                 # physical address 1.2.0.0
  80                                                    # Supports_AI
  2D                                                    # TMDS clock up to 225 MHz
  E4                                                    # both latencies, HDMI video, content type cinema
  0B 0B 15 15                                           # latencies: 20 ms, interlaced 40 ms
  A0                                                    # 3D: mandatory formats, structures for all
  23                                                    # 1 HDMI VIC, 3 bytes of 3D
  01                                                    # 3840x2160p30
  01 01                                                 # 3D structures: side-by-side half, frame packing
  16                                                    # video descriptor 1: top-and-bottom
  E3                                                    # extended tag data block, 3 bytes
  05 02 00                                              # colorimetry: xvYCC709
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00       # unused
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00
  00 00 00 00 00 00 00 00
  FD                                                    # checksum
)";

const char *const bytes_below_the_television = R"(
  00 FF FF FF FF FF FF 00                               # header
  04 43                                                 # manufacturer ABC
  34 12                                                 # product code 0x1234
  EF CD AB 89                                           # serial number 0x89ABCDEF
  14 18                                                 # week 20 of 2014
  01 03                                                 # EDID 1.3
  80                                                    # digital input
  A0 5A                                                 # 160 x 90 cm
  78                                                    # gamma 2.20
  0E                                                    # RGB colour, sRGB, preferred timing
  EE 91 A3 54 4C 99 26 0F 50 54                         # the television's primaries
  A1 08 80                                              # established timings, with 640x480 at 60 Hz
  81 80                                                 # 1280x1024p60
  D1 C0                                                 # 1920x1080p60
  01 01 01 01 01 01 01 01 01 01 01 01                   # standard timings: no more
  02 3A 80 18 71 38 2D 40 58 2C 45 00 C4 8E 21 00 00 1E # 1920x1080p60, 708 x 398 mm
  01 1D 00 72 51 D0 1E 20 6E 28 55 00 C4 8E 21 00 00 1E # 1280x720p60
  00 00 00 FC 00 42 6F 78 0A 20 20 20 20 20 20 20 20 20 # name "Box"
  00 00 00 FD 00 31 3D 0F 46 0F 00 0A 20 20 20 20 20 20 # limits: 49-61 Hz, 15-70 kHz, 150 MHz
  01                                                    # 1 extension block
  C6                                                    # checksum

  02 03                                                 # CEA-861 extension, revision 3
  34                                                    # detailed timings begin at byte 52
  F3                                                    # underscan, basic audio, YCbCr, 3 native timings
  83                                                    # speaker allocation data block, 3 bytes
  4F 00 00                                              # 7.1: FL/FR, LFE, FC, RL/RR, RLC/RRC
  45                                                    # video data block, 5 bytes
  90 04 05 1F 02                                        # 16, native; 4; 5; 31; 2, which only the platform names
  2C                                                    # audio data block, 12 bytes
  09 07 05                                              # PCM of the platform; the television's is a duplicate
  15 07 50                                              # AC-3 of the platform
  7D 04 08                                              # HE-AAC of the platform
  3D 06 C0                                              # DTS of the television
  74                                                    # vendor-specific data block, 20 bytes
  03 0C 00                                              # HDMI
  12 30                                                 # physical address 1.2.3.0
  B8                                                    # Supports_AI, deep colour 36 and 30 bits, also in YCbCr 4:4:4
  5A                                                    # 450 MHz: 1080p60 in frame packing at 36 bits is 445.5
  E5                                                    # both latencies, HDMI video, content types graphics and cinema
  10 15                                                 # video 10 + 20 ms, audio 20 + 20 ms
  15 FF                                                 # interlaced: video 0 + 40 ms, audio not supported
  88                                                    # 3D: mandatory formats; image size 1
  44                                                    # 2 HDMI VICs, 4 bytes of 3D
  01 04                                                 # 3840x2160p30, 4096x2160p24
  00                                                    # video descriptor 0: frame packing
  18 00                                                 # video descriptor 1: side-by-side half; the rest is mandatory
  30                                                    # video descriptor 3: frame packing
  E3                                                    # extended tag data block, 3 bytes
  05 03 01                                              # colorimetry: xvYCC601, xvYCC709
  D6 09 80 A0 20 E0 2D 10 10 60 A2 00 13 8E 21 00 00 18 # 640x480p60
  00 00 00 FF 00 53 4E 2D 31 0A 20 20 20 20 20 20 20 20 # serial number "SN-1"
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00       # unused
  00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00
  00 00 00 00 00 00 00
  A0                                                    # checksum
)";

void fill(platform_values_t *values) {
  std::memcpy(values->manufacturer_id, "ABC", 4);
  values->product_id = 0x1234;
  values->serial = 0x89ABCDEF;
  values->week = 20;
  values->year = 2014;
  std::strcpy(values->monitor_name, "Box");
  std::strcpy(values->monitor_serial, "SN-1");
  values->established_timings_1 = 0x81;
  values->established_timings_2 = 0x08;
  values->manufacturer_timings = 0x80;
  append(values->std_timings, std_timing_t{1280, 2, 60});
  append(values->std_timings, std_timing_t{1920, 3, 60});
  values->underscan = 1;
  values->speaker_entry = 0x4F;
  values->dc_30bit = values->dc_36bit = 1;
  values->supports_ai = 2;
  values->cnc0 = 1;
  values->cnc1 = 2;
  values->cnc2 = 2;
  values->xvYCC601 = 1;
  values->xvYCC709 = 2;
  append_modes(values->video_60_priority, {{16, 5}, {4, 7}, {5, 2}, {31, 5}, {2, 0}, {3, 0}});
  append_modes(values->video_60_additional, {{2, 0}});
  values->modes_4k_x_2k_priority[0] = 1;
  values->modes_4k_x_2k_priority[1] = 3;
  values->modes_4k_x_2k_priority[2] = 4;
  values->modes_4k_x_2k_addition[0] = 4;
  values->audio_pass_through = 1;
  append(values->audio_list, i32{0x050709});
  append(values->audio_list, i32{0x500715});
  append(values->audio_list, i32{0x08047D});
}

TEST(ExpectedBytes, OfACallersOwnPlatformValuesBelowATelevision) {
  const test_support::configuration_tree_t tree;
  test_support::scoped_values_t values;
  fill(values.get());
  const platform_values_t before = *values.get();
  compose_cfg_t cfg = test_support::plain_settings();
  cfg.port = 2;
  cfg.hdmi_3d_mode = 1;
  cfg.edid_latency[0] = 10;
  cfg.edid_latency[1] = 20;
  cfg.edid_latency[3] = 600;
  for (const bool traced : {false, true}) {
    const auto composition = compose(bytes_of_hex_text(television), cfg, values.get(), traced);
    EXPECT_TRUE(composition.composed);
    EXPECT_EQ(hex_lines(composition.bytes), hex_lines(bytes_of_hex_text(bytes_below_the_television)));
    EXPECT_EQ(composition.spa_offset, 159);
    if (!traced) {
      EXPECT_EQ(composition.output, "");
    }
  }
  EXPECT_EQ(tree.lookups(), 0);
  EXPECT_EQ(std::memcmp(values.get(), &before, sizeof before), 0);
  EXPECT_EQ(test_support::elements_of<i32>(values->audio_list), (std::vector<i32>{0x050709, 0x500715, 0x08047D}));
}

}  // namespace
