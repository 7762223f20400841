// What modes and formats are called, and what is understood.
#include <gmock/gmock.h>

#include <set>

#include "edid_text/mode_names.h"
#include "explain/wanted.h"
#include "io/bad_input.h"

namespace edid_cli {
namespace {

using testing::ElementsAre;

std::vector<u32> codes(const char *text, compose_subject subject) {
  std::vector<u32> result;
  for (const wanted_t &wanted : parse_wanted(text)) {
    EXPECT_EQ(wanted.subject, subject) << text;
    result.push_back(wanted.code);
  }
  return result;
}

TEST(ModeNames, TellRasterAspectRatioAndVic) {
  EXPECT_EQ(video_mode_name(16), "1920x1080p60 16:9 (VIC 16)");
  EXPECT_EQ(video_mode_name(1), "640x480p60 4:3 (VIC 1)");
  EXPECT_EQ(video_mode_name(39), "1920x1080i50 16:9 (VIC 39)");
  EXPECT_EQ(video_mode_name(95), "3840x2160p30 16:9 (VIC 95)");
  EXPECT_EQ(video_mode_name(65), "1280x720p24 64:27 (VIC 65)");
  EXPECT_EQ(video_mode_name(219), "4096x2160p120 256:135 (VIC 219)");
  EXPECT_EQ(video_mode_name(128), "VIC 128");
  EXPECT_EQ(video_mode_name(0), "VIC 0");
  EXPECT_EQ(mode_4k_name(1), "3840x2160p30 (4k:1)");
  EXPECT_EQ(mode_4k_name(9), "4k:9");
}

TEST(ModeNames, AreDifferentForEachVic) {
  std::set<std::string> names;
  for (u32 vic = 0; vic <= 255; ++vic) {
    names.insert(video_mode_name(vic));
  }
  EXPECT_EQ(names.size(), 256U);
}

TEST(ModeNames, ReadBytesFrom193OnAsVicsOfTheirOwn) {
  EXPECT_EQ(vic_of({.native = 1, .vic = 16, .stereo = 0}), 16U);
  EXPECT_EQ(vic_of({.native = 0, .vic = 97, .stereo = 0}), 97U);
  EXPECT_EQ(vic_of({.native = 1, .vic = 65, .stereo = 0}), 193U);
  EXPECT_EQ(vic_of({.native = 1, .vic = 91, .stereo = 0}), 219U);
  EXPECT_EQ(vic_of({.native = 1, .vic = 98, .stereo = 0}), 98U);
}

TEST(ModeNames, HaveTheHdmiVicOfTheSameMode) {
  for (u32 hdmi_vic = 1; hdmi_vic <= last_hdmi_vic; ++hdmi_vic) {
    u32 vic = 65;
    while (hdmi_vic_of_vic(vic) != hdmi_vic) {
      ASSERT_LT(++vic, 128U);
    }
    EXPECT_EQ(short_mode_name(vic) + "Hz", hdmi_vic_string(hdmi_vic));
  }
  EXPECT_EQ(hdmi_vic_of_vic(97), 0U);
}

TEST(Wanted, MayBeWhatHdmi2AddedBesidesModes) {
  EXPECT_THAT(codes("HDR10", COMPOSE_SUBJECT_HDR), ElementsAre(HDMI2_EOTF_PQ));
  EXPECT_THAT(codes("hlg", COMPOSE_SUBJECT_HDR), ElementsAre(HDMI2_EOTF_HLG));
  EXPECT_THAT(codes("4:2:0", COMPOSE_SUBJECT_YCBCR_420), ElementsAre(1));
  EXPECT_THAT(codes("dolby-vision", COMPOSE_SUBJECT_PASSED_BLOCK), ElementsAre(COMPOSE_ROOM_DOLBY_VISION));
  EXPECT_EQ(wanted_name({COMPOSE_SUBJECT_VRR, 1}), "Variable refresh rate");
}

TEST(Wanted, MayBeAVic) {
  EXPECT_THAT(codes("16", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(16));
  EXPECT_THAT(codes("64", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(64));
  EXPECT_THAT(codes("vic 16", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(16));
  EXPECT_THAT(codes("VIC97", COMPOSE_SUBJECT_EXTENDED_MODE), ElementsAre(97));
  EXPECT_THAT(codes("219", COMPOSE_SUBJECT_EXTENDED_MODE), ElementsAre(219));
}

TEST(Wanted, OfAVicThatHdmi14HasAnotherNumberForIsThatMode) {
  EXPECT_THAT(codes("vic 95", COMPOSE_SUBJECT_4K_MODE), ElementsAre(1));
  EXPECT_THAT(codes("98", COMPOSE_SUBJECT_4K_MODE), ElementsAre(4));
}

TEST(Wanted, MayBeAModeOfOneOrSeveralVics) {
  EXPECT_THAT(codes("1920x1080p60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(16));
  EXPECT_THAT(codes("720x480p60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(2, 3));
  EXPECT_THAT(codes("720x480i60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(6, 7));
  EXPECT_THAT(codes("1440x480i60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(6, 7));
  EXPECT_THAT(codes("1920x1080i50", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(20, 39));
}

TEST(Wanted, MayBeCalledByItsLinesAndRate) {
  EXPECT_THAT(codes("1080p60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(16));
  EXPECT_THAT(codes("1080P120", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(63));
  EXPECT_THAT(codes("720p60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(4));
  EXPECT_THAT(codes("576i50", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(21, 22));
  EXPECT_THAT(codes("2160p60", COMPOSE_SUBJECT_EXTENDED_MODE), ElementsAre(97));
  EXPECT_THAT(codes("8k60", COMPOSE_SUBJECT_EXTENDED_MODE), ElementsAre(199));
  for (const char *rate : {"1080p59.94", "1080p59", "1080p60"}) {
    EXPECT_THAT(codes(rate, COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(16)) << rate;
  }
}

TEST(Wanted, MayBeA4kMode) {
  EXPECT_THAT(codes("4k:4", COMPOSE_SUBJECT_4K_MODE), ElementsAre(4));
  EXPECT_THAT(codes("3840x2160p25", COMPOSE_SUBJECT_4K_MODE), ElementsAre(2));
  EXPECT_THAT(codes("4k30", COMPOSE_SUBJECT_4K_MODE), ElementsAre(1));
  EXPECT_THAT(codes("2160p24", COMPOSE_SUBJECT_4K_MODE), ElementsAre(3));
  EXPECT_THAT(codes("4kp25", COMPOSE_SUBJECT_4K_MODE), ElementsAre(2));
}

TEST(Wanted, MayBeAnAudioFormat) {
  EXPECT_THAT(codes("audio:18", COMPOSE_SUBJECT_AUDIO_FORMAT), ElementsAre(18));
  EXPECT_THAT(codes("AC3", COMPOSE_SUBJECT_AUDIO_FORMAT), ElementsAre(2));
  EXPECT_THAT(codes("TrueHD", COMPOSE_SUBJECT_AUDIO_FORMAT), ElementsAre(12));
  EXPECT_THAT(codes("ddp", COMPOSE_SUBJECT_AUDIO_FORMAT), ElementsAre(10));
  EXPECT_THAT(codes("dtshd", COMPOSE_SUBJECT_AUDIO_FORMAT), ElementsAre(11));
  EXPECT_THAT(codes("mp3", COMPOSE_SUBJECT_AUDIO_FORMAT), ElementsAre(4));
}

TEST(Wanted, MayNameTheChannelsOfAFormat) {
  for (const char *text : {"pcm8", "PCM 8", "pcm7.1"}) {
    const std::vector<wanted_t> wanted = parse_wanted(text);
    ASSERT_EQ(wanted.size(), 1U);
    EXPECT_EQ(wanted[0].code, 1U);
    EXPECT_EQ(wanted[0].channels, 8U);
    EXPECT_EQ(wanted_name(wanted[0]), "PCM with 8 channels (audio:1)");
  }
  EXPECT_EQ(parse_wanted("pcm")[0].channels, 0U);
}

TEST(Wanted, MayBeDeepColourAnd3d) {
  EXPECT_THAT(codes("deep-color", COMPOSE_SUBJECT_DEEP_COLOR), ElementsAre(36));
  EXPECT_THAT(codes("30bit", COMPOSE_SUBJECT_DEEP_COLOR), ElementsAre(30));
  EXPECT_THAT(codes("3D", COMPOSE_SUBJECT_3D), ElementsAre(1));
}

TEST(Wanted, MayBeNothingElse) {
  for (const char *text : {"",
                           "0",
                           "128",
                           "192",
                           "220",
                           "vic",
                           "vic 0",
                           "-1",
                           "4k:0",
                           "4k:5",
                           "4k:1x",
                           "4k",
                           "4k61",
                           "audio:15",
                           "audio:19",
                           "Unknown Value",
                           "1920x1080p60Hz16x9",
                           "1920x1080",
                           "0x1080p60",
                           "1080p61",
                           "999p60",
                           "AUDIO_TYPE_INVALID",
                           "pcm9",
                           "pcm0",
                           "5.1",
                           "deep"}) {
    EXPECT_THROW(parse_wanted(text), bad_input_t) << text;
  }
}

}  // namespace
}  // namespace edid_cli
