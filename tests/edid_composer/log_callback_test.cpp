// What a log callback may do, and what its lines say.
#include <gtest/gtest.h>

#include <functional>
#include <set>
#include <string>

#include "support/configuration_tree.h"
#include "support/output_capture.h"
#include "support/records.h"
#include "support/request.h"

namespace {

using test_support::bytes_t;
using test_support::raw_output_of;
using test_support::request_t;

const bytes_t &sink() {
  static const bytes_t bytes = test_support::join(test_support::base_block_builder_t().extensions(1).build(),
                                                  test_support::extension_builder_t()
                                                      .block(test_support::video_block({16, 4}))
                                                      .block(test_support::hdmi_block({0x10, 0x00}))
                                                      .build());
  return bytes;
}

/// Composes with tracing on.
class LogCallback : public testing::Test {
 protected:
  LogCallback() {
    tree_.fill_completely();
    debug_enable(true);
    EXPECT_TRUE(request_.compose_logged());
    usual_lines_ = test_support::masked(request_.lines);
  }
  ~LogCallback() override { debug_enable(false); }

  /// What stands on standard output after a composition whose callback does @p also at each line.
  std::string output_with(const std::function<void()> &also) {
    const std::string output =
        raw_output_of([&] { EXPECT_TRUE(request_.compose_logged([&](const compose_log_line_t &) { also(); })); });
    return test_support::masked(output);
  }
  void expect_usual_lines(const request_t &request) const {
    EXPECT_EQ(test_support::masked(request.lines), usual_lines_);
  }

  test_support::configuration_tree_t tree_;
  request_t request_{sink(), test_support::plain_settings(), nullptr};
  request_t other_{sink(), test_support::plain_settings(), nullptr};
  std::string usual_lines_;
};

TEST_F(LogCallback, ReceivesLinesOfEveryKindWithTheirSites) {
  bytes_t malformed = sink();
  malformed.back() ^= 1;
  request_t request(malformed, test_support::plain_settings(), nullptr);
  std::set<std::string> modules;
  std::set<u32> kinds;
  EXPECT_TRUE(request.compose_logged([&](const compose_log_line_t &line) {
    EXPECT_EQ(line.size, sizeof line);
    const bool is_text = line.kind == COMPOSE_LOG_TEXT;
    EXPECT_EQ(std::string(line.module).empty(), is_text) << line.text;
    EXPECT_EQ(std::string(line.function).empty(), is_text) << line.text;
    EXPECT_EQ(line.line == 0, is_text) << line.text;
    modules.insert(line.module);
    kinds.insert(line.kind);
  }));
  EXPECT_EQ(modules, (std::set<std::string>{"", "edid_composer", "edid_decode_encode", "utility"}));
  EXPECT_EQ(kinds, (std::set<u32>{COMPOSE_LOG_ERROR, COMPOSE_LOG_TRACE, COMPOSE_LOG_TEXT}));
}

TEST_F(LogCallback, MayPrintAReportWhichGoesToStandardOutput) {
  const std::string report = test_support::masked(raw_output_of([] { print_edid(sink().data(), 256, 1, "Callback"); }));
  std::string reports;
  for (int lines = test_support::count_of(usual_lines_, "\n"); lines > 0; --lines)
    reports += report;
  // A diagnostic whose message ends in a newline is one line of two.
  const std::string output = output_with([] { print_edid(sink().data(), 256, 1, "Callback"); });
  EXPECT_EQ(reports.substr(0, output.size()), output);
  EXPECT_GT(output.size(), report.size() * 100);
  expect_usual_lines(request_);
}

TEST_F(LogCallback, MayComposeWithACallbackOfItsOwn) {
  EXPECT_EQ(output_with([&] {
              EXPECT_TRUE(other_.compose_logged());
              expect_usual_lines(other_);
            }),
            "");
  expect_usual_lines(request_);
  EXPECT_EQ(other_.new_edid, request_.new_edid);
}

TEST_F(LogCallback, MayComposeWithoutOne) {
  bool is_first = true;
  EXPECT_EQ(output_with([&] {
              const bool composed = !is_first || other_.compose();
              EXPECT_TRUE(composed);
              is_first = false;
            }),
            usual_lines_);
  expect_usual_lines(request_);
}

TEST_F(LogCallback, MaySwitchTracingOff) {
  EXPECT_EQ(output_with([] { debug_enable(false); }), "");
  EXPECT_EQ(test_support::count_of(request_.lines, " \t\t\t"), 1);
}

TEST_F(LogCallback, ReceivesNothingOfWhatIsPrintedAfterTheCall) {
  EXPECT_NE(raw_output_of([] { print_edid(sink().data(), 256, 1, "After"); }), "");
  expect_usual_lines(request_);
}

}  // namespace
