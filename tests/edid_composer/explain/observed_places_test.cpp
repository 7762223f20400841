// What the places in a record count.
#include <gtest/gtest.h>

#include "edid_composer/explain/observed_composition.h"

namespace observed {
namespace {

told_t format(u32 type, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_AUDIO_FORMAT, type, verdict, reason};
}

told_t of_platform(i32 index, told_t told) {
  return told.named_by(COMPOSE_ORIGIN_PLATFORM_AUDIO).in_priority_list_at(index);
}

// Basic audio is put in front of the formats when all of them are chosen.
TEST(ObservedPlaces, OfACoverIsAmongTheFormatsChosenSoFar) {
  situation_t situation;
  situation.platform.audio = {ac3_6, dts_6, dts_6};
  EXPECT_EQ(
      words_about(COMPOSE_SUBJECT_AUDIO_FORMAT, 7, observe(situation)),
      words_of({of_platform(1, format(7, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_FORMAT)).at(2).values({6}),
                of_platform(2, format(7, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_DUPLICATE)).values({6, 1})}));
}

TEST(ObservedPlaces, InTheSinkAreAmongTheDescriptorsThatCouldBeDecoded) {
  situation_t situation;
  situation.platform.audio_pass_through = 2;
  situation.sink.audio =
      test_support::join(test_support::join(descriptor(pcm_2), {0x00, 0x07, 0x00}), descriptor(ac3_6));
  EXPECT_EQ(words_about(COMPOSE_SUBJECT_AUDIO_FORMAT, 2, observe(situation)),
            words_of({format(2, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_FORMAT)
                          .named_by(COMPOSE_ORIGIN_SINK_AUDIO)
                          .in_sink_at(1)
                          .at(1)
                          .values({6})}));
}

// From a tree, a VIC above 64 is skipped.
TEST(ObservedPlaces, InAListAreAmongTheEntriesThatWereNotSkipped) {
  situation_t situation;
  situation.platform.video_60_priority = modes({16, 99, 4, 2, 1});
  situation.platform.video_60_additional = modes({99, 16, 99, 4, 2, 1});
  EXPECT_EQ(words_about(COMPOSE_SUBJECT_VIDEO_MODE, 4, observe_tree(situation)),
            words_of({told_t(COMPOSE_SUBJECT_VIDEO_MODE, 4, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_ADDS_IT)
                          .named_by(both_lists)
                          .in_priority_list_at(1)
                          .in_addition_list_at(1)
                          .at(1)}));
}

// An entry that can't be decoded is a candidate as well: it is not skipped.
TEST(ObservedPlaces, InThePlatformsFormatsCountThoseThatAreNone) {
  situation_t situation;
  situation.platform.audio = {pcm_2, 0x070700, ac3_6};
  EXPECT_EQ(
      words_about(COMPOSE_SUBJECT_AUDIO_FORMAT, 2, observe(situation)),
      words_of({of_platform(2, format(2, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_FORMAT)).at(1).values({6})}));
}

}  // namespace
}  // namespace observed
