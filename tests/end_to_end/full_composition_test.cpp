// A platform that offers more than an EDID can hold.
#include <gtest/gtest.h>

#include <string>

#include "composition.h"
#include "support/configuration_tree.h"
#include "support/hex_text.h"
#include "support/output_capture.h"
#include "support/patterns.h"
#include "support/records.h"

namespace {

using end_to_end::compose;
using test_support::configuration_tree_t;
using test_support::count_of;

constexpr int modes = 45;

const char *const expected_bytes = R"(
  00 FF FF FF FF FF FF 00                               # header
  52 74 34 12 04 03 02 01                               # manufacturer TST, product code 0x1234, serial 0x01020304
  14 18 01 03 80 A0 5A 78 0E                            # week 20 of 2014, EDID 1.3, 160 x 90 cm, gamma 2.20
  0D C9 A0 57 47 98 27 12 48 4C                         # primaries
  21 08 80                                              # established timings
  81 80 D1 C0 01 01 01 01 01 01 01 01 01 01 01 01       # 1280x1024p60, 1920x1080p60
  D6 09 80 A0 20 E0 2D 10 10 60 A2 00 13 8E 21 00 00 18 # 640x480p60
  8C 0A D0 8A 20 E0 2D 10 10 3E 96 00 13 8E 21 00 00 18 # 720x480p60
  00 00 00 FC 00 4C 69 76 69 6E 67 20 72 6F 6F 6D 0A 20 # name "Living room"
  00 00 00 FD 00 31 3D 0F 46 0F 00 0A 20 20 20 20 20 20 # limits
  01 E7                                                 # 1 extension block, checksum

  02 03                                                 # CEA-861 extension, revision 3
  9E                                                    # detailed timings would begin at byte 158
  F3                                                    # underscan, basic audio, YCbCr, 3 native timings
  83 4F 00 00                                           # speaker allocation data block
  40                                                    # video data block, 32 bytes, which count as none
  81 02 03 04 05 06 07 08 09 0A 0B 0C 0D 0E 0F 10       # the first 32 modes
  11 12 13 14 15 16 17 18 19 1A 1B 1C 1D 1E 1F 20
  3E                                                    # audio data block, 30 bytes
  09 07 07 0A 07 07 0B 07 07 0C 07 07                   # PCM, 2 to 8 channels
  0D 07 07 0E 07 07 0F 07 07
  15 07 50 1D 07 50 25 07 50                            # AC-3, MPEG1, MP3
  71                                                    # vendor-specific data block, 81 bytes, which count as 17
  03 0C 00 10 00                                        # HDMI, physical address 1.0.0.0
  B8 3C                                                 # Supports_AI, deep colour; TMDS clock up to 300 MHz
  E5 06 0B 10 15                                        # latencies 10, 20, interlaced 30, 40 ms; HDMI video; contents
  88                                                    # 3D: mandatory formats; image size 1
  FC                                                    # 7 HDMI VICs, 60 bytes of 3D, which count as 28
  01 02 03 04 01 02 03
  00 08 00 06                                           # video descriptor 0: all three structures; 1 and 2 too
  10 18 00 16 20 28 00 26
  38 00                                                 # video descriptor 3 (720p60): the rest is mandatory
  40 46                                                 # video descriptor 4 (1080i60): likewise
  50 58 00 56 60 68 00 66 70 78 00 76 80 88 00 86 90    # video descriptors 5 to 8, and 9 as far as there is room
  25                                                    # checksum
)";

class FullComposition : public testing::Test {
 protected:
  FullComposition() {
    tree_.fill_completely();
    for (const char *list : {"60_hz_priority_list", "60_hz_addition_list", "4k_x_2k_priority_list"})
      tree_.remove(list);
    for (int vic = 1; vic <= modes; ++vic) {
      tree_.add("60_hz_priority_list", std::to_string(vic) + " FP TBH SBSH");
      tree_.add("60_hz_addition_list", std::to_string(vic) + " FP TBH SBSH");
    }
    for (const int mode : {1, 2, 3, 4, 1, 2, 3})
      tree_.add("4k_x_2k_priority_list", mode);
    for (const int mode : {1, 2, 3})
      tree_.add("4k_x_2k_addition_list", mode);
    for (const char *key : {"geometry_limit", "current_mode_set_to_priority", "audio.pass_through"})
      tree_.set(key, 0);
    tree_.set("native_refresh_rate", 60);
    tree_.set("native_bit", 1);
    tree_.set("monitor_serial", std::string("SERIAL-NUMBER"));
    fill_audio();
    cfg_.hdmi_3d_mode = 2;
    for (u32 i = 0; i < 4; ++i)
      cfg_.edid_latency[i] = 10 * (i + 1);
  }

  // PCM of 2 to 8 channels, the types 2 to 14, the three extended types, and three that are duplicates.
  void fill_audio() {
    std::vector<i32> entries;
    for (i32 channels = 2; channels <= 8; ++channels)
      entries.push_back(0x070700 | 1 << 3 | (channels - 1));
    for (i32 type = 2; type <= 14; ++type)
      entries.push_back(0x500700 | type << 3 | 5);
    for (i32 extension = 1; extension <= 3; ++extension)
      entries.push_back(extension << 19 | 0x0700 | 15 << 3 | 5);
    for (i32 type = 2; type <= 4; ++type)
      entries.push_back(0x400700 | type << 3 | 1);
    ASSERT_EQ(entries.size(), 26U);
    char letter = 'a';
    for (const i32 entry : entries)
      tree_.set(std::string("audio.entry_") + letter++, entry);
  }

  configuration_tree_t tree_;
  compose_cfg_t cfg_ = test_support::plain_settings();
};

TEST_F(FullComposition, IsCutWhereTheBlockEnds) {
  for (const bool traced : {false, true}) {
    const auto composition = compose({}, cfg_, nullptr, traced);
    EXPECT_TRUE(composition.composed);
    EXPECT_EQ(test_support::hex_lines(composition.bytes),
              test_support::hex_lines(test_support::bytes_of_hex_text(expected_bytes)));
    EXPECT_EQ(composition.spa_offset, 204);
    end_to_end::expect_valid_edid(composition.bytes);
  }
}

TEST_F(FullComposition, SaysWhatWasLeftOut) {
  const std::string output = compose({}, cfg_, nullptr, false).output;
  const std::string warnings =
      test_support::warning_line("edid_decode_encode", "encode_edid",
                                 "Requested too many short video descriptions. Truncating to the maximum allowed. "
                                 "Max:32 Requested:45") +
      test_support::warning_line("edid_decode_encode", "encode_edid",
                                 "Requested too many short audio descriptions. Truncating to the maximum allowed. "
                                 "Max:10 Requested:23");
  ASSERT_EQ(output.substr(0, warnings.size()), warnings);
  // Header 4, data blocks 154 - 4 + 4, detailed timing 18, serial number 18: 194 bytes.
  const char *const overflow = "edid_decode_encode:N:encode_edid\\(\\) ERROR: .*\\b194\\b.*\\b127\\b.*\n";
  EXPECT_TRUE(test_support::matches(output.substr(warnings.size()), overflow)) << output;
}

TEST_F(FullComposition, IsTracedAsIfEverythingFitted) {
  const std::string output = compose({}, cfg_, nullptr, true).output;
  // Sixteen descriptors of which fourteen have all three structures to tell, and two what is not mandatory.
  EXPECT_EQ(count_of(output, "] FP, "), 15);
  EXPECT_EQ(count_of(output, "] SBSH, "), 15);
  EXPECT_EQ(count_of(output, "] TBH, "), 15);
  EXPECT_NE(output.find(test_support::trace_line("encode_edid", "order[15] SBSH, f8, 00") +
                        test_support::trace_line("encode_edid", "order[15] TBH, f6")),
            std::string::npos);
  EXPECT_EQ(count_of(output, "Read 4k x 2k mode:"), 7 + 4);
  EXPECT_NE(
      output.find(test_support::trace_line("_populate_new_edid", "\tEncoding the VIC list up to 31 modes. Total:45")),
      std::string::npos);
}

TEST_F(FullComposition, CannotBeDecodedAgainWhichTheTraceTells) {
  const std::string output = compose({}, cfg_, nullptr, true).output;
  EXPECT_NE(output.find(test_support::error_line("edid_decode_encode", "decode_edid_extensions",
                                                 "EDID DTD offset value is larger than the block. Offset:158\n") +
                        test_support::warning_line("edid_composer", "compose_edid_internal",
                                                   "Failed decoding the new edid extension.")),
            std::string::npos);
}

TEST_F(FullComposition, WithoutItsExtrasFits) {
  // Without 3D, 31 modes and 10 audio formats fill 4 + 32 + 31 + 14 + 4 bytes after the header, and fit.
  cfg_.hdmi_3d_mode = 0;
  tree_.remove("60_hz_priority_list");
  for (int vic = 1; vic <= 31; ++vic)
    tree_.add("60_hz_priority_list", std::to_string(vic));
  tree_.remove("4k_x_2k_priority_list");
  tree_.set("monitor_serial", std::string(""));
  tree_.add_list("4k_x_2k_priority_list");
  const auto composition = compose({}, cfg_, nullptr, false);
  EXPECT_EQ(composition.output, test_support::warning_line(
                                    "edid_decode_encode", "encode_edid",
                                    "Requested too many short audio descriptions. Truncating to the maximum allowed. "
                                    "Max:10 Requested:23"));
  EXPECT_EQ(composition.bytes[128 + 8], 0x40 | 31);
  EXPECT_EQ(composition.bytes[130], 4 + 4 + 32 + 31 + 13 + 4);
}

}  // namespace
