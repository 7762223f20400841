// What a log callback may do, and what its lines say.
#include <gtest/gtest.h>

#include <set>
#include <string>

#include "support/configuration_tree.h"
#include "support/output_capture.h"
#include "support/patterns.h"
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
    usual_lines_ = masked(request_.lines);
    request_.lines.clear();
    request_.request.log_context = this;
  }
  ~LogCallback() override { debug_enable(false); }

  static std::string masked(const std::string &lines) { return test_support::masked(lines); }
  static LogCallback &test(void *context) { return *static_cast<LogCallback *>(context); }

  test_support::configuration_tree_t tree_;
  request_t request_{sink(), test_support::plain_settings(), nullptr};
  request_t second_{sink(), test_support::plain_settings(), nullptr};
  std::string usual_lines_;
  int inner_failures_ = 0;
};

TEST_F(LogCallback, ReceivesLinesOfEveryModuleAndKindWithTheirSites) {
  struct seen_t {
    std::set<std::string> modules;
    std::set<u32> kinds;
  } seen;
  bytes_t malformed = sink();
  malformed.back() ^= 1;
  request_t request(malformed, test_support::plain_settings(), nullptr);
  request.request.log_context = &seen;
  request.request.log = [](const compose_log_line_t *line, void *context) {
    EXPECT_EQ(line->size, sizeof *line);
    const bool is_text = line->kind == COMPOSE_LOG_TEXT;
    EXPECT_EQ(std::string(line->module).empty(), is_text) << line->text;
    EXPECT_EQ(std::string(line->function).empty(), is_text) << line->text;
    EXPECT_EQ(line->line == 0, is_text) << line->text;
    static_cast<seen_t *>(context)->modules.insert(line->module);
    static_cast<seen_t *>(context)->kinds.insert(line->kind);
  };
  EXPECT_TRUE(request.compose());
  EXPECT_EQ(seen.modules, (std::set<std::string>{"", "edid_composer", "edid_decode_encode", "utility"}));
  EXPECT_EQ(seen.kinds, (std::set<u32>{COMPOSE_LOG_ERROR, COMPOSE_LOG_TRACE, COMPOSE_LOG_TEXT}));
}

TEST_F(LogCallback, MayPrintAReportWhichGoesToStandardOutput) {
  request_.request.log = [](const compose_log_line_t *line, void *context) {
    print_edid(sink().data(), 256, 1, "Callback");
    test(context).request_.lines += test_support::rendered(*line);
  };
  debug_enable(false);
  const std::string report = raw_output_of([] { print_edid(sink().data(), 256, 1, "Callback"); });
  const std::size_t lines = static_cast<std::size_t>(test_support::count_of(usual_lines_, "\n"));
  debug_enable(true);
  const std::string output = raw_output_of([&] { EXPECT_TRUE(request_.compose()); });
  EXPECT_EQ(masked(request_.lines), usual_lines_);
  EXPECT_GT(output.size(), report.size() * lines / 2);
  EXPECT_NE(output.find("Callback"), std::string::npos);
}

TEST_F(LogCallback, MayComposeWithACallbackOfItsOwn) {
  request_.request.log = [](const compose_log_line_t *line, void *context) {
    LogCallback &it = test(context);
    if (!it.second_.compose_logged() || masked(it.second_.lines) != it.usual_lines_) ++it.inner_failures_;
    it.request_.lines += test_support::rendered(*line);
  };
  EXPECT_EQ(raw_output_of([&] { EXPECT_TRUE(request_.compose()); }), "");
  EXPECT_EQ(masked(request_.lines), usual_lines_);
  EXPECT_EQ(inner_failures_, 0);
  EXPECT_EQ(second_.new_edid, request_.new_edid);
}

TEST_F(LogCallback, MayComposeWithoutOne) {
  request_.request.log = [](const compose_log_line_t *line, void *context) {
    LogCallback &it = test(context);
    if (it.request_.lines.empty()) it.inner_failures_ += it.second_.compose() ? 0 : 1;
    it.request_.lines += test_support::rendered(*line);
  };
  EXPECT_EQ(masked(raw_output_of([&] { EXPECT_TRUE(request_.compose()); })), usual_lines_);
  EXPECT_EQ(masked(request_.lines), usual_lines_);
  EXPECT_EQ(inner_failures_, 0);
}

TEST_F(LogCallback, MaySwitchTracingOff) {
  request_.request.log = [](const compose_log_line_t *line, void *context) {
    debug_enable(false);
    test(context).request_.lines += test_support::rendered(*line);
  };
  EXPECT_EQ(raw_output_of([&] { EXPECT_TRUE(request_.compose()); }), "");
  EXPECT_EQ(test_support::count_of(request_.lines, " \t\t\t"), 1);
}

TEST_F(LogCallback, ReceivesNothingOfWhatIsPrintedAfterTheCall) {
  EXPECT_TRUE(request_.compose_logged());
  const std::string lines = request_.lines;
  EXPECT_NE(raw_output_of([] { print_edid(sink().data(), 256, 1, "After"); }), "");
  EXPECT_EQ(request_.lines, lines);
}

}  // namespace
