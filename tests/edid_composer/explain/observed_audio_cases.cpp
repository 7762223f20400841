// Why audio formats are offered or left out.
#include "edid_composer/explain/observed_cases.h"

namespace observed {
namespace {

constexpr u32 pcm = 1;
constexpr u32 ac3 = 2;
constexpr u32 dts = 7;
constexpr u32 wma_pro = 14;

told_t format(u32 type, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_AUDIO_FORMAT, type, verdict, reason};
}

told_t of_platform(i32 index, told_t told) {
  return told.named_by(COMPOSE_ORIGIN_PLATFORM_AUDIO).in_priority_list_at(index);
}

told_t of_sink(i32 index, told_t told) {
  return told.named_by(COMPOSE_ORIGIN_SINK_AUDIO).in_sink_at(index);
}

}  // namespace

std::vector<case_t> audio_cases() {
  return {
      {"PlatformFormat",
       [](auto &situation) {
         situation.platform.audio = {pcm_2, ac3_6};
       },
       of_platform(1, format(ac3, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_FORMAT)).at(1).values({6})},
      {"SinkFormat",
       [](auto &situation) {
         situation.platform.audio = {pcm_2};
         situation.platform.audio_pass_through = 1;
         situation.sink.audio = test_support::join(descriptor(pcm_2), descriptor(ac3_6));
       },
       of_sink(1, format(ac3, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_FORMAT)).at(1).values({6})},
      // 8 channels at 32, 44.1 and 48 kHz are asked for, 6 at 44.1 and 48 kHz are left.
      {"NarrowedToSink",
       [](auto &situation) {
         situation.settings.audio_sink_filter = 1;
         situation.platform.audio = {pcm_2, 0x500717};
         situation.sink.audio = test_support::join(descriptor(pcm_2), descriptor(0x500615));
       },
       of_platform(1, format(ac3, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_NARROWED_TO_SINK))
           .at(1)
           .values({8, 6, 7, 6})},
      {"BasicAudio", [](auto &situation) { situation.platform.audio = {pcm_8}; },
       format(pcm, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_BASIC_AUDIO)
           .named_by(COMPOSE_ORIGIN_LIBRARY)
           .at(0)
           .values({2})},
      {"NotAnAudioFormat",
       [](auto &situation) {
         situation.platform.audio = {pcm_2, 0x070700};
       },
       of_platform(1, format(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_AN_AUDIO_FORMAT)).values({0x070700})},
      {"SinkFormatsOnly",
       [](auto &situation) {
         situation.platform.audio_pass_through = 2;
         situation.platform.audio = {pcm_2, ac3_6};
       },
       of_platform(1, format(ac3, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_SINK_FORMATS_ONLY)).values({2})},
      {"PlatformFormatsOnly",
       [](auto &situation) {
         situation.platform.audio = {pcm_2};
         situation.sink.audio = test_support::join(descriptor(dts_6), descriptor(ac3_6));
       },
       of_sink(1, format(ac3, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_PLATFORM_FORMATS_ONLY))},
      {"NotInSink",
       [](auto &situation) {
         situation.settings.audio_sink_filter = 1;
         situation.platform.audio = {pcm_2, dts_6};
         situation.sink.audio = test_support::join(descriptor(pcm_2), descriptor(ac3_6));
       },
       of_platform(1, format(dts, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_IN_SINK)).values({6})},
      {"Duplicate",
       [](auto &situation) {
         situation.platform.audio = {pcm_2, dts_6};
         situation.platform.audio_pass_through = 1;
         situation.sink.audio = descriptor(dts_6);
       },
       of_sink(0, format(dts, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_DUPLICATE)).values({6, 1})},
      {"AudioMask",
       [](auto &situation) {
         situation.settings.audio_mask = 0xFFFFFFFF & ~0x2000U;
         situation.platform.audio = {pcm_2, 0x000775};
       },
       of_platform(1, format(wma_pro, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_AUDIO_MASK))
           .values({static_cast<i32>(0xFFFFDFFF), 0x2000})},
      // The mask excludes nothing, but the extension escape with a format that nobody knows is not in it.
      {"TypeWithoutBit",
       [](auto &situation) {
         situation.platform.audio = {pcm_2, 0x28077F};
       },
       of_platform(1, format(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_TYPE_WITHOUT_BIT)).values({-1})},
      {"NoRoomForTheEleventh",
       [](auto &situation) {
         situation.platform.audio = {pcm_2};
         for (i32 type = 2; type <= 11; ++type)
           situation.platform.audio.push_back(0x700 | type << 3 | 5);
       },
       of_platform(10, format(11, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NO_ROOM)).values({10})},
  };
}

}  // namespace observed
