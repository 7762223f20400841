// The entries that are numbers: 4Kx2K modes and the bits of established and manufacturer's timings.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "composer_lines.h"
#include "edid_composer/platform_mode_lists.h"
#include "support/configuration_tree.h"
#include "support/output_capture.h"

namespace {

using composer_lines::bug;
using composer_lines::trace;
using composer_lines::warning;
using edid_composer::_get_4k_x_2k_mode_callback;
using edid_composer::_get_4k_x_2k_modes;
using edid_composer::_get_est_timing_callback;
using edid_composer::_get_est_timing_list;
using test_support::configuration_tree_t;
using test_support::output_of;
using test_support::traced_output_of;

using slots_t = std::vector<i32>;

class Mode4kEntry : public testing::Test {
 protected:
  std::string read(const slots_t &entries) {
    for (const i32 entry : entries)
      tree_.add("4k_x_2k_priority_list", entry);
    return output_of([&] { _get_4k_x_2k_modes("4k_x_2k_priority_list", modes_); });
  }
  /// The array and the word behind it, which no entry may reach.
  slots_t slots() const { return {modes_, modes_ + 8}; }

  configuration_tree_t tree_;
  i32 modes_[8]{0, 0, 0, 0, 0, 0, 0, 0x5A5A5A5A};
};

std::string unsupported_mode(const std::string &mode, const std::string &node) {
  return warning("_get_4k_x_2k_mode_callback",
                 "Detected a 4k x 2k mode that is not supported. Max:4 Received:" + mode + " Node:" + node);
}

TEST_F(Mode4kEntry, IsStoredInTheNextSlot) {
  EXPECT_EQ(read({3, 1}), "");
  EXPECT_EQ(slots(), (slots_t{3, 1, 0, 0, 0, 0, 0, 0x5A5A5A5A}));
}

TEST_F(Mode4kEntry, OutsideTheModesIsSkipped) {
  EXPECT_EQ(read({5, 4, 0, -1, 1}),
            unsupported_mode("5", "entry_0") + unsupported_mode("0", "entry_2") + unsupported_mode("-1", "entry_3"));
  EXPECT_EQ(slots(), (slots_t{4, 1, 0, 0, 0, 0, 0, 0x5A5A5A5A}));
}

TEST_F(Mode4kEntry, MayBeRepeated) {
  EXPECT_EQ(read({1, 1, 2, 1}), "");
  EXPECT_EQ(slots(), (slots_t{1, 1, 2, 1, 0, 0, 0, 0x5A5A5A5A}));
}

TEST_F(Mode4kEntry, FirstSevenAreKeptAndTheOthersLeaveNoTrace) {
  EXPECT_EQ(read({1, 2, 3, 4, 3, 2, 1, 4, 3}), "");
  EXPECT_EQ(slots(), (slots_t{1, 2, 3, 4, 3, 2, 1, 0x5A5A5A5A}));
  const std::string traced = traced_output_of([&] { _get_4k_x_2k_modes("4k_x_2k_priority_list", modes_); });
  EXPECT_EQ(test_support::count_of(traced, "Read 4k x 2k mode:"), 7);
}

TEST_F(Mode4kEntry, SlotsAreCountedFromTheFirstForEachList) {
  tree_.add("4k_x_2k_addition_list", 4);
  EXPECT_EQ(read({1, 2}), "");
  i32 addition[7]{};
  _get_4k_x_2k_modes("4k_x_2k_addition_list", addition);
  EXPECT_EQ(addition[0], 4);
  EXPECT_EQ(addition[1], 0);
}

TEST_F(Mode4kEntry, IsTraced) {
  edid_composer::modes_4k_x_2k_context_t context{modes_, 0};
  char text[30]{};
  EXPECT_EQ(traced_output_of([&] { _get_4k_x_2k_mode_callback("node", "list", 2, text, sizeof text, &context); }),
            trace("_get_4k_x_2k_mode_callback", "Read 4k x 2k mode:2"));
  EXPECT_EQ(context.count, 1U);
}

TEST_F(Mode4kEntry, WithoutContextIsABugWithAnEmptyLine) {
  char text[30]{};
  EXPECT_EQ(output_of([&] { _get_4k_x_2k_mode_callback("node", "list", 9, text, sizeof text, nullptr); }),
            bug("_get_4k_x_2k_mode_callback", "user_ptr is NULL\n"));
}

class TimingBitEntry : public testing::Test {
 protected:
  std::string read(const char *list, const slots_t &entries) {
    for (const i32 entry : entries)
      tree_.add(list, entry);
    return output_of([&] { _get_est_timing_list(list, &mask_); });
  }

  configuration_tree_t tree_;
  u32 mask_ = 0;
};

std::string invalid_bit(const std::string &bit, const std::string &node) {
  return warning("_get_est_timing_callback", "Mode value is not 0 to 7. Val:" + bit + " Node:" + node);
}

TEST_F(TimingBitEntry, SetsItsBit) {
  EXPECT_EQ(read("established_timings_1", {0, 7}), "");
  EXPECT_EQ(mask_, 0x81U);
}

TEST_F(TimingBitEntry, AllEightBitsRepeatedOrNotFillTheMask) {
  EXPECT_EQ(read("established_timings_2", {7, 6, 5, 4, 3, 2, 1, 0, 7, 0, 3}), "");
  EXPECT_EQ(mask_, 0xFFU);
}

TEST_F(TimingBitEntry, OutsideTheByteIsSkipped) {
  EXPECT_EQ(read("manufacturer_timings", {8, 7, -1, 31}),
            invalid_bit("8", "entry_0") + invalid_bit("-1", "entry_2") + invalid_bit("31", "entry_3"));
  EXPECT_EQ(mask_, 0x80U);
}

TEST_F(TimingBitEntry, IsAddedToWhatTheMaskHolds) {
  mask_ = 0x10;
  EXPECT_EQ(read("manufacturer_timings", {0}), "");
  EXPECT_EQ(mask_, 0x11U);
}

TEST_F(TimingBitEntry, IsTracedWithItsList) {
  char text[30]{};
  EXPECT_EQ(traced_output_of([&] { _get_est_timing_callback("node", "list", 3, text, sizeof text, &mask_); }),
            trace("_get_est_timing_callback", "Added timing val:3 for list:list"));
  EXPECT_EQ(mask_, 0x08U);
}

TEST_F(TimingBitEntry, WithoutContextIsABugWithAnEmptyLine) {
  char text[30]{};
  EXPECT_EQ(output_of([&] { _get_est_timing_callback("node", "list", 9, text, sizeof text, nullptr); }),
            bug("_get_est_timing_callback", "user_ptr is NULL\n"));
}

}  // namespace
