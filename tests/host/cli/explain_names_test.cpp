// What modes and formats are called, and what is understood.
#include <gmock/gmock.h>

#include <set>

#include "explain/answer.h"
#include "edid_text/mode_names.h"
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
  EXPECT_EQ(video_mode_name(95), "VIC 95");
  EXPECT_EQ(video_mode_name(0), "VIC 0");
  EXPECT_EQ(mode_4k_name(1), "3840x2160p30 (4k:1)");
  EXPECT_EQ(mode_4k_name(9), "4k:9");
}

TEST(ModeNames, AreDifferentForEachVic) {
  std::set<std::string> names;
  for (u32 vic = 0; vic <= 127; ++vic) {
    names.insert(video_mode_name(vic));
  }
  EXPECT_EQ(names.size(), 128U);
}

TEST(Wanted, MayBeAVic) {
  EXPECT_THAT(codes("16", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(16));
  EXPECT_THAT(codes("64", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(64));
}

TEST(Wanted, MayBeAModeOfOneOrSeveralVics) {
  EXPECT_THAT(codes("1920x1080p60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(16));
  EXPECT_THAT(codes("720x480p60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(2, 3));
  EXPECT_THAT(codes("720x480i60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(6, 7));
  EXPECT_THAT(codes("1440x480i60", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(6, 7));
  EXPECT_THAT(codes("1920x1080i50", COMPOSE_SUBJECT_VIDEO_MODE), ElementsAre(20, 39));
}

TEST(Wanted, MayBeA4kMode) {
  EXPECT_THAT(codes("4k:4", COMPOSE_SUBJECT_4K_MODE), ElementsAre(4));
  EXPECT_THAT(codes("3840x2160p25", COMPOSE_SUBJECT_4K_MODE), ElementsAre(2));
}

TEST(Wanted, MayBeAnAudioFormat) {
  EXPECT_THAT(codes("audio:18", COMPOSE_SUBJECT_AUDIO_FORMAT), ElementsAre(18));
  EXPECT_THAT(codes("AC3", COMPOSE_SUBJECT_AUDIO_FORMAT), ElementsAre(2));
  EXPECT_THAT(codes("TrueHD", COMPOSE_SUBJECT_AUDIO_FORMAT), ElementsAre(12));
}

TEST(Wanted, MayBeNothingElse) {
  for (const char *text : {"", "0", "65", "-1", "4k:0", "4k:5", "4k:1x", "audio:15", "audio:19", "Unknown Value",
                           "1920x1080p60Hz16x9", "1920x1080", "AUDIO_TYPE_INVALID", " 16"}) {
    EXPECT_THROW(parse_wanted(text), bad_input_t) << text;
  }
}

}  // namespace
}  // namespace edid_cli
