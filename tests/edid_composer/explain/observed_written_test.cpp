// What is told is what the bytes hold, where that is not what was asked for.
#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <optional>

#include "edid_composer/explain/observed_composition.h"
#include "support/list_contents.h"
#include "support/output_capture.h"

namespace observed {
namespace {

class ObservedBytes : public testing::Test {
 protected:
  void observe_it() {
    observed_ = observe(situation_);
    ASSERT_TRUE(observed_.result);
    edid_.emplace();
    test_support::output_of([&] {
      EXPECT_EQ(decode_edid_block_0(observed_.bytes.data(), edid_->get()), 1);
      EXPECT_EQ(decode_edid_extensions(observed_.bytes.data() + 128, 128, edid_->get()), 1);
    });
  }

  const compose_decision_t &told_of(compose_subject subject, u32 code) const {
    const auto &all = observed_.decisions;
    const auto told = std::find_if(all.begin(), all.end(), [=](const auto &decision) {
      return decision.subject == subject && decision.code == code;
    });
    static constexpr compose_decision_t nothing{};
    EXPECT_NE(told, all.end());
    return told == all.end() ? nothing : *told;
  }

  /// The byte of the HDMI block that says which latencies are declared.
  u8 latency_flags() const {
    constexpr u8 hdmi_oui[] = {0x03, 0x0C, 0x00};
    const auto block =
        std::search(observed_.bytes.begin() + 128, observed_.bytes.end(), std::begin(hdmi_oui), std::end(hdmi_oui));
    EXPECT_LT(block + 7, observed_.bytes.end());
    return block[7];
  }

  void expect_latencies_as_told();

  situation_t situation_;
  composition_t observed_;
  std::optional<test_support::scoped_edid_t> edid_;  ///< The new EDID as it is decoded.
};

TEST_F(ObservedBytes, HoldTheClockThatIsTold) {
  for (const i32 asked_for : {25, 26, 27, 28, 29, 30, 299, 1270, 1274, 1275}) {
    situation_.platform.tmds_override = asked_for;
    observe_it();
    const auto verdict = asked_for % 5 == 0 ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_CHANGED;
    EXPECT_EQ(told_of(COMPOSE_SUBJECT_TMDS_CLOCK, edid_->get()->max_tmds_clock).verdict, verdict) << asked_for;
  }
}

/// In bytes of latencies as in records of them: those that are declared, and no others.
void ObservedBytes::expect_latencies_as_told() {
  const edid_t *const edid = edid_->get();
  constexpr u16 edid_t::*latencies[] = {&edid_t::video_latency, &edid_t::audio_latency, &edid_t::i_video_latency,
                                        &edid_t::i_audio_latency};
  constexpr i32 not_valid = 508;  // As it is decoded.
  for (u32 which = 0; which < std::size(latencies); ++which) {
    const compose_decision_t &told = told_of(COMPOSE_SUBJECT_LATENCY, which);
    SCOPED_TRACE(words_of(told));
    const u8 present = which < 2 ? 0x80 : 0x40;
    EXPECT_EQ(told.verdict != COMPOSE_VERDICT_LEFT_OUT, (latency_flags() & present) != 0);
    if (told.verdict == COMPOSE_VERDICT_LEFT_OUT) continue;
    const i32 declared = edid->*latencies[which];
    if (told.reason == COMPOSE_REASON_LATENCY_TOO_LONG) {
      EXPECT_EQ(declared, not_valid);
      EXPECT_EQ(told.verdict, COMPOSE_VERDICT_CHANGED);
    } else {
      EXPECT_EQ(declared, told.value[2]);
      const bool as_asked_for = declared == told.value[0] + told.value[1];
      EXPECT_EQ(told.verdict, as_asked_for ? COMPOSE_VERDICT_OFFERED : COMPOSE_VERDICT_CHANGED);
      EXPECT_EQ(told.reason == COMPOSE_REASON_LATENCY_NONE, told.value[0] + told.value[1] == 0);
    }
  }
}

TEST_F(ObservedBytes, HoldTheLatenciesThatAreTold) {
  constexpr u32 ms[] = {0, 1, 20, 21, 501};
  for (const auto &sink_hdmi : {bytes_t{}, bytes_t{0x10, 0x00, 0, 0, 0xC0, 241, 2, 1, 0}}) {
    situation_.sink.hdmi = sink_hdmi;
    for (u32 combination = 0; combination < 5 * 5 * 5 * 5; ++combination) {
      u32 rest = combination;
      for (u32 &own_ms : situation_.settings.edid_latency) {
        own_ms = ms[rest % 5];
        rest /= 5;
      }
      observe_it();
      expect_latencies_as_told();
    }
  }
}

// 3D structures are no part of what a mode is told to be.
TEST_F(ObservedBytes, OfferAModeAlsoWithoutThe3dStructuresThatItWasNamedWith) {
  situation_.settings.hdmi_3d_mode = 2;
  situation_.platform.video_60_priority = {{16, 7}, {4, 0}, {2, 0}, {1, 0}};
  situation_.sink.video = {16};
  observe_it();
  const auto modes = test_support::elements_of<short_video_desc_t>(edid_->get()->video_list);
  ASSERT_FALSE(modes.empty());
  EXPECT_EQ(modes[0].vic, 16U);
  EXPECT_EQ(modes[0].stereo & STEREO_SIDE_BY_SIDE_HALF, 0U);
  EXPECT_EQ(words_about(COMPOSE_SUBJECT_VIDEO_MODE, 16, observed_),
            words_of({told_t(COMPOSE_SUBJECT_VIDEO_MODE, 16, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_HAS_IT)
                          .named_by(sink_and_both_lists)
                          .in_sink_at(0)
                          .in_priority_list_at(0)
                          .in_addition_list_at(0)
                          .at(0)}));
}

// Ten formats are all that is written, however much room there is.
TEST_F(ObservedBytes, HaveRoomAlsoWhereAFormatIsOneTooMany) {
  situation_.platform.audio = {pcm_2};
  for (i32 type = 2; type <= 11; ++type)
    situation_.platform.audio.push_back(0x700 | type << 3 | 5);
  observe_it();
  EXPECT_EQ(ll_size(&edid_->get()->audio_list), 10);
  EXPECT_EQ(told_of(COMPOSE_SUBJECT_AUDIO_FORMAT, 11).reason, COMPOSE_REASON_NO_ROOM);
  // Header 4, speakers 4, modes 1 + 4, audio 1 + 30, HDMI 1 + 8, a timing 18.
  EXPECT_EQ(words_about(COMPOSE_SUBJECT_EXTENSION_ROOM, observed_),
            words_of({told_t(COMPOSE_SUBJECT_EXTENSION_ROOM, 71, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_ROOM_ENOUGH)
                          .values({71, 127, 8, 31})}));
}

}  // namespace
}  // namespace observed
