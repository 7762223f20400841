#include "failure_table.h"

#include <gtest/gtest.h>

#include "support/allocation_ledger.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"

namespace robustness {
namespace {

using test_support::allocation_ledger_t;
using test_support::failing_allocation_t;

constexpr int blocks_of_entry = 2;

// The first block of an entry is the entry, the second its payload.
std::string allocation_line(int block) {
  const std::string what = block == 0 ? "the entry" : "the data storage";
  return test_support::bug_line("linked_list", "ll_create_entry",
                                "calloc failed to allocate memory for " + what + ". ptr:PTR");
}

struct clean_run_t {
  int allocations;
  std::string output;
  std::string outcome;
};

clean_run_t run_cleanly(const operation_t &operation, const capture_t &capture) {
  clean_run_t run{};
  const allocation_ledger_t ledger;
  run.output = capture([&] { run.outcome = operation(); });
  run.allocations = ledger.allocated();
  EXPECT_EQ(ledger.outstanding(), 0);
  return run;
}

void expect_failure(int nth, const std::string &output, const std::string &outcome, const operation_t &operation,
                    const capture_t &capture) {
  std::string actual_outcome;
  const allocation_ledger_t ledger;
  const std::string actual_output = capture([&] {
    const failing_allocation_t failing(nth);
    actual_outcome = operation();
    EXPECT_TRUE(failing.happened());
  });
  EXPECT_EQ(actual_output, output);
  EXPECT_EQ(actual_outcome, outcome);
  EXPECT_EQ(ledger.outstanding(), 0);
}

void expect_same(const clean_run_t &run, const clean_run_t &expected) {
  EXPECT_EQ(run.allocations, expected.allocations);
  EXPECT_EQ(run.output, expected.output);
  EXPECT_EQ(run.outcome, expected.outcome);
}

}  // namespace

std::function<std::string(int, const std::string &)> lines(const std::string &behind) {
  return [behind](int, const std::string &bug) { return bug + behind; };
}

std::function<std::string(int)> always(const std::string &outcome) {
  return [outcome](int) { return outcome; };
}

void expect_failures(const std::vector<stretch_t> &table, const operation_t &operation, const capture_t &capture) {
  const clean_run_t clean = run_cleanly(operation, capture);
  int nth = 0;
  for (const stretch_t &stretch : table) {
    for (int entry = 0; entry < stretch.entries; ++entry) {
      for (int block = 0; block < blocks_of_entry; ++block) {
        ++nth;
        SCOPED_TRACE("allocation " + std::to_string(nth) + ", " + stretch.name + " " + std::to_string(entry));
        expect_failure(nth, stretch.output(entry, allocation_line(block)), stretch.outcome(entry), operation, capture);
        expect_same(run_cleanly(operation, capture), clean);
        if (testing::Test::HasFailure()) return;
      }
    }
  }
  EXPECT_EQ(nth, clean.allocations) << "allocations in the table, and in truth";
  testing::Test::RecordProperty("failed_allocations", nth);
}

void expect_survival(const operation_t &operation, const std::function<bool(const std::string &)> &is_acceptable) {
  const clean_run_t clean = run_cleanly(operation, test_support::output_of);
  for (int nth = 1; nth <= clean.allocations; ++nth) {
    SCOPED_TRACE("from allocation " + std::to_string(nth) + " on");
    std::string outcome;
    const allocation_ledger_t ledger;
    const std::string output = test_support::output_of([&] {
      const failing_allocation_t failing(nth, test_support::failing_t::all_from_there_on);
      outcome = operation();
    });
    EXPECT_GE(test_support::count_of(output, "() BUG: calloc failed to allocate memory for "), 1);
    EXPECT_TRUE(is_acceptable(outcome)) << outcome << output;
    EXPECT_EQ(ledger.outstanding(), 0);
    expect_same(run_cleanly(operation, test_support::output_of), clean);
    if (testing::Test::HasFailure()) return;
  }
  testing::Test::RecordProperty("failed_allocations", clean.allocations);
}

}  // namespace robustness
