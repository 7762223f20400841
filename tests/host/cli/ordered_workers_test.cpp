// Work on several threads, with the results in order.
#include "batch/ordered_workers.h"

#include <gmock/gmock.h>

#include <atomic>
#include <chrono>
#include <stdexcept>
#include <thread>

namespace edid_cli {
namespace {

batch_result_t result_of(std::size_t number) {
  return {.failure = "", .output = std::to_string(number), .diagnostics = {}, .passed_over = ""};
}

TEST(OrderedWorkers, HandOverEachResultInOrder) {
  for (const std::size_t jobs : {1U, 2U, 7U, 256U}) {
    std::size_t due = 0;
    run_in_order(
        100, jobs,
        [](std::size_t number) {
          std::this_thread::sleep_for(std::chrono::microseconds(number % 3 * 100));
          return result_of(number);
        },
        [&due](std::size_t number, const batch_result_t &result) {
          EXPECT_EQ(number, due);
          EXPECT_EQ(result.output, std::to_string(due));
          ++due;
        });
    EXPECT_EQ(due, 100U) << jobs;
  }
}

TEST(OrderedWorkers, HaveNothingToDoWithoutWork) {
  run_in_order(
      0, 4, [](std::size_t) -> batch_result_t { throw std::logic_error("there is no work"); },
      [](std::size_t, const batch_result_t &) { FAIL(); });
}

// So the memory for results stays the same however many there are.
TEST(OrderedWorkers, WaitForAResultThatIsSlow) {
  constexpr std::size_t jobs = 3;
  std::atomic<std::size_t> begun = 0;
  std::size_t taken = 0;
  std::size_t furthest = 0;
  run_in_order(
      200, jobs,
      [&begun](std::size_t number) {
        ++begun;
        if (number == 0) {
          std::this_thread::sleep_for(std::chrono::milliseconds(50));
        }
        return result_of(number);
      },
      [&](std::size_t, const batch_result_t &) {
        furthest = std::max(furthest, begun - taken);
        ++taken;
      });
  EXPECT_GT(furthest, 1U);
  EXPECT_LE(furthest, 4 * jobs + 1);
}

TEST(OrderedWorkers, StopWhenNobodyTakesTheResults) {
  std::atomic<int> begun = 0;
  EXPECT_THROW(run_in_order(
                   100000, 4,
                   [&begun](std::size_t number) {
                     ++begun;
                     return result_of(number);
                   },
                   [](std::size_t, const batch_result_t &) { throw std::runtime_error("enough"); }),
               std::runtime_error);
  EXPECT_LT(begun, 100);
}

}  // namespace
}  // namespace edid_cli
