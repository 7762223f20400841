// An observed composition when memory runs out at any of its allocations: it composes, but tells nothing.
#include <gtest/gtest.h>

#include <iterator>
#include <string>
#include <vector>

#include "failure_table.h"
#include "sample.h"
#include "support/allocation_ledger.h"
#include "support/failing_allocation.h"
#include "support/observation.h"
#include "support/output_capture.h"

namespace robustness {
namespace {

using test_support::allocation_ledger_t;
using test_support::bytes_t;
using test_support::failing_allocation_t;
using test_support::output_of;

/// Keeps copies without a heap of the tests' own, where every allocation counts.
struct told_t {
  compose_decision_t records[128];
  u32 count = 0;
};

void keep(const compose_decision_t *decision, void *context) {
  auto *const told = static_cast<told_t *>(context);
  ASSERT_LT(told->count, std::size(told->records));
  told->records[told->count++] = *decision;
}

/// What came of a composition.
struct outcome_t {
  std::string words;
  std::string output;

  bool operator==(const outcome_t &) const = default;
};

std::ostream &operator<<(std::ostream &out, const outcome_t &outcome) {
  return out << outcome.output << "-> " << outcome.words;
}

class FailingObservation : public testing::Test {
 protected:
  FailingObservation() {
    rich_configuration().write_to(tree_);
    rich_configuration().write_to(values_.get());
  }

  std::string compose_with(compose_observer_t observer) {
    constexpr std::size_t margin = 64;
    bytes_t memory(margin + 256 + margin, 0xA5);
    told_ = {};
    test_support::composition_t composition;
    const compose_cfg_t settings = rich_settings();
    composition.result = test_support::compose_observed(sink_, std::span(memory).subspan(margin, 256), &settings, from_,
                                                        observer, &told_);
    composition.bytes.assign(memory.begin() + margin, memory.end() - margin);
    memory.erase(memory.begin() + margin, memory.end() - margin);
    composition.rest_untouched = memory == bytes_t(2 * margin, 0xA5);
    if (!composition.result) {
      EXPECT_EQ(told_.count, 0U);
    }
    return words_of(composition);
  }

  /// With the @p nth allocation failing; nothing may be lost.
  outcome_t failing_at(int nth, compose_observer_t observer) {
    outcome_t outcome;
    const allocation_ledger_t ledger;
    outcome.output = output_of([&] {
      const failing_allocation_t failing(nth);
      outcome.words = compose_with(observer);
      EXPECT_TRUE(failing.happened());
    });
    EXPECT_EQ(ledger.outstanding(), 0);
    return outcome;
  }

  int allocations_with(compose_observer_t observer) {
    const allocation_ledger_t ledger;
    EXPECT_EQ(output_of([&] { whole_ = compose_with(observer); }), "");
    EXPECT_EQ(ledger.outstanding(), 0);
    return ledger.allocated();
  }

  /// Without its entry, or without its payload: a decision's two allocations.
  static bool is_failed_decision(const outcome_t &outcome) {
    for (const char *what : {"the entry", "the data storage"}) {
      const std::string bug = test_support::bug_line(
          "linked_list", "ll_create_entry", std::string("calloc failed to allocate memory for ") + what + ". ptr:PTR");
      if (outcome.output ==
          bug + test_support::error_line("edid_composer", "compose_edid_internal", "Failed creating entry.")) {
        return true;
      }
    }
    return false;
  }

  void expect_same_failures_but_for_decisions();

  void expect_whole_records() const {
    for (u32 i = 0; i < told_.count; ++i) {
      const compose_decision_t &record = told_.records[i];
      EXPECT_EQ(record.size, sizeof record);
      EXPECT_STRNE(compose_subject_string(record.subject), "unknown");
      EXPECT_STRNE(compose_verdict_string(record.verdict), "unknown");
      EXPECT_STRNE(compose_reason_string(record.reason), "unknown");
    }
  }

  test_support::configuration_tree_t tree_;
  test_support::scoped_values_t values_;
  const platform_values_t *from_ = values_.get();  ///< Null: the tree.
  bytes_t sink_ = rich_sink().build();
  std::string whole_;  ///< The composition when memory lasts.
  told_t told_;
};

/// In the order of the allocations, an observed composition says and leaves what the unobserved one does; in between, a
/// decision that has no memory is all that fails, and keeps all decisions from being told: what had been decided
/// without it might be wrong.
void FailingObservation::expect_same_failures_but_for_decisions() {
  std::vector<outcome_t> expected;
  const int unobserved = allocations_with(nullptr);
  for (int nth = 1; nth <= unobserved; ++nth)
    expected.push_back(failing_at(nth, nullptr));

  const int observed = allocations_with(keep);
  const u32 decisions = told_.count;
  std::vector<outcome_t> actual;
  for (int nth = 1; nth <= observed; ++nth) {
    SCOPED_TRACE("allocation " + std::to_string(nth));
    const outcome_t outcome = failing_at(nth, keep);
    expect_whole_records();
    if (is_failed_decision(outcome)) {
      EXPECT_EQ(outcome.words, whole_);
      EXPECT_EQ(told_.count, 0U);
    } else {
      actual.push_back(outcome);
    }
  }
  EXPECT_EQ(actual, expected);
  EXPECT_EQ(observed - static_cast<int>(actual.size()), 2 * static_cast<int>(decisions));
}

TEST_F(FailingObservation, NeedsOneEntryForEachDecision) {
  const int unobserved = allocations_with(nullptr);
  EXPECT_EQ(told_.count, 0U);
  const int observed = allocations_with(keep);
  EXPECT_GT(told_.count, 30U);
  EXPECT_EQ(observed - unobserved, 2 * static_cast<int>(told_.count));
  expect_whole_records();
}

TEST_F(FailingObservation, WithTheCallersValuesComposesWhenOnlyADecisionHasNoMemory) {
  expect_same_failures_but_for_decisions();
}

TEST_F(FailingObservation, WithItsOwnConfigurationComposesWhenOnlyADecisionHasNoMemory) {
  from_ = nullptr;
  expect_same_failures_but_for_decisions();
}

TEST_F(FailingObservation, SurvivesWithoutAnyMemoryFromAnyAllocationOn) {
  static_cast<void>(allocations_with(keep));
  expect_survival([this] { return compose_with(keep); },
                  [this](const std::string &words) { return words == "refused\n" || words.size() == whole_.size(); });
}

// The decisions of the last stage are the last to be made: without memory for them, everything is composed.
TEST_F(FailingObservation, WithoutMemoryForTheLastDecisionsStillComposes) {
  const int observed = allocations_with(keep);
  std::string words;
  const std::string output = output_of([&] {
    const failing_allocation_t failing(observed - 1, test_support::failing_t::all_from_there_on);
    words = compose_with(keep);
  });
  EXPECT_EQ(words, whole_);
  EXPECT_EQ(told_.count, 0U);
  EXPECT_EQ(test_support::count_of(output, "BUG: calloc failed"), 1);
}

}  // namespace
}  // namespace robustness
