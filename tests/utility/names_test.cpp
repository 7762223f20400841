// The names of codes and single bits.
#include <gtest/gtest.h>

#include <cstring>
#include <map>

#include "edid_composer.h"
#include "utility/vic_expectations.h"

namespace utility_tests {
namespace {

TEST(StdAspectString, NamesTheFourRatios) {
  EXPECT_STREQ(std_aspect_string(0), "1:1");
  EXPECT_STREQ(std_aspect_string(1), "4:3");
  EXPECT_STREQ(std_aspect_string(2), "5:4");
  EXPECT_STREQ(std_aspect_string(3), "16:9");
  EXPECT_STREQ(std_aspect_string(4), "InvalidRatio");
  EXPECT_STREQ(std_aspect_string(0xFFFFFFFF), "InvalidRatio");
}

TEST(ShortAudioString, NamesEveryType) {
  const char *const names[] = {"AUDIO_TYPE_INVALID",
                               "PCM",
                               "AC3",
                               "MPEG1",
                               "MP3",
                               "MPEG2",
                               "AAC",
                               "DTS",
                               "ATRAC",
                               "DSD",
                               "EAC3/DD+",
                               "DTS HD",
                               "MLP/TrueHD",
                               "DST",
                               "WMA pro",
                               "AUDIO_TYPE_EXTENSION",
                               "HE AAC",
                               "HE AACv2",
                               "MPEG SURROUND"};
  ASSERT_EQ(std::size(names), 19u);
  for (u32 type = 0; type < std::size(names); ++type)
    EXPECT_STREQ(short_audio_string(type), names[type]);
  EXPECT_STREQ(short_audio_string(19), "AUDIO_TYPE_UNKNOWN");
  EXPECT_STREQ(short_audio_string(0xFFFFFFFF), "AUDIO_TYPE_UNKNOWN");
}

TEST(HdmiVicString, NamesTheFour4Kx2KFormats) {
  EXPECT_STREQ(hdmi_vic_string(0), "Unknown Value");
  EXPECT_STREQ(hdmi_vic_string(1), "3840x2160p30Hz");
  EXPECT_STREQ(hdmi_vic_string(2), "3840x2160p25Hz");
  EXPECT_STREQ(hdmi_vic_string(3), "3840x2160p24Hz");
  EXPECT_STREQ(hdmi_vic_string(4), "4096x2160p24Hz");
  EXPECT_STREQ(hdmi_vic_string(5), "Unknown Value");
  EXPECT_STREQ(hdmi_vic_string(0xFFFFFFFF), "Unknown Value");
}

/// Expects a name for each value of @p names and "Unknown Value" for every other value.
void expect_bit_names(const char *(*name_of)(u32), const std::map<u32, const char *> &names) {
  for (u32 value = 0; value < 1024; ++value) {
    SCOPED_TRACE(value);
    const auto named = names.find(value);
    EXPECT_STREQ(name_of(value), named == names.end() ? "Unknown Value" : named->second);
  }
  EXPECT_STREQ(name_of(0x80000000), "Unknown Value");
  EXPECT_STREQ(name_of(0xFFFFFFFF), "Unknown Value");
}

TEST(EstTiming1String, NamesSingleBitsOnly) {
  expect_bit_names(est_timing_1_string, {{128, "720x400p70"},
                                         {64, "720x400p88"},
                                         {32, "640x480p60"},
                                         {16, "640x480p67"},
                                         {8, "640x480p72"},
                                         {4, "640x480p75"},
                                         {2, "800x600p56"},
                                         {1, "800x600p60"}});
}

TEST(EstTiming2String, NamesSingleBitsOnly) {
  expect_bit_names(est_timing_2_string, {{128, "800x600p72"},
                                         {64, "800x600p75"},
                                         {32, "832x624p75"},
                                         {16, "1024x768p87"},
                                         {8, "1024x768p60"},
                                         {4, "1024x768p70"},
                                         {2, "1024x768p75"},
                                         {1, "1280x1024p75"}});
}

TEST(ManTimingString, NamesItsOneBit) {
  expect_bit_names(man_timing_string, {{128, "1152x870p75"}});
}

TEST(ShortVideoTimingString, NamesEveryVic) {
  for (u32 vic = 1; vic <= 64; ++vic)
    EXPECT_STREQ(short_video_timing_string(vic), expected_vic_names[vic - 1]);
  EXPECT_STREQ(short_video_timing_string(39), "1920x10801250i50Hz16x9");
}

TEST(ShortVideoTimingString, HasNoNameForOtherVics) {
  for (const u32 vic : {0u, 65u, 127u, 0xFFFFFFFFu})
    EXPECT_STREQ(short_video_timing_string(vic), "Unknown Value");
}

TEST(StereoTables, MapStructureAllBitsToTheMask) {
  const u32 expected[16] = {1, 8, 16, 32, 64, 128, 4, 0, 2, 0, 0, 0, 0, 0, 0, 2};
  for (u32 bit = 0; bit < 16; ++bit)
    EXPECT_EQ(_3d_struct_all_array[bit], expected[bit]) << bit;
}

TEST(StereoTables, ListTheMandatoryFormatsInOrder) {
  struct row_t {
    u32 vic;
    u32 stereo;
  };
  const row_t expected[5] = {{32, 5}, {4, 5}, {5, 2}, {19, 5}, {20, 2}};
  for (u32 row = 0; row < 5; ++row) {
    EXPECT_EQ(_3d_man_modes[row].native, 0) << row;
    EXPECT_EQ(_3d_man_modes[row].vic, expected[row].vic) << row;
    EXPECT_EQ(_3d_man_modes[row].stereo, expected[row].stereo) << row;
    u32 first_word = 0;
    std::memcpy(&first_word, &_3d_man_modes[row], sizeof(first_word));
    EXPECT_EQ(first_word, 0u) << "the whole first word is 0";
  }
}

}  // namespace
}  // namespace utility_tests
