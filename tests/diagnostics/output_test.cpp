// Where the library writes: standard output, or a callback line by line.
#include "output.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "support/output_capture.h"
#include "support/request.h"

namespace diagnostics_tests {
namespace {

using edid_composer::log_error;
using edid_composer::log_redirection_t;
using edid_composer::print;
using edid_composer::site_t;
using lines_t = std::vector<std::string>;
using test_support::raw_output_of;

constexpr site_t site{"linked_list", "ll_size"};
constexpr std::size_t longest = 1023;

void keep(const compose_log_line_t *line, void *context) {
  static_cast<lines_t *>(context)->push_back(test_support::rendered(*line));
}

/// What an action writes while a callback is set; nothing of it reaches standard output.
lines_t redirected(const std::function<void()> &action) {
  lines_t lines;
  EXPECT_EQ(raw_output_of([&] {
              const log_redirection_t redirection(keep, &lines);
              action();
            }),
            "");
  return lines;
}

TEST(Output, GoesToStandardOutputInPieces) {
  EXPECT_EQ(raw_output_of([] {
              print("%s ", "a");
              print("b\n\nc");
            }),
            "a b\n\nc");
}

TEST(RedirectedOutput, IsJoinedFromItsPiecesAndCutAtNewlines) {
  EXPECT_EQ(redirected([] {
              print("%s ", "a");
              print("b\nc");
              print("\n\nd\n");
            }),
            (lines_t{"a b\n", "c\n", "\n", "d\n"}));
}

TEST(RedirectedOutput, ThatEndsNoLineIsDeliveredBeforeADiagnosticAndAtTheEnd) {
  EXPECT_EQ(redirected([] {
              print("a");
              log_error(site, 7, "b %d\n", 1);
              log_trace(site, 8, "c");
              print("d");
            }),
            (lines_t{"a\n", "linked_list:7:ll_size() ERROR: b 1\n\n", "c \t\t\tll_size():8\n", "d\n"}));
}

TEST(RedirectedOutput, SaysWhoReportsButForText) {
  std::vector<std::string> sites;
  const auto note = [](const compose_log_line_t *line, void *context) {
    EXPECT_EQ(line->size, sizeof *line);
    static_cast<lines_t *>(context)->push_back(std::string(line->module) + ":" + line->function + ":" +
                                               std::to_string(line->line) + ":" + std::to_string(line->kind));
  };
  {
    const log_redirection_t redirection(note, &sites);
    log_error(site, 1, "text");
    log_warning(site, 2, "text");
    log_bug(site, 3, "text");
    log_trace(site, 4, "text");
    print("text\n");
  }
  EXPECT_EQ(sites, (lines_t{"linked_list:ll_size:1:1", "linked_list:ll_size:2:2", "linked_list:ll_size:3:3",
                            "linked_list:ll_size:4:4", "::0:5"}));
}

// No line of a composition is that long.
TEST(RedirectedOutput, CutsALineThatIsTooLongAndGoesOnWithTheNext) {
  const std::string fits(longest, 'x');
  const std::string too_long(3000, 'x');
  EXPECT_EQ(redirected([&] {
              print("%s\n", fits.c_str());
              print("%s\n", too_long.c_str());
              print("after\n");
              print("%s", too_long.c_str());
              print("more");
              print("\n");
              print("after\n");
            }),
            (lines_t{fits + "\n", fits + "\n", "after\n", fits + "\n", "after\n"}));
  EXPECT_EQ(redirected([&] {
              log_error(site, 7, "%s", too_long.c_str());
              print("after\n");
            }),
            (lines_t{"linked_list:7:ll_size() ERROR: " + fits + "\n", "after\n"}));
}

TEST(RedirectedOutput, OfTheCallbackItselfGoesWhereItWentBefore) {
  lines_t outer;
  lines_t inner;
  const auto print_and_keep = [](const compose_log_line_t *line, void *context) {
    print("callback\n");
    keep(line, context);
  };
  EXPECT_EQ(raw_output_of([&] {
              const log_redirection_t redirection(print_and_keep, &outer);
              print("a\n");
              {
                const log_redirection_t nested(print_and_keep, &inner);
                print("b\n");
              }
              print("c\n");
            }),
            "callback\ncallback\ncallback\n");
  EXPECT_EQ(inner, lines_t{"b\n"});
  EXPECT_EQ(outer, (lines_t{"a\n", "callback\n", "c\n"}));
}

}  // namespace
}  // namespace diagnostics_tests
