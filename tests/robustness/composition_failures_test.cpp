// A composition when memory runs out at any of its allocations.
#include <gtest/gtest.h>

#include "composition_table.h"
#include "support/output_capture.h"
#include "support/patterns.h"

namespace robustness {
namespace {

using test_support::bytes_t;
using test_support::compose;
using test_support::output_of;

// The computed magic of a list depends on where it lies.
std::string without_magic(const std::string &text) {
  return test_support::replaced(text, " Magic:-?[0-9]+ ", " Magic:M ");
}

std::string diagnostics_of(const std::function<void()> &action) {
  return without_magic(output_of(action));
}

bool is_refused_or_whole(const std::string &words) {
  if (words == "refused\n") return true;
  return words.size() == words_of({true, bytes_t(256), 0, true}).size();
}

class FailingComposition : public testing::Test {
 protected:
  FailingComposition() {
    rich_configuration().write_to(tree_);
    rich_configuration().write_to(values_.get());
  }

  std::string composed_from_tree() { return words_of(compose(sink_, rich_settings())); }
  std::string composed_from_values() { return words_of(compose(sink_, rich_settings(), values_.get())); }

  test_support::configuration_tree_t tree_;
  test_support::scoped_values_t values_;
  bytes_t sink_ = rich_sink().build();
};

TEST_F(FailingComposition, OfTheSampleIsSilentWhileMemoryLasts) {
  std::string from_tree;
  std::string from_values;
  EXPECT_EQ(output_of([&] {
              from_tree = composed_from_tree();
              from_values = composed_from_values();
            }),
            "");
  EXPECT_NE(from_tree, "refused\n");
  EXPECT_EQ(from_tree, from_values);
}

TEST_F(FailingComposition, WithItsOwnConfigurationReportsEveryAllocation) {
  expect_failures(
      join({reading_stretches(), decoding_stretches(nullptr), selecting_stretches()}),
      [this] { return composed_from_tree(); }, diagnostics_of);
}

TEST_F(FailingComposition, WithTheCallersValuesReportsEveryAllocation) {
  expect_failures(
      join({decoding_stretches(values_.get()), selecting_stretches()}), [this] { return composed_from_values(); },
      diagnostics_of);
}

TEST_F(FailingComposition, WithTracingGoesOnWhenOnlyTheLogCannotBeWritten) {
  const bytes_t composed = compose(sink_, rich_settings(), values_.get()).bytes;
  expect_failures(
      join({decoding_stretches(values_.get()), selecting_stretches(), inspecting_stretches(composed)}),
      [this] { return composed_from_values(); }, traced_diagnostics_of);
}

TEST_F(FailingComposition, SurvivesWithoutAnyMemoryFromAnyAllocationOn) {
  expect_survival([this] { return composed_from_tree(); }, is_refused_or_whole);
  expect_survival([this] { return composed_from_values(); }, is_refused_or_whole);
}

// Nothing configured, no sink: the padding of the video list is what allocates most.
class FailingPoorComposition : public testing::Test {
 protected:
  std::string composed() { return words_of(compose({}, test_support::plain_settings(), values_.get())); }

  // The lines of padding an empty list to @p count entries. The TMDS clock is computed before.
  static std::string padding(int count) {
    std::string text = test_support::bug_line("edid_composer", "_maximum_pixel_clock",
                                              "\tReceived a list that contains no entries. List:PTR");
    for (int i = 0; i < count; ++i) {
      text += test_support::error_line(
          "edid_composer", "_populate_new_edid",
          "The number of video formats to be encoded is less than 4! Padding until 4 is reached. Check the platform "
          "configuration file is correct. Number in the video list:" +
              std::to_string(i));
    }
    return text;
  }

  test_support::scoped_values_t values_;
};

TEST_F(FailingPoorComposition, ReportsEveryAllocation) {
  const std::string no_entry = "Failed creating entry.";
  const std::string audio_failed =
      test_support::error_line("edid_composer", "_filter_audio_formats", no_entry) +
      test_support::error_line("edid_composer", "compose_edid_internal", "Failed filtering the audio formats.");
  const std::string population_failed =
      test_support::error_line("edid_composer", "_populate_new_edid", no_entry) +
      test_support::error_line("edid_composer", "compose_edid_internal", "Failed populating the new edid.");
  const auto padded = [=](int, const std::string &bug) { return padding(4) + bug + population_failed; };
  const auto refused = always("refused\n");
  expect_failures(
      {
          {"basic audio", 1, lines(audio_failed), refused},
          {"padding", 4,
           [=](int entry, const std::string &bug) { return padding(entry + 1) + bug + population_failed; }, refused},
          {"detailed timing", 2, padded, refused},
          {"short video descriptor", 4, padded, refused},
      },
      [this] { return composed(); }, output_of);
}

TEST_F(FailingPoorComposition, SurvivesWithoutAnyMemoryFromAnyAllocationOn) {
  expect_survival([this] { return composed(); }, is_refused_or_whole);
}

}  // namespace
}  // namespace robustness
