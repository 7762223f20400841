// The life of a platform_values_t: initialised, destroyed, initialised again.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using test_support::append;
using test_support::bug_line;
using test_support::error_line;
using test_support::output_of;

struct list_case_t {
  ll_list_t platform_values_t::*list;
  const char *type_name;
  const char *failure;
};

// In the order in which they are initialised and destroyed.
constexpr list_case_t lists[]{
    {&platform_values_t::audio_list, "int", "Failed removing platform audio_list"},
    {&platform_values_t::video_50_priority, "short_video_desc_t", "Failed removing platform video_50_priority"},
    {&platform_values_t::video_50_additional, "short_video_desc_t", "Failed removing platform video_50_additional"},
    {&platform_values_t::video_60_priority, "short_video_desc_t", "Failed removing platform video_60_priority"},
    {&platform_values_t::video_60_additional, "short_video_desc_t", "Failed removing platform video_60_additional"},
    {&platform_values_t::std_timings, "std_timing_t", "Failed removing platform values standard timings"},
};

// What deleting a list with this head says.
std::string broken_list_lines(const ll_list_t &list, u32 right_magic) {
  return error_line("linked_list", "ll_verify_integrity",
                    "Corrupt List: List not initialized. Ptr:PTR ExpectedMagic:" +
                        std::to_string(static_cast<i32>(list.magic)) +
                        " Magic:" + std::to_string(static_cast<i32>(right_magic)) + " Size:0 Head:(nil) ") +
         bug_line("linked_list", "ll_delete_list", "Failed verifying integrity of the list. list:PTR");
}

TEST(PlatformValues, RecordIsRecognisedByItsFirstList) {
  EXPECT_EQ(offsetof(platform_values_t, audio_list), 0U);
}

TEST(PlatformValues, InitClearsWhateverTheRecordHeldBefore) {
  platform_values_t values;
  std::memset(static_cast<void *>(&values), 0xA5, sizeof values);
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(platform_values_init(&values)); }), "");

  for (const list_case_t &list : lists)
    std::memset(static_cast<void *>(&(values.*list.list)), 0, sizeof(ll_list_t));
  const auto *bytes = reinterpret_cast<const unsigned char *>(&values);
  EXPECT_TRUE(std::all_of(bytes, bytes + sizeof values, [](unsigned char byte) { return byte == 0; }));
}

TEST(PlatformValues, InitMakesSixEmptyListsOfTheirElementTypes) {
  platform_values_t values;
  std::memset(static_cast<void *>(&values), 0xFF, sizeof values);
  ASSERT_TRUE(platform_values_init(&values));
  for (const list_case_t &list : lists) {
    SCOPED_TRACE(list.failure);
    EXPECT_TRUE(ll_is_initialized(&(values.*list.list)));
    EXPECT_TRUE(ll_verify_list_type(&(values.*list.list), list.type_name));
    EXPECT_EQ(ll_size(&(values.*list.list)), 0);
  }
  EXPECT_TRUE(platform_values_destroy(&values));
}

TEST(PlatformValues, DestroyDeletesTheListsAndKeepsTheNumbers) {
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  append(values.audio_list, i32{0x070709});
  append(values.video_50_priority, short_video_desc_t{0, 31, 0});
  append(values.video_50_additional, short_video_desc_t{0, 19, 0});
  append(values.video_60_priority, short_video_desc_t{0, 16, 0});
  append(values.video_60_additional, short_video_desc_t{0, 4, 0});
  append(values.std_timings, std_timing_t{1280, 2, 60});
  values.year = 2014;

  EXPECT_EQ(output_of([&] { EXPECT_TRUE(platform_values_destroy(&values)); }), "");
  for (const list_case_t &list : lists) {
    EXPECT_FALSE(ll_is_initialized(&(values.*list.list))) << list.failure;
    EXPECT_EQ((values.*list.list).head, nullptr) << list.failure;
  }
  EXPECT_EQ(values.year, 2014U);
}

TEST(PlatformValues, DestroyedRecordMayBeInitialisedAgain) {
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  ASSERT_TRUE(platform_values_destroy(&values));
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(platform_values_init(&values)); }), "");
  EXPECT_TRUE(ll_is_initialized(&values.audio_list));
  EXPECT_TRUE(platform_values_destroy(&values));
}

TEST(PlatformValues, DestroyingTwiceFailsAtTheFirstList) {
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  const u32 magic = values.audio_list.magic;
  ASSERT_TRUE(platform_values_destroy(&values));
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(platform_values_destroy(&values)); }),
            broken_list_lines(values.audio_list, magic) +
                bug_line("utility", "platform_values_destroy", "Failed removing platform audio_list"));
}

TEST(PlatformValues, AbsentRecordIsRefused) {
  const std::string missing = "\"values\" parameter is NULL. values:(nil)";
  EXPECT_EQ(output_of([] { EXPECT_FALSE(platform_values_init(nullptr)); }),
            error_line("utility", "platform_values_init", missing));
  EXPECT_EQ(output_of([] { EXPECT_FALSE(platform_values_destroy(nullptr)); }),
            error_line("utility", "platform_values_destroy", missing));
}

TEST(PlatformValues, CopyIsNotInitialised) {
  test_support::scoped_values_t values;
  const platform_values_t copy = *values.get();
  EXPECT_FALSE(ll_is_initialized(&copy.audio_list));
}

class BrokenList : public testing::TestWithParam<std::size_t> {};

TEST_P(BrokenList, StopsDestructionThereAndLeavesTheListsBehindIt) {
  const std::size_t broken = GetParam();
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  ll_list_t &list = values.*lists[broken].list;
  const u32 magic = list.magic;
  list.magic = magic + 1;

  EXPECT_EQ(output_of([&] { EXPECT_FALSE(platform_values_destroy(&values)); }),
            broken_list_lines(list, magic) + bug_line("utility", "platform_values_destroy", lists[broken].failure));
  list.magic = magic;
  for (std::size_t i = 0; i < std::size(lists); ++i) {
    EXPECT_EQ(ll_is_initialized(&(values.*lists[i].list)), i >= broken) << lists[i].failure;
    if (i >= broken) {
      EXPECT_TRUE(ll_delete_list(&(values.*lists[i].list)));
    }
  }
}

INSTANTIATE_TEST_SUITE_P(PlatformValues, BrokenList, testing::Range(std::size_t{0}, std::size(lists)));

}  // namespace
