// Why video and 4Kx2K modes are offered or left out.
#include "edid_composer/explain/observed_cases.h"

namespace observed {
namespace {

told_t offered(u32 vic, compose_reason reason) {
  return {COMPOSE_SUBJECT_VIDEO_MODE, vic, COMPOSE_VERDICT_OFFERED, reason};
}

told_t left_out(u32 vic, compose_reason reason) {
  return {COMPOSE_SUBJECT_VIDEO_MODE, vic, COMPOSE_VERDICT_LEFT_OUT, reason};
}

told_t timing_without_vic() {
  return {COMPOSE_SUBJECT_SINK_TIMING, 0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_TIMING_WITHOUT_VIC};
}

/// Made by nobody but this sink.
detailed_timing_t odd_timing(u32 vic) {
  detailed_timing_t timing = test_support::timing_of_vic(vic);
  timing.h_active -= 2;
  timing.h_blanking += 2;
  return timing;
}

told_t mode_4k(u32 hdmi_vic, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_4K_MODE, hdmi_vic, verdict, reason};
}

/// A sink with 4Kx2K modes 2 and 1, and a platform that names others.
void name_4k_modes(situation_t &situation) {
  situation.sink.hdmi = {0x10, 0x00, 0, 0, 0x20, 0, 0x40, 2, 1};
  situation.platform.modes_4k_x_2k_priority = {4, 3, 1};
  situation.platform.modes_4k_x_2k_addition = {3};
}

}  // namespace

std::vector<case_t> video_cases() {
  return {
      {"SinkHasIt",
       [](auto &situation) {
         situation.sink.video = {34, 16};
         situation.platform.video_60_priority = modes({4, 2, 16, 1});
       },
       offered(16, COMPOSE_REASON_SINK_HAS_IT)
           .named_by(sink_and_both_lists)
           .in_sink_at(1)
           .in_priority_list_at(2)
           .in_addition_list_at(0)
           .at(2)},
      {"DetailedTimingOfTheSinkHasIt",
       [](auto &situation) {
         situation.sink.timings = {test_support::timing_of_vic(16)};
         situation.sink.more_timings = {test_support::timing_of_vic(4)};
         situation.platform.video_60_additional = modes({1, 2});
       },
       offered(4, COMPOSE_REASON_SINK_HAS_IT)
           .named_by(COMPOSE_ORIGIN_DETAILED_TIMING | COMPOSE_ORIGIN_PRIORITY_LIST)
           .in_sink_at(1)
           .in_priority_list_at(1)
           .at(1)},
      // 360 pixels of 4:3, repeated: a standard timing that has a VIC all the same.
      {"StandardTimingOfTheSinkHasIt",
       [](auto &situation) {
         situation.sink.std_timings = {{{0x31, 0x40}, {14, 0x7B}}};
         situation.platform.video_60_priority = modes({48, 16, 4, 2, 1});
       },
       offered(48, COMPOSE_REASON_SINK_HAS_IT)
           .named_by(COMPOSE_ORIGIN_STANDARD_TIMING | COMPOSE_ORIGIN_PRIORITY_LIST)
           .in_sink_at(1)
           .in_priority_list_at(0)
           .at(0)},
      {"PlatformAddsIt", [](auto &) {},
       offered(4, COMPOSE_REASON_PLATFORM_ADDS_IT)
           .named_by(both_lists)
           .in_priority_list_at(1)
           .in_addition_list_at(1)
           .at(1)},
      {"IsCurrentMode",
       [](auto &situation) {
         situation.platform.current_mode_set_to_priority = 1;
         situation.settings.hdmi_current_mode = {1280, 720, 0, 50};
       },
       offered(19, COMPOSE_REASON_IS_CURRENT_MODE).named_by(COMPOSE_ORIGIN_CURRENT_MODE).at(0)},
      {"PadsTheList",
       [](auto &situation) {
         situation.platform.video_60_priority = situation.platform.video_60_additional = modes({16, 4});
       },
       offered(1, COMPOSE_REASON_PADS_THE_LIST).named_by(COMPOSE_ORIGIN_LIBRARY).at(2)},
      {"SinksModeIsNotInPriorityList",
       [](auto &situation) {
         situation.sink.video = {16, 34};
       },
       left_out(34, COMPOSE_REASON_NOT_IN_PRIORITY_LIST).named_by(COMPOSE_ORIGIN_SHORT_VIDEO).in_sink_at(1)},
      {"AddedModeIsNotInPriorityList",
       [](auto &situation) {
         situation.platform.video_60_additional = modes({16, 4, 2, 1, 3});
       },
       left_out(3, COMPOSE_REASON_NOT_IN_PRIORITY_LIST).named_by(COMPOSE_ORIGIN_ADDITION_LIST).in_addition_list_at(4)},
      {"NotAvailable",
       [](auto &situation) {
         situation.platform.video_60_priority = modes({16, 4, 3, 2, 1});
       },
       left_out(3, COMPOSE_REASON_NOT_AVAILABLE).named_by(COMPOSE_ORIGIN_PRIORITY_LIST).in_priority_list_at(2)},
      {"OtherRefreshFamily",
       [](auto &situation) {
         situation.platform.video_50_priority = modes({31, 19});
         situation.platform.video_50_additional = modes({19});
       },
       left_out(19, COMPOSE_REASON_OTHER_REFRESH_FAMILY)
           .named_by(COMPOSE_ORIGIN_OTHER_PRIORITY_LIST | COMPOSE_ORIGIN_OTHER_ADDITION_LIST)
           .in_priority_list_at(1)
           .in_addition_list_at(0)
           .values({60})},
      {"TallerThanSink",
       [](auto &situation) {
         situation.platform.geometry_limit = 1;
         situation.sink.video = {3, 4};
       },
       left_out(16, COMPOSE_REASON_TALLER_THAN_SINK)
           .named_by(both_lists)
           .in_priority_list_at(0)
           .in_addition_list_at(0)
           .values({1080, 720})},
      {"DetailedTimingWithoutVic",
       [](auto &situation) {
         situation.sink.timings = {test_support::timing_of_vic(16), odd_timing(20)};
       },
       timing_without_vic().named_by(COMPOSE_ORIGIN_DETAILED_TIMING).in_sink_at(1).values({1918, 1080, 50, 1})},
      {"StandardTimingWithoutVic",
       [](auto &situation) {
         situation.sink.std_timings = {{{14, 0x7B}, {129, 0x8F}}};
       },
       timing_without_vic().named_by(COMPOSE_ORIGIN_STANDARD_TIMING).in_sink_at(1).values({1280, 0, 75, 0})},
      {"SinkHas4kMode", name_4k_modes,
       mode_4k(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_SINK_HAS_IT)
           .named_by(COMPOSE_ORIGIN_SINK_4K | COMPOSE_ORIGIN_PRIORITY_LIST)
           .in_sink_at(1)
           .in_priority_list_at(2)
           .at(1)},
      {"PlatformAdds4kMode", name_4k_modes,
       mode_4k(3, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_PLATFORM_ADDS_IT)
           .named_by(both_lists)
           .in_priority_list_at(1)
           .in_addition_list_at(0)
           .at(0)},
      {"SinksMode4kIsNotInPriorityList", name_4k_modes,
       mode_4k(2, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_IN_PRIORITY_LIST)
           .named_by(COMPOSE_ORIGIN_SINK_4K)
           .in_sink_at(0)},
      {"Mode4kIsNotAvailable", name_4k_modes,
       mode_4k(4, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_NOT_AVAILABLE)
           .named_by(COMPOSE_ORIGIN_PRIORITY_LIST)
           .in_priority_list_at(0)},
  };
}

}  // namespace observed
