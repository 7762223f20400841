// What holds for every composition with HDMI 2: it fits, it offers nothing beyond platform or sink, and what an
// observer is told is what stands in the bytes.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <map>
#include <memory>
#include <set>

#include "composing_fixture.h"
#include "random_hdmi2.h"
#include "support/observation.h"

namespace properties {
namespace {

using test_support::bytes_t;

/// The pixel clocks of the VICs above 64, kHz, as another program lists them.
const std::map<u32, u32> &extended_clocks() {
  static const std::map<u32, u32> clocks = [] {
    std::map<u32, u32> read;
    const std::unique_ptr<std::FILE, int (*)(std::FILE *)> file(
        std::fopen(TESTS_DIR "/independent/vic_timings.txt", "r"), std::fclose);
    if (file == nullptr) return read;
    u32 vic = 0;
    double megahertz = 0;
    while (std::fscanf(file.get(), " VIC %u: %*s %*f Hz %*s %*f kHz %lf MHz %*[^\n] %*[^\n]", &vic, &megahertz) == 2)
      read[vic] = static_cast<u32>(megahertz * 1000 + 0.5);
    return read;
  }();
  return clocks;
}

/// A composition with HDMI 2, and what the library's other operations read of sink and new EDID.
struct observed_t {
  bool result = false;
  bytes_t bytes = bytes_t(256, 0xA5);
  std::string output;
  std::vector<compose_decision_t> decisions;
  hdmi2_t sink{};
  hdmi2_t offered{};
  u32 sink_clock = 0;  ///< Maximum TMDS clock of the sink's HDMI block, MHz.
};

hdmi2_t decoded(const bytes_t &edid) {
  hdmi2_t hdmi2{};
  hdmi2.size = sizeof hdmi2;
  test_support::output_of([&] { decode_hdmi2(edid.data(), static_cast<u32>(edid.size()), &hdmi2); });
  return hdmi2;
}

observed_t observe(const situation_t &situation, const hdmi2_values_t &values) {
  observed_t observed;
  values_of_t platform(situation.platform);
  const bytes_t &sink = situation.sink.bytes;
  observed.output = test_support::output_of([&] {
    observed.result = test_support::compose_observed(
        sink, observed.bytes, &situation.settings, platform.get(),
        [](const compose_decision_t *decision, void *context) {
          static_cast<std::vector<compose_decision_t> *>(context)->push_back(*decision);
        },
        &observed.decisions, &values);
    test_support::scoped_edid_t edid;
    if (sink.empty()) return;
    decode_edid_extensions(sink.data() + 128, 128, edid.get());
    observed.sink_clock = edid.get()->max_tmds_clock;
  });
  if (!sink.empty()) observed.sink = decoded(sink);
  observed.offered = decoded(observed.bytes);
  return observed;
}

u32 vic_of(u8 code) {
  return ((code - 1U) & 0x40) != 0 && (code & 0x7F) != 0 ? code : code & 0x7FU;
}

std::set<u32> extended_vics(const u8 *codes, u32 count) {
  std::set<u32> vics;
  for (u32 i = 0; i < count; ++i) {
    if (extended_clocks().count(vic_of(codes[i])) != 0) vics.insert(vic_of(codes[i]));
  }
  return vics;
}

bool has(const std::set<u32> &vics, u32 vic) {
  return vics.count(vic) != 0;
}

std::set<u32> listed(const i32 (&list)[HDMI2_MOST_LISTED_VICS]) {
  std::set<u32> vics;
  for (const i32 vic : list) {
    if (vic == 0) break;
    vics.insert(static_cast<u32>(vic));
  }
  return vics;
}

/// Composes from random situations below sinks of HDMI 2 and of today, or none.
void for_each_composition(
    u32 runs, const std::function<void(const situation_t &, const hdmi2_values_t &, const observed_t &)> &see) {
  for_each_run(runs, [&](random_source_t &random) {
    situation_t situation = random_situation(random);
    if (random.chance(80)) {
      situation.sink = {};
      situation.sink.bytes = random_hdmi2_sink(random);
    }
    const hdmi2_values_t values = random_hdmi2_values(random);
    const observed_t observed = observe(situation, values);
    if (!observed.result) {
      ASSERT_NE(observed.output.find("Audio type is not recognied. Type:0"), std::string::npos) << observed.output;
      return;
    }
    see(situation, values, observed);
  });
}

TEST(RandomHdmi2Composition, IsASoundEdidThatAlwaysFits) {
  u32 composed = 0;
  for_each_composition(2500, [&](const situation_t &, const hdmi2_values_t &, const observed_t &observed) {
    ++composed;
    const bytes_t &bytes = observed.bytes;
    EXPECT_EQ(test_support::block_sum(bytes.data()), 0);
    EXPECT_EQ(test_support::block_sum(bytes.data() + 128), 0);
    EXPECT_EQ(bytes[126], 1);
    EXPECT_LE(bytes[130], 109);
    std::set<bytes_t> identities;
    std::size_t at = 132;
    while (at < 128U + bytes[130]) {
      const std::size_t length = bytes[at] & 0x1F;
      const std::size_t identifier = bytes[at] >> 5 == 7 ? (bytes[at + 1] == 1 ? 4 : 1) : bytes[at] >> 5 == 3 ? 3 : 0;
      bytes_t identity{static_cast<u8>(bytes[at] >> 5)};
      for (std::size_t i = 1; i <= identifier; ++i)
        identity.push_back(bytes[at + i]);
      EXPECT_TRUE(identities.insert(identity).second) << "a second block of tag " << int{identity[0]};
      at += 1 + length;
    }
    EXPECT_EQ(at, 128U + bytes[130]) << "the last data block ends where the timing begins";
  });
  expect_at_least(2000, composed, "compositions");
}

TEST(RandomHdmi2Composition, OffersNoModeBeyondPlatformSinkOrRate) {
  ASSERT_EQ(extended_clocks().size(), 90U);
  u32 modes = 0;
  u32 modes_420 = 0;
  u32 marked = 0;
  for_each_composition(
      2500, [&](const situation_t &situation, const hdmi2_values_t &values, const observed_t &observed) {
        const hdmi2_t &sink = observed.sink;
        const u32 box = (static_cast<u32>(values.tmds_limit) + 4) / 5 * 5;
        const bool limited = !situation.sink.bytes.empty() && situation.platform.is_tv == 0;
        const u32 of_sink = sink.max_tmds_rate != 0    ? sink.max_tmds_rate
                            : observed.sink_clock != 0 ? observed.sink_clock
                                                       : 165;
        const u32 both = limited ? std::min(box, of_sink) : box;
        const std::set<u32> priority = listed(values.vic_priority_list);
        const std::set<u32> addition = listed(values.vic_addition_list);
        const std::set<u32> svds = extended_vics(sink.svds, sink.svd_count);
        const std::set<u32> sink_420 = extended_vics(sink.y420_vics, sink.y420_count);
        const auto expect_allowed = [&](u32 vic, bool in_420) {
          EXPECT_TRUE(has(priority, vic)) << vic;
          EXPECT_TRUE(has(addition, vic) || has(svds, vic) || (in_420 && has(sink_420, vic))) << vic;
          const u32 khz = extended_clocks().at(vic) / (in_420 ? 2 : 1);
          EXPECT_LE(khz, 1000 * (has(addition, vic) ? box : both)) << vic;
        };
        const hdmi2_t &offered = observed.offered;
        for (const u32 vic : extended_vics(offered.svds, offered.svd_count)) {
          ++modes;
          expect_allowed(vic, false);
        }
        for (const u32 vic : extended_vics(offered.y420_vics, offered.y420_count)) {
          ++modes_420;
          EXPECT_NE(values.y420, 0);
          EXPECT_GE(extended_clocks().at(vic), 590000U);
          expect_allowed(vic, true);
        }
        for (u32 i = 0; i < offered.y420_map_bytes * 8U; ++i) {
          if ((offered.y420_map[i / 8] >> i % 8 & 1) == 0) continue;
          ++marked;
          ASSERT_LT(i, offered.svd_count);
          const auto clock = extended_clocks().find(vic_of(offered.svds[i]));
          ASSERT_NE(clock, extended_clocks().end()) << "only modes above VIC 64 are marked";
          EXPECT_GE(clock->second, 590000U);
          EXPECT_NE(values.y420, 0);
        }
        EXPECT_EQ(offered.y420_map_present != 0, offered.y420_map_bytes != 0) << "an empty map would mark all";
        EXPECT_LE(offered.max_tmds_rate, box);
        EXPECT_TRUE(offered.max_tmds_rate == 0 || offered.max_tmds_rate > 340);
      });
  expect_at_least(2000, modes, "modes above VIC 64");
  expect_at_least(100, modes_420, "modes in 4:2:0 only");
  expect_at_least(100, marked, "modes in 4:2:0 too");
}

/// That a value is there at most where its tri-state allows it.
void expect_tri_state(i32 setting, bool offered, bool in_sink, const char *what) {
  EXPECT_EQ(offered, setting == 2 ? in_sink : setting == 1) << what;
}

TEST(RandomHdmi2Composition, OffersNoPictureBeyondPlatformOrSink) {
  u32 passed = 0;
  u32 with_vrr = 0;
  for_each_composition(2500, [&](const situation_t &, const hdmi2_values_t &values, const observed_t &observed) {
    const auto &[sink, offered] = std::tie(observed.sink, observed.offered);
    const u32 eotfs = (sink.metadata_types & 1) != 0 ? sink.eotfs : 0;
    expect_tri_state(values.hdr_gamma, (offered.eotfs & HDMI2_EOTF_GAMMA) != 0, (eotfs & 2) != 0, "HDR with gamma");
    expect_tri_state(values.hdr_pq, (offered.eotfs & HDMI2_EOTF_PQ) != 0, (eotfs & 4) != 0, "PQ");
    expect_tri_state(values.hdr_hlg, (offered.eotfs & HDMI2_EOTF_HLG) != 0, (eotfs & 8) != 0, "HLG");
    expect_tri_state(values.bt2020_rgb, (offered.colorimetry & 0x80) != 0, (sink.colorimetry & 0x80) != 0, "RGB");
    expect_tri_state(values.bt2020_ycc, (offered.colorimetry & 0x40) != 0, (sink.colorimetry & 0x40) != 0, "YCC");
    expect_tri_state(values.bt2020_cycc, (offered.colorimetry & 0x20) != 0, (sink.colorimetry & 0x20) != 0, "cYCC");
    expect_tri_state(values.rgb_quantization, offered.rgb_quantization != 0, sink.rgb_quantization != 0, "RGB range");
    expect_tri_state(values.ycc_quantization, offered.ycc_quantization != 0, sink.ycc_quantization != 0, "YCC range");
    expect_tri_state(values.allm, offered.allm != 0, sink.allm != 0, "ALLM");
    EXPECT_EQ(offered.video_capability_present, 1);
    if (offered.vrr_present != 0) {
      ++with_vrr;
      EXPECT_GE(offered.vrr_min, values.vrr_min);
      EXPECT_LE(offered.vrr_min, 48);
      EXPECT_TRUE(offered.vrr_max == 0 || offered.vrr_max >= 100);
      const auto within = [&](u32 limit) { return limit == 0 || (offered.vrr_max != 0 && offered.vrr_max <= limit); };
      EXPECT_TRUE(within(static_cast<u32>(values.vrr_max)));
      if (values.vrr == 2) {
        EXPECT_GE(offered.vrr_min, sink.vrr_min);
        EXPECT_TRUE(within(sink.vrr_max));
      }
    }
    const auto expect_passed = [&](const hdmi2_block_t &block, const hdmi2_block_t &of_sink, i32 key) {
      if (block.length == 0) return;
      ++passed;
      EXPECT_EQ(key, 1);
      EXPECT_EQ(bytes_t(block.payload, block.payload + sizeof block.payload),
                bytes_t(of_sink.payload, of_sink.payload + sizeof of_sink.payload));
    };
    expect_passed(offered.hdr_dynamic, sink.hdr_dynamic, values.pass_hdr_dynamic);
    expect_passed(offered.hdr10plus, sink.hdr10plus, values.pass_hdr10plus);
    expect_passed(offered.dolby_vision, sink.dolby_vision, values.pass_dolby_vision);
    expect_passed(offered.freesync, sink.freesync, values.pass_freesync);
  });
  expect_at_least(100, passed, "blocks passed on");
  expect_at_least(300, with_vrr, "ranges of refresh rates");
}

/// The one decision on a candidate or value; null without one, and a failure with several.
const compose_decision_t *decision_on(const observed_t &observed, compose_subject subject, u32 code) {
  const compose_decision_t *found = nullptr;
  for (const compose_decision_t &decision : observed.decisions) {
    if (decision.subject != subject || decision.code != code) continue;
    EXPECT_EQ(found, nullptr) << compose_subject_string(subject) << " " << code << " twice";
    found = &decision;
  }
  return found;
}

TEST(RandomHdmi2Composition, IsExplainedAsItIsDecoded) {
  u32 explained = 0;
  for_each_composition(2500, [&](const situation_t &, const hdmi2_values_t &values, const observed_t &observed) {
    const hdmi2_t &offered = observed.offered;
    std::set<u32> named = listed(values.vic_priority_list);
    for (const u32 vic : listed(values.vic_addition_list))
      named.insert(vic);
    for (const u32 vic : extended_vics(observed.sink.svds, observed.sink.svd_count))
      named.insert(vic);
    for (const u32 vic : extended_vics(observed.sink.y420_vics, observed.sink.y420_count))
      named.insert(vic);
    u32 modes = 0;
    for (const compose_decision_t &decision : observed.decisions) {
      if (decision.subject == COMPOSE_SUBJECT_EXTENDED_MODE) ++modes;
      EXPECT_TRUE(decision.subject != COMPOSE_SUBJECT_VIDEO_MODE || decision.code <= 64) << decision.code;
      EXPECT_NE(decision.verdict, 0U);
      EXPECT_NE(decision.reason, 0U);
    }
    EXPECT_EQ(modes, named.size());
    const auto expect_offered = [&](compose_subject subject, u32 code, bool is_there) {
      ++explained;
      const compose_decision_t *const decision = decision_on(observed, subject, code);
      ASSERT_NE(decision, nullptr) << compose_subject_string(subject) << " " << code;
      EXPECT_EQ(decision->verdict != COMPOSE_VERDICT_LEFT_OUT, is_there)
          << compose_subject_string(subject) << " " << code << ": " << compose_reason_string(decision->reason);
    };
    const auto place_of = [](const u8 *codes, u32 count, u32 vic) {
      const u8 *const found = std::find(codes, codes + count, static_cast<u8>(vic));
      return found == codes + count ? -1 : static_cast<i32>(found - codes);
    };
    for (const u32 vic : named) {
      const compose_decision_t *const decision = decision_on(observed, COMPOSE_SUBJECT_EXTENDED_MODE, vic);
      ASSERT_NE(decision, nullptr) << vic;
      const bool in_420 = decision->reason == COMPOSE_REASON_ONLY_IN_420;
      EXPECT_EQ(decision->position, in_420 ? place_of(offered.y420_vics, offered.y420_count, vic)
                                           : place_of(offered.svds, offered.svd_count, vic))
          << vic;
      EXPECT_EQ(decision->verdict != COMPOSE_VERDICT_LEFT_OUT, decision->position >= 0) << vic;
    }
    for (const hdmi2_eotf eotf : {HDMI2_EOTF_GAMMA, HDMI2_EOTF_PQ, HDMI2_EOTF_HLG})
      expect_offered(COMPOSE_SUBJECT_HDR, eotf, (offered.eotfs & eotf) != 0);
    for (const u32 color_space : {0x80U, 0x40U, 0x20U, 0x02U, 0x01U})
      expect_offered(COMPOSE_SUBJECT_COLORIMETRY, color_space, (offered.colorimetry & color_space) != 0);
    expect_offered(COMPOSE_SUBJECT_DEEP_COLOR_420, 30, offered.dc_30bit_420 != 0);
    expect_offered(COMPOSE_SUBJECT_DEEP_COLOR_420, 36, offered.dc_36bit_420 != 0);
    expect_offered(COMPOSE_SUBJECT_QUANTIZATION, 0, offered.rgb_quantization != 0);
    expect_offered(COMPOSE_SUBJECT_QUANTIZATION, 1, offered.ycc_quantization != 0);
    expect_offered(COMPOSE_SUBJECT_ALLM, offered.allm, offered.allm != 0);
    expect_offered(COMPOSE_SUBJECT_VRR, offered.vrr_present != 0 ? offered.vrr_min : 0, offered.vrr_present != 0);
    expect_offered(COMPOSE_SUBJECT_UHD_VIC, offered.uhd_vic, offered.uhd_vic != 0);
    expect_offered(COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_HDR_DYNAMIC, offered.hdr_dynamic.length != 0);
    expect_offered(COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_HDR10PLUS, offered.hdr10plus.length != 0);
    expect_offered(COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_DOLBY_VISION, offered.dolby_vision.length != 0);
    expect_offered(COMPOSE_SUBJECT_PASSED_BLOCK, COMPOSE_ROOM_FREESYNC, offered.freesync.length != 0);
    const auto rate = std::find_if(observed.decisions.begin(), observed.decisions.end(),
                                   [](const auto &decision) { return decision.subject == COMPOSE_SUBJECT_LINK_RATE; });
    ASSERT_NE(rate, observed.decisions.end());
    EXPECT_EQ(rate->code > 340 ? rate->code : 0, offered.max_tmds_rate);
    // The base block and the HDMI block are explained as they stand, too.
    test_support::scoped_edid_t record;
    test_support::output_of([&] { decode_edid_extensions(observed.bytes.data() + 128, 128, record.get()); });
    EXPECT_NE(decision_on(observed, COMPOSE_SUBJECT_TMDS_CLOCK, record.get()->max_tmds_clock), nullptr);
    expect_offered(COMPOSE_SUBJECT_DEEP_COLOR, 30, record.get()->dc_30bit != 0);
    expect_offered(COMPOSE_SUBJECT_DEEP_COLOR, 36, record.get()->dc_36bit != 0);
  });
  expect_at_least(20000, explained, "explained values");
}

TEST(RandomHdmi2Composition, OfAnySinkFits) {
  for_each_run(2500, [](random_source_t &random) {
    situation_t situation = random_situation(random);
    situation.sink = {};
    situation.sink.bytes = random_bytes_of_a_sink(random);
    const hdmi2_values_t values = random_hdmi2_values(random);
    observed_t observed;
    values_of_t platform(situation.platform);
    observed.output = test_support::output_of([&] {
      observed.result = test_support::compose_observed(situation.sink.bytes, observed.bytes, &situation.settings,
                                                       platform.get(), nullptr, nullptr, &values);
    });
    if (!observed.result) return;
    EXPECT_EQ(test_support::block_sum(observed.bytes.data()), 0);
    EXPECT_EQ(test_support::block_sum(observed.bytes.data() + 128), 0);
    EXPECT_LE(observed.bytes[130], 109);
  });
}

}  // namespace
}  // namespace properties
