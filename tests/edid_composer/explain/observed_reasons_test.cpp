// Every reason that an observer can be told, with the whole record that tells it.
#include <gtest/gtest.h>

#include <set>

#include "edid_composer/explain/observed_cases.h"

namespace observed {
namespace {

std::vector<case_t> all_cases() {
  std::vector<case_t> cases;
  for (const auto &group : {video_cases(), audio_cases(), selection_cases(), capability_cases(), hdmi2_cases()})
    cases.insert(cases.end(), group.begin(), group.end());
  return cases;
}

composition_t observe_case(const case_t &reason_case) {
  situation_t situation;
  reason_case.arrange(situation);
  return observe(situation);
}

/// Tells whether another record of the composition may be about the same thing: audio formats and timings without a VIC
/// have no code of their own.
bool is_about(const compose_decision_t &decision, const compose_decision_t &expected) {
  if (decision.subject != expected.subject) return false;
  if (decision.subject == COMPOSE_SUBJECT_AUDIO_FORMAT || decision.subject == COMPOSE_SUBJECT_SINK_TIMING) {
    return decision.origins == expected.origins && decision.sink_index == expected.sink_index &&
           decision.priority_index == expected.priority_index;
  }
  // Of these, there is one.
  const bool of_many = decision.subject <= COMPOSE_SUBJECT_4K_MODE || decision.subject == COMPOSE_SUBJECT_DEEP_COLOR ||
                       decision.subject == COMPOSE_SUBJECT_LATENCY || decision.subject >= COMPOSE_SUBJECT_EXTENDED_MODE;
  return !of_many || decision.code == expected.code;
}

class ObservedReason : public testing::TestWithParam<case_t> {};

TEST_P(ObservedReason, IsToldByOneRecord) {
  const composition_t composition = observe_case(GetParam());
  ASSERT_TRUE(composition.result);
  const compose_decision_t &expected = GetParam().told.record();
  std::vector<std::string> told;
  for (const auto &decision : composition.decisions) {
    if (is_about(decision, expected)) told.push_back(words_of(decision));
  }
  EXPECT_EQ(told, std::vector<std::string>{words_of(expected)});
}

INSTANTIATE_TEST_SUITE_P(Composition, ObservedReason, testing::ValuesIn(all_cases()),
                         [](const auto &named) { return std::string(named.param.name); });

TEST(ObservedReasons, AllOccur) {
  std::set<u32> told;
  std::set<u32> expected;
  for (const auto &reason_case : all_cases()) {
    expected.insert(reason_case.told.record().reason);
    for (const auto &decision : observe_case(reason_case).decisions)
      told.insert(decision.reason);
  }
  std::set<u32> all;
  for (u32 reason = 1; std::string(compose_reason_string(reason)) != "unknown"; ++reason)
    all.insert(reason);
  EXPECT_EQ(all.size(), 83U);
  EXPECT_EQ(told, all);
  EXPECT_EQ(expected, all) << "a reason without a case of its own";
}

}  // namespace
}  // namespace observed
