// Several threads that compose at once.
#include <gtest/gtest.h>

#include <atomic>
#include <functional>
#include <string>
#include <thread>
#include <vector>

#include "sample.h"
#include "support/output_capture.h"
#include "support/patterns.h"
#include "support/request.h"

namespace robustness {
namespace {

using test_support::bytes_t;
using test_support::compose;
using test_support::composition_t;
using test_support::request_t;

constexpr std::size_t thread_count = 8;
constexpr int compositions_of_each = 200;

// A sink for each thread, no two alike.
struct job_t {
  bytes_t sink;
  compose_cfg_t cfg;
};

std::vector<job_t> jobs() {
  std::vector<job_t> all;
  for (u32 i = 0; i < thread_count; ++i) {
    sample_sink_t sink = rich_sink();
    sink.base_timings = {i % 2 == 0 ? 16u : 4u, 5};
    sink.video.push_back(static_cast<u8>(1 + i % 3));
    sink.audio[1] = static_cast<u8>(1 + i);
    if (i == 6) {
      sink.base_timings = {31, 20};
      sink.video = {31, 19, 20, 17};
    }
    compose_cfg_t cfg = rich_settings();
    cfg.port = i;
    cfg.hdmi_3d_mode = static_cast<i32>(i % 3);
    all.push_back({i == 7 ? bytes_t{} : sink.build(), cfg});
  }
  return all;
}

// What one thread composes, one job after the other.
std::vector<composition_t> composed_alone(const platform_values_t *values) {
  std::vector<composition_t> compositions;
  for (const job_t &job : jobs())
    compositions.push_back(compose(job.sink, job.cfg, values));
  return compositions;
}

// Composes one job over and over; the number of times that it came out otherwise.
int deviations(const job_t &job, const platform_values_t *values, const composition_t &expected) {
  int count = 0;
  for (int i = 0; i < compositions_of_each; ++i) {
    const composition_t composition = compose(job.sink, job.cfg, values);
    if (!composition.result || !composition.rest_untouched || composition.bytes != expected.bytes ||
        composition.spa_offset != expected.spa_offset) {
      ++count;
    }
  }
  return count;
}

// Lets each thread do @p work, which is told its number.
void run_on_threads(const std::function<void(std::size_t)> &work) {
  std::vector<std::thread> threads;
  for (std::size_t i = 0; i < thread_count; ++i)
    threads.emplace_back([&, i] { work(i); });
  for (std::thread &thread : threads)
    thread.join();
}

// The stacks of two threads are not at the same place.
std::string without_addresses(const std::string &lines) {
  return test_support::replaced(lines, "0x[0-9a-f]{9,16}\\b", "PTR");
}

// Lets all threads compose at once, and another one do @p meanwhile over and over until they are through.
void expect_the_same_of_all_threads(const platform_values_t *values, const std::function<void()> &meanwhile) {
  const std::vector<job_t> all = jobs();
  const std::vector<composition_t> expected = composed_alone(values);
  for (std::size_t i = 0; i < thread_count; ++i) {
    ASSERT_TRUE(expected[i].result);
    for (std::size_t j = 0; j < i; ++j)
      ASSERT_NE(expected[i].bytes, expected[j].bytes) << i << " " << j;
  }
  std::atomic<bool> running{true};
  std::atomic<int> deviating{0};
  std::thread other([&] {
    while (running.load())
      meanwhile();
  });
  run_on_threads([&](std::size_t i) { deviating += deviations(all[i], values, expected[i]); });
  running = false;
  other.join();
  EXPECT_EQ(deviating.load(), 0);
}

void keep_tracing_off() {
  debug_enable(false);
  EXPECT_FALSE(debug_enabled());
}

class Threads : public testing::Test {
 protected:
  Threads() {
    rich_configuration().write_to(tree_);
    rich_configuration().write_to(values_.get());
  }

  test_support::configuration_tree_t tree_;
  test_support::scoped_values_t values_;
};

TEST_F(Threads, ComposingFromTheSameValuesGiveWhatOneThreadGives) {
  EXPECT_EQ(test_support::raw_output_of([&] { expect_the_same_of_all_threads(values_.get(), keep_tracing_off); }), "");
}

TEST_F(Threads, ReadingTheConfigurationGiveWhatOneThreadGives) {
  EXPECT_EQ(test_support::raw_output_of([&] { expect_the_same_of_all_threads(nullptr, keep_tracing_off); }), "");
}

TEST_F(Threads, ReceiveTheLinesOfTheirOwnCompositions) {
  const std::vector<job_t> all = jobs();
  debug_enable(true);
  std::atomic<int> deviating{0};
  const std::string output = test_support::raw_output_of([&] {
    std::vector<std::string> expected;
    for (const job_t &job : all) {
      request_t request(job.sink, job.cfg, nullptr);
      ASSERT_TRUE(request.compose_logged());
      expected.push_back(without_addresses(request.lines));
    }
    run_on_threads([&](std::size_t i) {
      request_t request(all[i].sink, all[i].cfg, nullptr);
      for (int k = 0; k < 10; ++k) {
        request.compose_logged();
        if (without_addresses(request.lines) != expected[i]) ++deviating;
      }
    });
  });
  debug_enable(false);
  EXPECT_EQ(deviating.load(), 0);
  EXPECT_EQ(output, "");
}

TEST_F(Threads, ComposeWithHdmi2AtOnce) {
  tree_.set("hdmi2.enable", 1);
  tree_.set("hdmi2.tmds_limit", 600);
  for (const i32 vic : {97, 96, 95}) {
    tree_.add("hdmi2.vic_priority_list", vic);
    tree_.add("hdmi2.vic_addition_list", vic);
  }
  const std::vector<job_t> all = jobs();
  std::vector<bytes_t> expected;
  for (const job_t &job : all) {
    request_t request(job.sink, job.cfg, nullptr);
    ASSERT_TRUE(request.compose());
    EXPECT_NE(request.new_edid, compose(job.sink, job.cfg, nullptr).bytes);
    expected.push_back(request.new_edid);
  }
  std::atomic<int> deviating{0};
  run_on_threads([&](std::size_t i) {
    request_t request(all[i].sink, all[i].cfg, nullptr);
    for (int k = 0; k < compositions_of_each; ++k) {
      if (!request.compose() || request.new_edid != expected[i]) ++deviating;
    }
  });
  EXPECT_EQ(deviating.load(), 0);
}

TEST_F(Threads, DecodeAndPrintAtOnce) {
  const bytes_t sink = rich_sink().build();
  const std::string report = test_support::raw_output_of([&] { print_edid(sink.data(), 256, 1, "Sample"); });
  const std::string all = test_support::raw_output_of(
      [&] { run_on_threads([&](std::size_t) { print_edid(sink.data(), 256, 1, "Sample"); }); });
  // Lines of several threads may interleave, but none is lost.
  EXPECT_EQ(all.size(), thread_count * report.size());
}

TEST_F(Threads, ComposeTheSameWhileTracingIsSwitchedOnAndOff) {
  const std::vector<job_t> all = jobs();
  const std::vector<composition_t> expected = composed_alone(values_.get());
  std::atomic<int> deviating{0};
  const std::string output = test_support::raw_output_of([&] {
    run_on_threads([&](std::size_t i) {
      for (int k = 0; k < 25; ++k) {
        debug_enable(k % 2 == 0);
        if (compose(all[i].sink, all[i].cfg, values_.get()).bytes != expected[i].bytes) ++deviating;
      }
    });
    debug_enable(false);
  });
  EXPECT_EQ(deviating.load(), 0);
  EXPECT_NE(output, "");
}

}  // namespace
}  // namespace robustness
