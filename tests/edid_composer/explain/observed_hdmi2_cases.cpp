// What HDMI 2 adds: modes above VIC 64, rates, 4:2:0, HDR, colours, blocks that are passed on, room.
#include "edid_composer/explain/observed_cases.h"

namespace observed {
namespace {

using test_support::data_block;

constexpr u8 vendor_specific = 3;
constexpr u8 extended = 7;

/// Changes the values of a composition with HDMI 2.
using change_t = std::function<void(hdmi2_values_t &)>;
using arrangement_t = std::function<void(situation_t &)>;

/// A sink's HDMI Forum block: rate in 5 MHz, flags of the link and of 4:2:0, further bytes.
bytes_t forum_block(u8 rate, u8 video_flags = 0, const bytes_t &more = {}) {
  bytes_t payload{0xD8, 0x5D, 0xC4, 1, rate, 0x80, video_flags};
  payload.insert(payload.end(), more.begin(), more.end());
  return data_block(vendor_specific, payload);
}

bytes_t dolby_vision_block() {
  return data_block(extended, {0x01, 0x46, 0xD0, 0x00, 0x02, 0, 0, 0, 0});
}

bytes_t freesync_block() {
  return data_block(vendor_specific, {0x1A, 0x00, 0x00, 1, 2, 3, 4, 5});
}

/// A sink with these SVDs and blocks.
arrangement_t with_sink(const bytes_t &svds, const std::vector<bytes_t> &blocks, const change_t &change) {
  return [=](situation_t &situation) {
    situation.sink.video = svds;
    situation.sink.blocks = blocks;
    change(enable_hdmi2(situation));
  };
}

arrangement_t without_sink(const change_t &change) {
  return with_sink({}, {}, change);
}

void name_modes(hdmi2_values_t &values, const std::vector<i32> &vics) {
  std::copy(vics.begin(), vics.end(), values.vic_priority_list);
}

/// Modes that the box makes itself, on a receiver of 600 MHz.
void add_modes(hdmi2_values_t &values, const std::vector<i32> &vics) {
  name_modes(values, vics);
  std::copy(vics.begin(), vics.end(), values.vic_addition_list);
  values.tmds_limit = 600;
}

told_t mode(u32 vic, compose_verdict verdict, compose_reason reason) {
  return told_t(COMPOSE_SUBJECT_EXTENDED_MODE, vic, verdict, reason)
      .named_by(COMPOSE_ORIGIN_PRIORITY_LIST)
      .in_priority_list_at(0);
}

told_t value(compose_subject subject, u32 code, compose_verdict verdict, compose_reason reason,
             const std::array<i32, 4> &values = {}) {
  return told_t(subject, code, verdict, reason).values(values);
}

constexpr compose_verdict in = COMPOSE_VERDICT_OFFERED;
constexpr compose_verdict out = COMPOSE_VERDICT_LEFT_OUT;

std::vector<case_t> mode_cases() {
  const auto priority_97 = [](hdmi2_values_t &values) { name_modes(values, {97}); };
  return {
      {"ExtendedModeAboveTheSink",
       with_sink({16, 95}, {forum_block(0)}, [](auto &values) { name_modes(values, {95}); }),
       mode(95, out, COMPOSE_REASON_ABOVE_RATE)
           .named_by(COMPOSE_ORIGIN_SHORT_VIDEO | COMPOSE_ORIGIN_PRIORITY_LIST)
           .in_sink_at(1)
           .values({297000, 165000, 0, 0})},
      {"ExtendedModeAboveTheBox",
       with_sink({16}, {},
                 [](auto &values) {
                   add_modes(values, {97});
                   values.tmds_limit = 590;
                 }),
       mode(97, out, COMPOSE_REASON_ABOVE_RATE)
           .named_by(both_lists)
           .in_addition_list_at(0)
           .values({594000, 590000, 1, 0})},
      {"ExtendedModeIn420Only",
       with_sink({16}, {forum_block(60), data_block(extended, {0x0E, 97})},
                 [=](auto &values) {
                   priority_97(values);
                   values.y420 = 2;
                 }),
       mode(97, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_ONLY_IN_420)
           .named_by(COMPOSE_ORIGIN_SINK_420 | COMPOSE_ORIGIN_PRIORITY_LIST)
           .in_sink_at(0)
           .at(0)
           .values({594000, 297000, 300000})},
      {"ExtendedModeThatTheSinkTakesIn420Only",
       with_sink({16}, {forum_block(60), data_block(extended, {0x0E, 97})}, priority_97),
       mode(97, out, COMPOSE_REASON_SINK_HAS_IT_IN_420)
           .named_by(COMPOSE_ORIGIN_SINK_420 | COMPOSE_ORIGIN_PRIORITY_LIST)
           .in_sink_at(0)},
  };
}

std::vector<case_t> link_cases() {
  const auto rate = [](u32 mhz, compose_verdict verdict, compose_reason reason, i32 box, i32 sink) {
    return value(COMPOSE_SUBJECT_LINK_RATE, mhz, verdict, reason, {box, sink});
  };
  const auto clock = [](u32 mhz, compose_verdict verdict, compose_reason reason) {
    return value(COMPOSE_SUBJECT_TMDS_CLOCK, mhz, verdict, reason);
  };
  return {
      {"LinkRateOfBox", without_sink([](auto &values) { values.tmds_limit = 341; }),
       rate(345, in, COMPOSE_REASON_LINK_RATE_OF_BOX, 345, 345)},
      {"LinkRateOfSink", with_sink({16}, {forum_block(60)}, [](auto &) {}),
       rate(300, out, COMPOSE_REASON_LINK_RATE_OF_SINK, 340, 300)},
      {"LinkRateOfAddedModes", with_sink({16}, {forum_block(60)}, [](auto &values) { add_modes(values, {97}); }),
       rate(595, in, COMPOSE_REASON_LINK_RATE_OF_ADDED_MODES, 600, 300)},
      {"TmdsOfLink", without_sink([](auto &values) { values.tmds_limit = 600; }),
       clock(340, in, COMPOSE_REASON_TMDS_OF_LINK).values({600})},
      {"TmdsOfExtendedModes", without_sink([](auto &values) {
         add_modes(values, {95});
         values.tmds_limit = 300;
       }),
       clock(300, in, COMPOSE_REASON_TMDS_OF_EXTENDED_MODES).values({297000})},
      {"TmdsLimited",
       [](situation_t &situation) {
         situation.platform.tmds_override = 400;
         enable_hdmi2(situation).tmds_limit = 200;
       },
       clock(200, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_TMDS_LIMITED).values({400, 200})},
  };
}

std::vector<case_t> ycbcr_420_cases() {
  const auto made_by_box = [](const change_t &change) {
    return without_sink([=](auto &values) {
      add_modes(values, {97});
      values.y420 = 1;
      change(values);
    });
  };
  const auto depth = [](u32 bits, compose_verdict verdict, compose_reason reason,
                        const std::array<i32, 4> &values = {}) {
    return value(COMPOSE_SUBJECT_DEEP_COLOR_420, bits, verdict, reason, values);
  };
  return {
      {"Ycbcr420OfBox", made_by_box([](auto &) {}),
       value(COMPOSE_SUBJECT_YCBCR_420, 1, in, COMPOSE_REASON_BOX_ITSELF, {1, 0})},
      {"Ycbcr420WithoutMode", without_sink([](auto &values) { values.y420 = 1; }),
       value(COMPOSE_SUBJECT_YCBCR_420, 0, out, COMPOSE_REASON_NO_MODE_IN_420, {1, 0})},
      {"Depth420Required", made_by_box([](auto &values) { values.dc_36bit_420 = 1; }),
       depth(30, COMPOSE_VERDICT_CHANGED, COMPOSE_REASON_DEEP_COLOR_420_REQUIRED)},
      // 4:2:0 alone takes 297 MHz, with 30 bit 371.25.
      {"Depth420AboveTheRate", made_by_box([](auto &values) {
         values.tmds_limit = 370;
         values.dc_30bit_420 = 1;
       }),
       depth(30, out, COMPOSE_REASON_RATE_BELOW_DEPTH, {370, 1})},
  };
}

std::vector<case_t> picture_cases() {
  const bytes_t hdr_sink = data_block(extended, {0x06, 0x05, 0x01});
  return {
      {"HdrOff", without_sink([](auto &) {}), value(COMPOSE_SUBJECT_HDR, HDMI2_EOTF_PQ, out, COMPOSE_REASON_OFF)},
      {"HdrOfBox", without_sink([](auto &values) { values.hdr_hlg = 1; }),
       value(COMPOSE_SUBJECT_HDR, HDMI2_EOTF_HLG, in, COMPOSE_REASON_BOX_ITSELF, {1, 0})},
      {"HdrOfSink", with_sink({16}, {hdr_sink}, [](auto &values) { values.hdr_pq = 2; }),
       value(COMPOSE_SUBJECT_HDR, HDMI2_EOTF_PQ, in, COMPOSE_REASON_AS_SINK, {2, 1})},
      {"HdrNotInSink", with_sink({16}, {hdr_sink}, [](auto &values) { values.hdr_hlg = 2; }),
       value(COMPOSE_SUBJECT_HDR, HDMI2_EOTF_HLG, out, COMPOSE_REASON_SINK_WITHOUT, {2, 0})},
      {"ColorimetryOfSink",
       with_sink({16}, {data_block(extended, {0x05, 0x80, 0})}, [](auto &values) { values.bt2020_rgb = 2; }),
       value(COMPOSE_SUBJECT_COLORIMETRY, HDMI2_BT2020_RGB, in, COMPOSE_REASON_AS_SINK, {2, 1})},
      {"QuantizationOfSink", with_sink({16}, {data_block(extended, {0x00, 0x40})}, [](auto &) {}),
       value(COMPOSE_SUBJECT_QUANTIZATION, 0, in, COMPOSE_REASON_AS_SINK, {2, 1})},
      {"AllmOfBox", without_sink([](auto &values) { values.allm = 1; }),
       value(COMPOSE_SUBJECT_ALLM, 1, in, COMPOSE_REASON_BOX_ITSELF, {1, 0})},
      {"VrrOfBox", without_sink([](auto &values) { values.vrr = 1; }),
       value(COMPOSE_SUBJECT_VRR, 48, in, COMPOSE_REASON_BOX_ITSELF, {1, 0})},
      {"VrrRangeInvalid",
       with_sink({16}, {forum_block(0, 0, {0, 40, 99})},
                 [](auto &values) {
                   values.vrr = 2;
                   values.vrr_min = 1;
                 }),
       value(COMPOSE_SUBJECT_VRR, 0, out, COMPOSE_REASON_VRR_RANGE_INVALID, {40, 99, 40, 99})},
      {"DeepColorNotInSink",
       [](situation_t &situation) {
         situation.sink.video = {16};
         situation.platform.dc_36bit = 1;
         enable_hdmi2(situation).deep_color = 2;
       },
       value(COMPOSE_SUBJECT_DEEP_COLOR, 36, out, COMPOSE_REASON_SINK_WITHOUT, {2, 0})},
  };
}

std::vector<case_t> passed_block_cases() {
  const auto passed = [](u32 item, compose_verdict verdict, compose_reason reason,
                         const std::array<i32, 4> &values = {}) {
    return value(COMPOSE_SUBJECT_PASSED_BLOCK, item, verdict, reason, values);
  };
  const auto pass_freesync = [](hdmi2_values_t &values) { values.pass_freesync = 1; };
  return {
      {"PassedOn",
       with_sink({16}, {freesync_block()},
                 [=](auto &values) {
                   pass_freesync(values);
                   values.vrr = 2;
                 }),
       passed(COMPOSE_ROOM_FREESYNC, in, COMPOSE_REASON_PASSED_ON, {8})},
      {"PassedOnOnlyWithVrr", with_sink({16}, {freesync_block()}, pass_freesync),
       passed(COMPOSE_ROOM_FREESYNC, out, COMPOSE_REASON_VRR_CHANGED)},
      {"PassedOnOnlyWithTheRate",
       with_sink({16}, {dolby_vision_block()}, [](auto &values) { values.pass_dolby_vision = 1; }),
       passed(COMPOSE_ROOM_DOLBY_VISION, out, COMPOSE_REASON_RATE_BELOW_BLOCK, {594, 165})},
      {"PassedOnOff", with_sink({16}, {dolby_vision_block()}, [](auto &) {}),
       passed(COMPOSE_ROOM_DOLBY_VISION, out, COMPOSE_REASON_OFF, {0, 1})},
      {"NothingToPassOn", without_sink([=](auto &values) { pass_freesync(values); }),
       passed(COMPOSE_ROOM_FREESYNC, out, COMPOSE_REASON_SINK_WITHOUT, {1, 0})},
  };
}

std::vector<case_t> timing_cases() {
  const auto uhd = [](u32 offered, compose_verdict verdict, compose_reason reason) {
    return value(COMPOSE_SUBJECT_UHD_VIC, offered, verdict, reason);
  };
  const auto with_4k = [](i32 vic, i32 scdc) {
    return [=](situation_t &situation) {
      situation.platform.modes_4k_x_2k_priority = situation.platform.modes_4k_x_2k_addition = {1};
      hdmi2_values_t &values = enable_hdmi2(situation);
      add_modes(values, {vic});
      values.tmds_limit = 300;
      values.scdc = scdc;
    };
  };
  const auto preferred = [](u32 vic, compose_verdict verdict, compose_reason reason) {
    return value(COMPOSE_SUBJECT_PREFERRED_TIMING, vic, verdict, reason);
  };
  const auto prefer = [](i32 vic) {
    return without_sink([=](auto &values) {
      add_modes(values, {vic});
      values.preferred_extended = 1;
    });
  };
  return {
      {"UhdVicOfModes", with_4k(95, 1), uhd(1, in, COMPOSE_REASON_UHD_VIC_OF_MODES)},
      {"NoUhdVic", with_4k(94, 1), uhd(0, out, COMPOSE_REASON_NO_UHD_VIC)},
      {"UhdVicWithoutForumBlock", with_4k(95, 0), uhd(0, out, COMPOSE_REASON_NO_FORUM_BLOCK)},
      {"PreferredExtended", prefer(97), preferred(97, in, COMPOSE_REASON_FIRST_EXTENDED_MODE)},
      // 4096 pixels need 13 bits.
      {"PreferredExtendedTooWide", prefer(102), preferred(0, out, COMPOSE_REASON_NO_EXTENDED_TIMING)},
      {"PreferredExtendedOff", without_sink([](auto &) {}), preferred(0, out, COMPOSE_REASON_OFF)},
  };
}

std::vector<case_t> room_item_cases() {
  return {
      // Serial text and timing leave 91 bytes to header and data blocks: header 4, speakers 4, modes 1 + 31, audio
      // 1 + 30, HDMI 1 + 8, HDMI Forum 1 + 7, video capability 1 + 2, and then HDR 1 + 3.
      {"SerialTextWithoutRoom",
       [](situation_t &situation) {
         std::vector<u32> vics;
         for (u32 vic = 1; vic <= 31; ++vic)
           vics.push_back(vic);
         situation.platform.video_60_priority = situation.platform.video_60_additional = modes(vics);
         situation.platform.audio = {pcm_2};
         for (i32 type = 2; type <= 10; ++type)
           situation.platform.audio.push_back(0x700 | type << 3 | 5);
         situation.platform.monitor_serial = "0001";
         hdmi2_values_t &values = enable_hdmi2(situation);
         values.tmds_limit = 600;
         values.hdr_pq = 1;
       },
       value(COMPOSE_SUBJECT_ROOM_ITEM, COMPOSE_ROOM_SERIAL_TEXT, out, COMPOSE_REASON_NO_ROOM, {1})},
  };
}

}  // namespace

std::vector<case_t> hdmi2_cases() {
  std::vector<case_t> cases;
  for (const auto &group : {mode_cases(), link_cases(), ycbcr_420_cases(), picture_cases(), passed_block_cases(),
                            timing_cases(), room_item_cases()})
    cases.insert(cases.end(), group.begin(), group.end());
  return cases;
}

}  // namespace observed
