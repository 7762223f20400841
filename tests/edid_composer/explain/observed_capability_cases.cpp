// What is derived besides modes and formats: address, colours, clock, latencies, 3D, room in the extension.
#include "edid_composer/explain/observed_cases.h"

namespace observed {
namespace {

told_t address(u32 address, compose_verdict verdict, compose_reason reason, i32 port, i32 of_sink) {
  return told_t(COMPOSE_SUBJECT_PHYSICAL_ADDRESS, address, verdict, reason).values({port, of_sink});
}

told_t no_address(compose_reason reason, i32 port, i32 of_sink) {
  return address(0xFFFF, COMPOSE_VERDICT_LEFT_OUT, reason, port, of_sink);
}

std::function<void(situation_t &)> sink_at(u8 high, u8 low) {
  return [=](situation_t &situation) {
    situation.sink.hdmi = {high, low};
    situation.settings.port = 4;
  };
}

told_t depth(u32 bits, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_DEEP_COLOR, bits, verdict, reason};
}

told_t clock(u32 mhz, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_TMDS_CLOCK, mhz, verdict, reason};
}

/// A sink that takes 225 MHz.
void limit_clock_of_sink(situation_t &situation) {
  situation.sink.hdmi = {0x10, 0x00, 0, 45};
}

told_t latency(u32 which, compose_verdict verdict, compose_reason reason) {
  return {COMPOSE_SUBJECT_LATENCY, which, verdict, reason};
}

std::function<void(situation_t &)> delay_platform(u32 which, u32 ms) {
  return [=](situation_t &situation) { situation.settings.edid_latency[which] = ms; };
}

/// A sink of 20, 40, 60 and 508 ms: 255 stands for none.
void delay_sink(situation_t &situation) {
  situation.sink.hdmi = {0x10, 0x00, 0, 0, 0xC0, 11, 21, 31, 255};
}

told_t stereo(u32 offered, compose_verdict verdict, compose_reason reason, i32 setting, i32 of_sink) {
  return told_t(COMPOSE_SUBJECT_3D, offered, verdict, reason).values({setting, of_sink});
}

std::function<void(situation_t &)> want_3d(i32 setting, bool in_sink) {
  return [=](situation_t &situation) {
    situation.settings.hdmi_3d_mode = setting;
    if (in_sink) situation.sink.hdmi = {0x10, 0x00, 0, 0, 0x20, 0x80, 0};
  };
}

told_t room(compose_verdict verdict, compose_reason reason, i32 bytes, i32 longest_block) {
  return told_t(COMPOSE_SUBJECT_EXTENSION_ROOM, static_cast<u32>(bytes), verdict, reason)
      .values({bytes, 127, longest_block, 31});
}

void offer_modes(situation_t &situation, u32 count) {
  std::vector<u32> vics;
  for (u32 vic = 1; vic <= count; ++vic)
    vics.push_back(vic);
  situation.platform.video_60_priority = situation.platform.video_60_additional = modes(vics);
}

/// 31 modes, 10 audio formats, 7 4Kx2K modes, latencies and a serial text.
void fill_extension(situation_t &situation) {
  offer_modes(situation, 31);
  situation.platform.audio = {pcm_2};
  for (i32 type = 2; type <= 10; ++type)
    situation.platform.audio.push_back(0x700 | type << 3 | 5);
  situation.platform.modes_4k_x_2k_priority = situation.platform.modes_4k_x_2k_addition = {1, 2, 3, 4, 1, 2, 3};
  situation.settings.edid_latency[2] = 20;
  situation.platform.monitor_serial = "0001";
}

std::vector<case_t> address_cases() {
  return {
      {"AddressOfRoot",
       [](auto &situation) {
         situation.platform.is_tv = 1;
         situation.sink.hdmi = {0x10, 0x00};
         situation.settings.port = 2;
       },
       address(0x3000, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_ADDRESS_OF_ROOT, 3, 0)},
      {"AddressBelowSink", sink_at(0x12, 0x30),
       address(0x1235, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_ADDRESS_BELOW_SINK, 5, 0x1230)},
      {"AddressWithoutSink", [](auto &situation) { situation.sink.video = {16}; },
       no_address(COMPOSE_REASON_ADDRESS_WITHOUT_SINK, 1, 0)},
      {"AddressOfSinkInvalid", sink_at(0x01, 0x00), no_address(COMPOSE_REASON_ADDRESS_OF_SINK_INVALID, 5, 0x0100)},
      {"AddressWithoutPlace", sink_at(0x12, 0x34), no_address(COMPOSE_REASON_ADDRESS_WITHOUT_PLACE, 5, 0x1234)},
  };
}

std::vector<case_t> colour_cases() {
  return {
      {"DeepColorOfPlatform", [](auto &situation) { situation.platform.dc_36bit = 1; },
       depth(36, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM).values({1})},
      {"NoDeepColorOfPlatform", [](auto &situation) { situation.platform.dc_36bit = 1; },
       depth(30, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM)},
      {"DeepColorRequired", [](auto &situation) { situation.platform.dc_30bit = 1; },
       depth(36, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_DEEP_COLOR_REQUIRED)},
      {"DeepColorNever", [](auto &) {}, depth(48, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_DEEP_COLOR_NEVER)},
  };
}

std::vector<case_t> clock_cases() {
  return {
      {"TmdsOverride",
       [](auto &situation) {
         limit_clock_of_sink(situation);
         situation.platform.tmds_override = 25;
       },
       clock(25, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_TMDS_OVERRIDE).values({25, 225})},
      {"TmdsOverrideBetweenSteps",
       [](auto &situation) {
         limit_clock_of_sink(situation);
         situation.platform.tmds_override = 1272;
       },
       clock(1270, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_TMDS_OVERRIDE).values({1272, 225})},
      {"TmdsOfModes",
       [](auto &situation) {
         limit_clock_of_sink(situation);
         situation.platform.dc_36bit = 1;
       },
       clock(225, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_TMDS_OF_MODES).values({148500, 150, 225})},
      {"TmdsOf4kModes",
       [](auto &situation) {
         limit_clock_of_sink(situation);
         situation.platform.modes_4k_x_2k_priority = situation.platform.modes_4k_x_2k_addition = {1};
       },
       clock(300, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_TMDS_OF_4K_MODES).values({148500, 100, 225})},
      {"TmdsNotNeeded", limit_clock_of_sink,
       clock(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_TMDS_NOT_NEEDED).values({148500, 100, 225})},
      {"TmdsLargest", [](auto &situation) { situation.platform.tmds_override = 1300; },
       clock(1275, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_TMDS_LARGEST).values({1300, 1275})},
  };
}

std::vector<case_t> latency_cases() {
  return {
      {"LatencyOfBoth",
       [](auto &situation) {
         delay_sink(situation);
         situation.settings.edid_latency[1] = 300;
       },
       latency(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_LATENCY_OF_BOTH).values({300, 40, 340})},
      {"LatencyOfBothIsOdd", delay_platform(0, 21),
       latency(0, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_LATENCY_OF_BOTH).values({21, 0, 20})},
      {"LatencyOfBothIsLongerThanCanBeDeclared",
       [](auto &situation) {
         delay_sink(situation);
         situation.settings.edid_latency[1] = 470;
       },
       latency(1, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_LATENCY_OF_BOTH).values({470, 40, 500})},
      {"LatencyNone", [](auto &) {}, latency(2, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_LATENCY_NONE)},
      {"LatencyNoneBesideAnother", delay_platform(0, 20),
       latency(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_LATENCY_NONE)},
      {"LatencyNoneBesideInterlaced", delay_platform(3, 20),
       latency(0, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_LATENCY_NONE)},
      {"InterlacedLatencyNoneBesideProgressive", delay_platform(0, 20),
       latency(3, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_LATENCY_NONE)},
      {"LatencyOfPlatformTooLong",
       [](auto &situation) {
         delay_sink(situation);
         situation.settings.edid_latency[0] = 501;
       },
       latency(0, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_LATENCY_TOO_LONG).values({501, 20})},
      {"LatencyOfSinkTooLong", delay_sink,
       latency(3, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_LATENCY_TOO_LONG).values({0, 508})},
  };
}

std::vector<case_t> stereo_cases() {
  return {
      {"Always3d", want_3d(2, false), stereo(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_3D_ALWAYS, 2, 0)},
      {"Sinks3d", want_3d(1, true), stereo(1, COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_3D_OF_SINK, 1, 1)},
      {"No3dInSink", want_3d(1, false), stereo(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_3D_NOT_IN_SINK, 1, 0)},
      {"Off3d", want_3d(3, true), stereo(0, COMPOSE_VERDICT_LEFT_OUT, COMPOSE_REASON_3D_OFF, 3, 1)},
  };
}

std::vector<case_t> room_cases() {
  return {
      // Header 4, speakers 4, modes 1 + 4, audio 1 + 3, HDMI 1 + 8, a timing 18.
      {"RoomEnough", [](auto &) {}, room(COMPOSE_VERDICT_OFFERED, COMPOSE_REASON_ROOM_ENOUGH, 44, 8)},
      // Header 4, speakers 4, modes 1 + 31, audio 1 + 30, HDMI 1 + 21, a timing and a text 18 each.
      {"RoomExceeded", fill_extension, room(COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_ROOM_EXCEEDED, 129, 31)},
      {"BlockTooLong", [](auto &situation) { offer_modes(situation, 33); },
       room(COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_BLOCK_TOO_LONG, 72, 32)},
      {"NotAnnounced", [](auto &situation) { situation.platform.monitor_name = ""; },
       room(COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_NOT_ANNOUNCED, 44, 8)},
  };
}

}  // namespace

std::vector<case_t> capability_cases() {
  std::vector<case_t> cases;
  for (const auto &group :
       {address_cases(), colour_cases(), clock_cases(), latency_cases(), stereo_cases(), room_cases()})
    cases.insert(cases.end(), group.begin(), group.end());
  return cases;
}

}  // namespace observed
