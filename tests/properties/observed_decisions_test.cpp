// What an observer is told: one verdict for each candidate, and nothing but what the bytes say.
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <string>
#include <vector>

#include "composing_fixture.h"
#include "property_runs.h"
#include "random_sink.h"
#include "random_situation.h"
#include "support/list_contents.h"
#include "support/observation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace properties {
namespace {

using decisions_t = std::vector<compose_decision_t>;
using codes_t = std::set<u32>;
using test_support::bytes_t;
using test_support::scoped_edid_t;

/// An observed composition.
struct observed_t {
  bool result = false;
  bytes_t bytes = bytes_t(256, 0xA5);
  std::string output;
  decisions_t decisions;
};

observed_t observe(const situation_t &situation, compose_observer_t observer) {
  observed_t observed;
  values_of_t values(situation.platform);
  const bytes_t &sink = situation.sink.bytes;
  observed.output = test_support::output_of([&] {
    observed.result = test_support::compose_observed(sink, observed.bytes, &situation.settings, values.get(), observer,
                                                     &observed.decisions);
  });
  return observed;
}

void keep(const compose_decision_t *decision, void *context) {
  static_cast<decisions_t *>(context)->push_back(*decision);
}

/// A record of an EDID's blocks, as the library's decoders fill it. A composed EDID without a monitor name announces no
/// extension, but has it.
void decode(const bytes_t &bytes, bool composed, scoped_edid_t *edid) {
  test_support::output_of([&] {
    if (bytes.size() < 128 || bytes.size() % 128 != 0) return;
    if (decode_edid_block_0(bytes.data(), edid->get()) != 1) return;
    if (!composed && edid->get()->extension_count == 0) return;
    decode_edid_extensions(bytes.data() + 128, static_cast<u32>(bytes.size() - 128), edid->get());
  });
}

codes_t vics_in(const ll_list_t &modes) {
  codes_t vics;
  for (const auto &mode : test_support::elements_of<short_video_desc_t>(modes))
    vics.insert(mode.vic);
  return vics;
}

template <typename timing_t>
void add_vics(const ll_list_t &timings, const edid_t *edid, u8 (*convert)(const edid_t *, const timing_t *, u32 *),
              codes_t *vics) {
  test_support::output_of([&] {
    for (const auto &timing : test_support::elements_of<timing_t>(timings)) {
      u32 vic = 0;
      if (convert(edid, &timing, &vic) == 1) vics->insert(vic);
    }
  });
}

/// All VICs that somebody names.
codes_t named_vics(const situation_t &situation, const edid_t *sink) {
  codes_t vics = vics_in(sink->video_list);
  add_vics(sink->dtd_list, sink, convert_dtd_to_vic, &vics);
  add_vics(sink->std_timings, sink, convert_std_to_vic, &vics);
  const auto &platform = situation.platform;
  for (const auto *list : {&platform.video_50_priority, &platform.video_50_additional, &platform.video_60_priority,
                           &platform.video_60_additional}) {
    for (const auto &mode : *list)
      vics.insert(mode.first);
  }
  return vics;
}

codes_t named_4k_modes(const situation_t &situation, const edid_t *sink) {
  codes_t modes(sink->hdmi_vic, sink->hdmi_vic + sink->hdmi_vic_len);
  for (const auto *list : {&situation.platform.modes_4k_x_2k_priority, &situation.platform.modes_4k_x_2k_addition})
    modes.insert(list->begin(), std::find(list->begin(), list->end(), 0));
  return modes;
}

bool is_offered(const compose_decision_t &decision) {
  return decision.verdict != COMPOSE_VERDICT_LEFT_OUT;
}

decisions_t about(compose_subject subject, const decisions_t &all) {
  decisions_t decisions;
  std::copy_if(all.begin(), all.end(), std::back_inserter(decisions),
               [subject](const auto &decision) { return decision.subject == subject; });
  return decisions;
}

codes_t codes_of(const decisions_t &decisions) {
  codes_t codes;
  for (const auto &decision : decisions)
    codes.insert(decision.code);
  return codes;
}

codes_t offered_codes(const decisions_t &decisions) {
  codes_t codes;
  for (const auto &decision : decisions) {
    if (is_offered(decision)) codes.insert(decision.code);
  }
  return codes;
}

/// Types of the offered formats by their position.
std::vector<u32> offered_types(const decisions_t &decisions) {
  std::map<i32, u32> types;
  for (const auto &decision : decisions) {
    if (!is_offered(decision)) continue;
    EXPECT_TRUE(types.emplace(decision.position, decision.code).second) << decision.position;
  }
  std::vector<u32> in_order;
  for (const auto &[position, type] : types) {
    EXPECT_EQ(position, static_cast<i32>(in_order.size()));
    in_order.push_back(type);
  }
  return in_order;
}

std::vector<u32> types_in(const ll_list_t &formats) {
  std::vector<u32> types;
  for (const auto &format : test_support::elements_of<short_audio_desc_t>(formats))
    types.push_back(format.type);
  return types;
}

void expect_well_formed(const compose_decision_t &decision) {
  EXPECT_EQ(decision.size, sizeof(compose_decision_t));
  EXPECT_STRNE(compose_subject_string(decision.subject), "unknown");
  EXPECT_STRNE(compose_verdict_string(decision.verdict), "unknown");
  EXPECT_STRNE(compose_reason_string(decision.reason), "unknown");
  const bool candidate = decision.subject <= COMPOSE_SUBJECT_AUDIO_FORMAT;
  EXPECT_EQ(decision.origins != 0, candidate) << compose_subject_string(decision.subject);
  const bool has_place = candidate && decision.subject != COMPOSE_SUBJECT_SINK_TIMING && is_offered(decision);
  EXPECT_EQ(decision.position >= 0, has_place) << compose_subject_string(decision.subject) << ' ' << decision.code;
}

/// Not so when a data block is too long for its length field: what stands after it is then read as something else.
bool reads_as_meant(const decisions_t &decisions) {
  const compose_decision_t room = about(COMPOSE_SUBJECT_EXTENSION_ROOM, decisions).at(0);
  const auto &[needed, there, longest, most] = room.value;
  return longest <= most;
}

void expect_video_verdicts(const situation_t &situation, const edid_t *sink, const edid_t *composed,
                           const decisions_t &all) {
  const decisions_t decisions = about(COMPOSE_SUBJECT_VIDEO_MODE, all);
  codes_t expected = named_vics(situation, sink);
  for (const auto &decision : decisions) {
    if ((decision.origins & (COMPOSE_ORIGIN_CURRENT_MODE | COMPOSE_ORIGIN_LIBRARY)) != 0)
      expected.insert(decision.code);
  }
  EXPECT_EQ(codes_of(decisions), expected);
  EXPECT_EQ(decisions.size(), expected.size());
  if (!reads_as_meant(all)) return;
  EXPECT_EQ(offered_codes(decisions), vics_in(composed->video_list));
}

void expect_4k_verdicts(const situation_t &situation, const edid_t *sink, const edid_t *composed,
                        const decisions_t &all) {
  const decisions_t decisions = about(COMPOSE_SUBJECT_4K_MODE, all);
  const codes_t expected = named_4k_modes(situation, sink);
  EXPECT_EQ(codes_of(decisions), expected);
  EXPECT_EQ(decisions.size(), expected.size());
  const codes_t offered(composed->hdmi_vic, composed->hdmi_vic + composed->hdmi_vic_len);
  if (!reads_as_meant(all)) return;
  EXPECT_EQ(offered_codes(decisions), offered);
}

void expect_audio_verdicts(const situation_t &situation, const edid_t *sink, const edid_t *composed,
                           const decisions_t &all) {
  const decisions_t decisions = about(COMPOSE_SUBJECT_AUDIO_FORMAT, all);
  std::map<u32, u32> named;
  for (const auto &decision : decisions)
    ++named[decision.origins];
  EXPECT_EQ(named[COMPOSE_ORIGIN_PLATFORM_AUDIO], situation.platform.audio.size());
  EXPECT_EQ(named[COMPOSE_ORIGIN_SINK_AUDIO], types_in(sink->audio_list).size());
  EXPECT_LE(named[COMPOSE_ORIGIN_LIBRARY], 1U);
  if (!reads_as_meant(all)) return;
  EXPECT_EQ(offered_types(decisions), types_in(composed->audio_list));
}

/// What the record of a latency says that a source reads, in ms.
i32 told_latency(const compose_decision_t &decision) {
  constexpr i32 not_valid = 508;  // As it is decoded.
  if (decision.reason == COMPOSE_REASON_LATENCY_TOO_LONG) return not_valid;
  return decision.reason == COMPOSE_REASON_LATENCY_OF_BOTH ? decision.value[2] : 0;
}

void expect_latencies(const edid_t *composed, const decisions_t &decisions) {
  std::map<u32, compose_decision_t> told;
  for (const auto &decision : decisions)
    told[decision.code] = decision;
  EXPECT_EQ(told_latency(told[0]), composed->video_latency);
  EXPECT_EQ(told_latency(told[1]), composed->audio_latency);
  // Those of interlaced modes are those of progressive ones where they are not declared.
  const u32 base = is_offered(told[2]) ? 2 : 0;
  EXPECT_EQ(told_latency(told[base]), composed->i_video_latency);
  EXPECT_EQ(told_latency(told[base + 1]), composed->i_audio_latency);
  EXPECT_EQ(is_offered(told[0]), is_offered(told[1]));
  EXPECT_EQ(is_offered(told[2]), is_offered(told[3]));
}

void expect_derived_values(const edid_t *composed, const decisions_t &all) {
  std::map<u32, u32> counts;
  for (const auto &decision : all)
    ++counts[decision.subject];
  for (const auto subject : {COMPOSE_SUBJECT_NATIVE_RATE, COMPOSE_SUBJECT_GEOMETRY_LIMIT, COMPOSE_SUBJECT_CURRENT_MODE,
                             COMPOSE_SUBJECT_PHYSICAL_ADDRESS, COMPOSE_SUBJECT_TMDS_CLOCK, COMPOSE_SUBJECT_3D,
                             COMPOSE_SUBJECT_PADDING, COMPOSE_SUBJECT_EXTENSION_ROOM}) {
    EXPECT_EQ(counts[subject], 1U) << compose_subject_string(subject);
  }
  EXPECT_EQ(codes_of(about(COMPOSE_SUBJECT_DEEP_COLOR, all)), (codes_t{30, 36, 48}));
  EXPECT_EQ(codes_of(about(COMPOSE_SUBJECT_LATENCY, all)), (codes_t{0, 1, 2, 3}));
  EXPECT_EQ(counts[COMPOSE_SUBJECT_DEEP_COLOR], 3U);
  EXPECT_EQ(counts[COMPOSE_SUBJECT_LATENCY], 4U);
  if (!reads_as_meant(all)) return;
  u32 address = 0;
  for (const u8 part : composed->physical_address)
    address = address << 4 | part;
  EXPECT_EQ(about(COMPOSE_SUBJECT_PHYSICAL_ADDRESS, all).at(0).code, address);
  EXPECT_EQ(about(COMPOSE_SUBJECT_TMDS_CLOCK, all).at(0).code, composed->max_tmds_clock);
  EXPECT_EQ(about(COMPOSE_SUBJECT_3D, all).at(0).code, composed->hdmi_3d_present);
  codes_t depths;
  if (composed->dc_30bit != 0) depths.insert(30);
  if (composed->dc_36bit != 0) depths.insert(36);
  EXPECT_EQ(offered_codes(about(COMPOSE_SUBJECT_DEEP_COLOR, all)), depths);
  expect_latencies(composed, about(COMPOSE_SUBJECT_LATENCY, all));
}

/// Sinks of any bytes as well.
situation_t any_situation(random_source_t &random) {
  situation_t situation = random_situation(random);
  if (random.chance(33)) {
    situation.sink = {};
    situation.sink.bytes = random_bytes_of_a_sink(random);
  }
  return situation;
}

TEST(RandomObservation, GivesEveryCandidateOneVerdictAndOffersWhatTheBytesSay) {
  u32 as_meant = 0;
  for_each_run(2500, [&](random_source_t &random) {
    const situation_t situation = any_situation(random);
    const observed_t observed = observe(situation, keep);
    if (!observed.result) {
      EXPECT_TRUE(observed.decisions.empty());
      return;
    }
    scoped_edid_t sink;
    scoped_edid_t composed;
    decode(situation.sink.bytes, false, &sink);
    decode(observed.bytes, true, &composed);
    for (const auto &decision : observed.decisions)
      expect_well_formed(decision);
    expect_video_verdicts(situation, sink.get(), composed.get(), observed.decisions);
    expect_4k_verdicts(situation, sink.get(), composed.get(), observed.decisions);
    expect_audio_verdicts(situation, sink.get(), composed.get(), observed.decisions);
    expect_derived_values(composed.get(), observed.decisions);
    if (reads_as_meant(observed.decisions)) ++as_meant;
  });
  expect_at_least(1500, as_meant, "extensions that read as they are meant");
}

TEST(RandomObservation, ChangesNeitherBytesNorLines) {
  for_each_run(400, [&](random_source_t &random) {
    const situation_t situation = any_situation(random);
    debug_enable(random.chance(50));
    const observed_t observed = observe(situation, keep);
    const observed_t alone = observe(situation, nullptr);
    debug_enable(false);
    EXPECT_EQ(observed.result, alone.result);
    EXPECT_EQ(observed.bytes, alone.bytes);
    EXPECT_EQ(observed.output, alone.output);
    EXPECT_TRUE(alone.decisions.empty());
  });
}

}  // namespace
}  // namespace properties
