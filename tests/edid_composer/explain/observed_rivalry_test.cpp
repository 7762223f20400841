// What is told where more than one reason could be.
#include <gtest/gtest.h>

#include "edid_composer/explain/observed_composition.h"

namespace observed {
namespace {

using words_t = std::vector<std::string>;

class ObservedRivalry : public testing::Test {
 protected:
  void observe_it() {
    observed_ = observe(situation_);
    ASSERT_TRUE(observed_.result);
  }
  words_t about_mode(u32 vic) const { return words_about(COMPOSE_SUBJECT_VIDEO_MODE, vic, observed_); }
  words_t about(compose_subject subject) const { return words_about(subject, observed_); }
  void offer(const std::vector<u32> &vics) {
    situation_.platform.video_60_priority = situation_.platform.video_60_additional = modes(vics);
  }
  void put_out(const video_mode_t &mode) {
    situation_.platform.current_mode_set_to_priority = 1;
    situation_.settings.hdmi_current_mode = mode;
  }

  situation_t situation_;
  composition_t observed_;
};

told_t mode(u32 vic, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_VIDEO_MODE, vic, verdict, reason};
}

told_t format(u32 type, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_AUDIO_FORMAT, type, verdict, reason};
}

TEST_F(ObservedRivalry, GeometryComesBeforeThePriorityList) {
  situation_.platform.geometry_limit = 1;
  situation_.platform.video_60_additional = modes({4, 2, 1, 31});
  situation_.sink.timings = {test_support::timing_of_vic(16)};
  situation_.sink.video = {4};
  observe_it();
  // In the priority list, or in none.
  EXPECT_EQ(about_mode(16), words_of({mode(16, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_TALLER_THAN_SINK)
                                          .named_by(COMPOSE_ORIGIN_DETAILED_TIMING | COMPOSE_ORIGIN_PRIORITY_LIST)
                                          .in_sink_at(0)
                                          .in_priority_list_at(0)
                                          .values({1080, 720})}));
  EXPECT_EQ(about_mode(31), words_of({mode(31, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_TALLER_THAN_SINK)
                                          .named_by(COMPOSE_ORIGIN_ADDITION_LIST)
                                          .in_addition_list_at(3)
                                          .values({1080, 720})}));
}

TEST_F(ObservedRivalry, GeometryDoesNotLookAtModesThatNobodyHas) {
  situation_.platform.geometry_limit = 1;
  situation_.platform.video_60_priority = modes({4, 2, 1, 31});
  situation_.platform.video_50_additional = modes({20});
  situation_.sink.video = {4};
  observe_it();
  EXPECT_EQ(about_mode(31), words_of({mode(31, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_AVAILABLE)
                                          .named_by(COMPOSE_ORIGIN_PRIORITY_LIST)
                                          .in_priority_list_at(3)}));
  EXPECT_EQ(about_mode(20), words_of({mode(20, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_OTHER_REFRESH_FAMILY)
                                          .named_by(COMPOSE_ORIGIN_OTHER_ADDITION_LIST)
                                          .in_addition_list_at(0)
                                          .values({60})}));
}

TEST_F(ObservedRivalry, CurrentModeThatIsOfferedAnywayKeepsItsReasonAndComesFirst) {
  put_out({1280, 720, 0, 60});
  observe_it();
  EXPECT_EQ(about_mode(4), words_of({mode(4, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_ADDS_IT)
                                         .named_by(both_lists | COMPOSE_ORIGIN_CURRENT_MODE)
                                         .in_priority_list_at(1)
                                         .in_addition_list_at(1)
                                         .at(0)}));
  EXPECT_EQ(about_mode(16), words_of({mode(16, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_ADDS_IT)
                                          .named_by(both_lists)
                                          .in_priority_list_at(0)
                                          .in_addition_list_at(0)
                                          .at(1)}));
}

TEST_F(ObservedRivalry, CurrentModeIsOfferedAlthoughItIsTallerThanTheSink) {
  situation_.platform.geometry_limit = 1;
  situation_.sink.video = {4, 3};
  put_out({1920, 1080, 0, 60});
  observe_it();
  EXPECT_EQ(about_mode(16), words_of({mode(16, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_IS_CURRENT_MODE)
                                          .named_by(both_lists | COMPOSE_ORIGIN_CURRENT_MODE)
                                          .in_priority_list_at(0)
                                          .in_addition_list_at(0)
                                          .at(0)}));
}

TEST_F(ObservedRivalry, CurrentModeIsOfferedAlthoughOnlyTheOtherFamilyNamesIt) {
  situation_.platform.video_50_priority = modes({31, 19});
  put_out({1280, 720, 0, 50});
  observe_it();
  EXPECT_EQ(about_mode(19), words_of({mode(19, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_IS_CURRENT_MODE)
                                          .named_by(COMPOSE_ORIGIN_OTHER_PRIORITY_LIST | COMPOSE_ORIGIN_CURRENT_MODE)
                                          .in_priority_list_at(1)
                                          .at(0)}));
}

TEST_F(ObservedRivalry, PaddingOffersVic1AlthoughItWasLeftOut) {
  offer({16, 4});
  situation_.sink.video = {1};
  observe_it();
  EXPECT_EQ(about_mode(1), words_of({mode(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PADS_THE_LIST)
                                         .named_by(COMPOSE_ORIGIN_SHORT_VIDEO | COMPOSE_ORIGIN_LIBRARY)
                                         .in_sink_at(0)
                                         .at(2)}));
}

TEST_F(ObservedRivalry, PaddingForgetsTheNumbersOfTheReasonBefore) {
  situation_.platform.geometry_limit = 1;  // No short video descriptors: no mode is low enough.
  situation_.sink.timings = {test_support::timing_of_vic(16)};
  observe_it();
  EXPECT_EQ(about_mode(1), words_of({mode(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PADS_THE_LIST)
                                         .named_by(both_lists | COMPOSE_ORIGIN_LIBRARY)
                                         .in_priority_list_at(3)
                                         .in_addition_list_at(3)
                                         .at(0)}));
  EXPECT_EQ(
      about(COMPOSE_SUBJECT_PADDING),
      words_of(
          {told_t(COMPOSE_SUBJECT_PADDING, 4, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_TOO_FEW_MODES).values({0, 4})}));
}

TEST_F(ObservedRivalry, PaddingWithAVic1ThatIsOfferedKeepsItsReason) {
  offer({1, 16});
  observe_it();
  EXPECT_EQ(about_mode(1), words_of({mode(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_ADDS_IT)
                                         .named_by(both_lists | COMPOSE_ORIGIN_LIBRARY)
                                         .in_priority_list_at(0)
                                         .in_addition_list_at(0)
                                         .at(0)}));
}

TEST_F(ObservedRivalry, ModeThatIsNamedTwiceHasOneRecordWithTheFirstPlaces) {
  offer({16, 4, 16, 4, 2});
  situation_.sink.timings = {test_support::timing_of_vic(2), test_support::timing_of_vic(4)};
  situation_.sink.video = {4, 34, 4};
  observe_it();
  EXPECT_EQ(about_mode(4), words_of({mode(4, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_HAS_IT)
                                         .named_by(COMPOSE_ORIGIN_DETAILED_TIMING | sink_and_both_lists)
                                         .in_sink_at(1)
                                         .in_priority_list_at(1)
                                         .in_addition_list_at(1)
                                         .at(1)}));
  // 16, 4, 16 and 4 stand in front of it.
  EXPECT_EQ(about_mode(2), words_of({mode(2, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_HAS_IT)
                                         .named_by(COMPOSE_ORIGIN_DETAILED_TIMING | both_lists)
                                         .in_sink_at(0)
                                         .in_priority_list_at(4)
                                         .in_addition_list_at(4)
                                         .at(4)}));
}

TEST_F(ObservedRivalry, ListsOfTheFamilyInUseTellThePlaces) {
  situation_.platform.video_50_priority = modes({31, 19, 16});
  situation_.platform.video_50_additional = modes({31, 4, 3});
  situation_.platform.video_60_priority = modes({16, 4, 2, 1, 3});
  observe_it();
  EXPECT_EQ(about_mode(16), words_of({mode(16, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_ADDS_IT)
                                          .named_by(both_lists | COMPOSE_ORIGIN_OTHER_PRIORITY_LIST)
                                          .in_priority_list_at(0)
                                          .in_addition_list_at(0)
                                          .at(0)}));
  // Its priority list is the one in use, its addition list the other.
  EXPECT_EQ(about_mode(3), words_of({mode(3, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_AVAILABLE)
                                         .named_by(COMPOSE_ORIGIN_PRIORITY_LIST | COMPOSE_ORIGIN_OTHER_ADDITION_LIST)
                                         .in_priority_list_at(4)
                                         .in_addition_list_at(2)}));
}

TEST_F(ObservedRivalry, OtherFamilyIsTheOneOf60HzOnA50HzSink) {
  situation_.sink.timings = {test_support::timing_of_vic(19)};
  situation_.platform.video_50_priority = modes({31, 19, 20, 17});
  situation_.platform.video_50_additional = modes({31, 20, 17});
  observe_it();
  EXPECT_EQ(about_mode(16),
            words_of({mode(16, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_OTHER_REFRESH_FAMILY)
                          .named_by(COMPOSE_ORIGIN_OTHER_PRIORITY_LIST | COMPOSE_ORIGIN_OTHER_ADDITION_LIST)
                          .in_priority_list_at(0)
                          .in_addition_list_at(0)
                          .values({50})}));
}

TEST_F(ObservedRivalry, MaskComesBehindTheSinksFilter) {
  situation_.settings.audio_sink_filter = 1;
  situation_.settings.audio_mask = 0x241;
  situation_.platform.audio = {pcm_2, 0x500717, dts_6, eac3_6};
  situation_.sink.audio =
      test_support::join(test_support::join(descriptor(pcm_2), descriptor(0x500615)), descriptor(dts_6));
  observe_it();
  const auto of_platform = [](i32 index, told_t told) {
    return told.named_by(COMPOSE_ORIGIN_PLATFORM_AUDIO).in_priority_list_at(index);
  };
  const auto of_sink = [](i32 index, u32 type) {
    return format(type, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_PLATFORM_FORMATS_ONLY)
        .named_by(COMPOSE_ORIGIN_SINK_AUDIO)
        .in_sink_at(index);
  };
  EXPECT_EQ(
      about(COMPOSE_SUBJECT_AUDIO_FORMAT),
      words_of({of_platform(0, format(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_FORMAT)).at(0).values({2}),
                // Narrowed, and masked then: by what of the caller's mask the sink has.
                of_platform(1, format(2, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_AUDIO_MASK)).values({0x41, 0x02}),
                of_platform(2, format(7, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_FORMAT)).at(1).values({6}),
                of_platform(3, format(10, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_IN_SINK)).values({6}),
                of_sink(0, 1), of_sink(1, 2), of_sink(2, 7)}));
}

TEST_F(ObservedRivalry, BasicAudioStandsInFrontOfWhatTheMaskLeaves) {
  situation_.settings.audio_mask = 0x02;
  situation_.platform.audio = {dts_6, pcm_2, ac3_6};
  observe_it();
  const auto of_platform = [](i32 index, told_t told) {
    return told.named_by(COMPOSE_ORIGIN_PLATFORM_AUDIO).in_priority_list_at(index);
  };
  EXPECT_EQ(
      about(COMPOSE_SUBJECT_AUDIO_FORMAT),
      words_of({format(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_BASIC_AUDIO)
                    .named_by(COMPOSE_ORIGIN_LIBRARY)
                    .at(0)
                    .values({2}),
                // The first format is never masked.
                of_platform(0, format(7, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_FORMAT)).at(1).values({6}),
                of_platform(1, format(1, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_AUDIO_MASK)).values({0x02, 0x01}),
                of_platform(2, format(2, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_FORMAT)).at(2).values({6})}));
}

TEST_F(ObservedRivalry, FormatsWithTheSameTypeHaveARecordEach) {
  situation_.platform.audio_pass_through = 2;
  situation_.platform.audio = {pcm_8};
  situation_.sink.audio =
      test_support::join(test_support::join(descriptor(pcm_8), descriptor(pcm_2)), descriptor(pcm_8));
  observe_it();
  const auto of_sink = [](i32 index, i32 channels) {
    return format(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_FORMAT)
        .named_by(COMPOSE_ORIGIN_SINK_AUDIO)
        .in_sink_at(index)
        .at(index)
        .values({channels});
  };
  EXPECT_EQ(about(COMPOSE_SUBJECT_AUDIO_FORMAT),
            words_of({format(1, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_SINK_FORMATS_ONLY)
                          .named_by(COMPOSE_ORIGIN_PLATFORM_AUDIO)
                          .in_priority_list_at(0)
                          .values({2}),
                      of_sink(0, 8), of_sink(1, 2), of_sink(2, 8)}));
}

TEST_F(ObservedRivalry, BasicAudioTakesTheRoomOfTheTenthFormat) {
  for (i32 type = 2; type <= 11; ++type)
    situation_.platform.audio.push_back(0x700 | type << 3 | 5);
  observe_it();
  const words_t told = about(COMPOSE_SUBJECT_AUDIO_FORMAT);
  EXPECT_EQ(told.size(), 11U);
  EXPECT_EQ(words_about(COMPOSE_SUBJECT_AUDIO_FORMAT, 10, observed_),
            words_of({format(10, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_FORMAT)
                          .named_by(COMPOSE_ORIGIN_PLATFORM_AUDIO)
                          .in_priority_list_at(8)
                          .at(9)
                          .values({6})}));
  EXPECT_EQ(words_about(COMPOSE_SUBJECT_AUDIO_FORMAT, 11, observed_),
            words_of({format(11, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NO_ROOM)
                          .named_by(COMPOSE_ORIGIN_PLATFORM_AUDIO)
                          .in_priority_list_at(9)
                          .values({10})}));
}

TEST_F(ObservedRivalry, RoomThatIsMissedByTheDetailedTimingsLeavesNoModeOut) {
  std::vector<u32> vics;
  for (u32 vic = 1; vic <= 31; ++vic)
    vics.push_back(vic);
  offer(vics);
  for (i32 type = 1; type <= 10; ++type)
    situation_.platform.audio.push_back(0x700 | type << 3 | 1);
  situation_.platform.modes_4k_x_2k_priority = situation_.platform.modes_4k_x_2k_addition = {1, 2, 3, 4, 1, 2, 3};
  situation_.settings.edid_latency[2] = 20;
  situation_.platform.monitor_serial = "0001";
  observe_it();
  i32 offered = 0;
  for (const auto &decision : observed_.decisions) {
    EXPECT_NE(decision.reason, COMPOSE_REASON_NO_ROOM) << words_of(decision);
    if (decision.position >= 0) ++offered;
  }
  EXPECT_EQ(offered, 31 + 10 + 4);
}

TEST_F(ObservedRivalry, ThirtyThreeModesHaveNoRoomAtAll) {
  std::vector<u32> vics;
  for (u32 vic = 1; vic <= 33; ++vic)
    vics.push_back(vic);
  offer(vics);
  observe_it();
  // 32 of them are written, after a length of 0. A source reads them as other blocks, and none as a mode.
  EXPECT_EQ(about_mode(33), words_of({mode(33, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NO_ROOM)
                                          .named_by(both_lists)
                                          .in_priority_list_at(32)
                                          .in_addition_list_at(32)}));
  EXPECT_EQ(about_mode(16), words_of({mode(16, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NO_ROOM)
                                          .named_by(both_lists)
                                          .in_priority_list_at(15)
                                          .in_addition_list_at(15)}));
}

}  // namespace
}  // namespace observed
