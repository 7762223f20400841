// What the selection of the modes derives: refresh family, geometry limit, current mode, padding.
#include "edid_composer/explain/observed_cases.h"

namespace observed {
namespace {

using test_support::timing_of_vic;

told_t family(u32 rate, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_NATIVE_RATE, rate, verdict, reason};
}

told_t family(u32 rate, compose_reason reason) {
  return family(rate, COMPOSE_VERDICT_OFFERED, reason);
}

told_t geometry(u32 lines, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_GEOMETRY_LIMIT, lines, verdict, reason};
}

told_t current_mode(u32 vic, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_CURRENT_MODE, vic, verdict, reason};
}

told_t padding(u32 count, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_PADDING, count, verdict, reason};
}

std::function<void(situation_t &)> put_out(const video_mode_t &mode, i32 wanted_first) {
  return [=](situation_t &situation) {
    situation.platform.current_mode_set_to_priority = wanted_first;
    situation.settings.hdmi_current_mode = mode;
  };
}

}  // namespace

std::vector<case_t> selection_cases() {
  return {
      // 24 Hz tells nothing.
      {"RateOfDetailedTiming",
       [](auto &situation) {
         situation.sink.timings = {timing_of_vic(32), timing_of_vic(19), timing_of_vic(16)};
         situation.sink.std_timings = {{{0x31, 0x40}}};
       },
       family(50, COMPOSE_REASON_RATE_OF_DETAILED_TIMING).values({1, 50})},
      {"RateOfStandardTiming",
       [](auto &situation) {
         situation.sink.timings = {timing_of_vic(32)};
         situation.sink.std_timings = {{{0x31, 0x4F}, {0x31, 0x40}}};
         situation.sink.video = {31};
       },
       family(60, COMPOSE_REASON_RATE_OF_STANDARD_TIMING).values({1, 60})},
      {"RateOfShortVideo",
       [](auto &situation) {
         situation.sink.video = {32, 33, 16};
       },
       family(50, COMPOSE_REASON_RATE_OF_SHORT_VIDEO).values({1, 25})},
      {"RateOfPlatform",
       [](auto &situation) {
         situation.platform.native_refresh_rate = 50;
         situation.sink.video = {32};
       },
       family(50, COMPOSE_REASON_RATE_OF_PLATFORM)},
      {"RateForced", [](auto &situation) { situation.platform.native_refresh_rate = 55; },
       family(60, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_RATE_FORCED).values({55})},
      {"GeometryOfSink",
       [](auto &situation) {
         situation.platform.geometry_limit = 1;
         situation.sink.video = {4, 20, 1};
       },
       geometry(1080, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_GEOMETRY_OF_SINK)},
      {"GeometryUnlimited", [](auto &situation) { situation.sink.video = {4}; },
       geometry(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_GEOMETRY_UNLIMITED)},
      {"CurrentModeFirst", put_out({1920, 1080, 1, 50}, 1),
       current_mode(20, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_CURRENT_MODE_FIRST).values({1920, 1080, 50, 1})},
      {"CurrentModeIgnored", put_out({1920, 1080, 0, 60}, 0),
       current_mode(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_CURRENT_MODE_IGNORED).values({1920, 1080, 60, 0})},
      {"CurrentModeImplausible", put_out({1920, 1080, 2, 60}, 1),
       current_mode(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_CURRENT_MODE_IMPLAUSIBLE).values({1920, 1080, 60, 2})},
      {"CurrentModeWithoutVic", put_out({1366, 768, 0, 60}, 1),
       current_mode(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_CURRENT_MODE_WITHOUT_VIC).values({1366, 768, 60, 0})},
      {"TooFewModes", [](auto &situation) { situation.platform.video_60_priority = modes({16}); },
       padding(3, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_TOO_FEW_MODES).values({1, 4})},
      {"EnoughModes", [](auto &) {}, padding(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_ENOUGH_MODES).values({4, 4})},
  };
}

}  // namespace observed
