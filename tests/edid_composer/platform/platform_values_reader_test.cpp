// What reading the platform configuration stores, key by key.
#include "edid_composer/platform/platform_values_reader.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <string>
#include <tuple>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "support/configuration_tree.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using edid_composer::_read_platform_values;
using test_support::configuration_tree_t;
using test_support::output_of;
using test_support::traced_output_of;
using test_support::warning_line;

const std::string domain = "platform.software.drivers.vorex.edid.";

/// An initialised record, as reading is given it.
class PlatformValuesReader : public testing::Test {
 protected:
  PlatformValuesReader() { EXPECT_TRUE(platform_values_init(&values_)); }
  ~PlatformValuesReader() override { EXPECT_TRUE(platform_values_destroy(&values_)); }

  std::string read() {
    return output_of([&] { EXPECT_TRUE(_read_platform_values(&values_, nullptr)); });
  }

  configuration_tree_t tree_;
  platform_values_t values_;
};

struct number_key_t {
  const char *key;
  const char *getter;
  std::int64_t min;
  std::int64_t max;
  std::int64_t fallback;
  std::int64_t (*stored)(const platform_values_t &);
};

#define SIGNED_KEY(key, member, min, max, fallback)                                   \
  {                                                                                   \
    key, "get_pc_int", min, max, fallback,                                            \
        [](const platform_values_t &values) -> std::int64_t { return values.member; } \
  }
#define UNSIGNED_KEY(key, member, min, max, fallback)                                 \
  {                                                                                   \
    key, "get_pc_uint", min, max, fallback,                                           \
        [](const platform_values_t &values) -> std::int64_t { return values.member; } \
  }

const number_key_t number_keys[]{
    SIGNED_KEY("native_refresh_rate", native_refresh_rate, 50, 60, 60),
    SIGNED_KEY("current_mode_set_to_priority", current_mode_set_to_priority, 0, 1, 0),
    SIGNED_KEY("audio.pass_through", audio_pass_through, 0, 2, 0),
    SIGNED_KEY("underscan", underscan, 0, 1, 0),
    SIGNED_KEY("is_tv", is_tv, 0, 1, 0),
    SIGNED_KEY("geometry_limit", geometry_limit, 0, 1, 0),
    SIGNED_KEY("dc_30bit", dc_30bit, 0, 1, 0),
    SIGNED_KEY("dc_36bit", dc_36bit, 0, 1, 0),
    SIGNED_KEY("tmds_override", tmds_override, 0, 1275, 0),
    SIGNED_KEY("supports_ai", supports_ai, 0, 2, 0),
    SIGNED_KEY("speaker_entry", speaker_entry, 1, 2047, 1),
    SIGNED_KEY("xvYCC601", xvYCC601, 0, 2, 0),
    SIGNED_KEY("xvYCC709", xvYCC709, 0, 2, 0),
    SIGNED_KEY("native_bit", native_bit, 0, 1, 1),
    UNSIGNED_KEY("product_id", product_id, 0, 65535, 0),
    UNSIGNED_KEY("serial", serial, 0, 0xFFFFFFFF, 0),
    UNSIGNED_KEY("week", week, 0, 255, 1),
    UNSIGNED_KEY("year", year, 1990, 2100, 2012),
    UNSIGNED_KEY("CNC0", cnc0, 0, 2, 0),
    UNSIGNED_KEY("CNC1", cnc1, 0, 2, 0),
    UNSIGNED_KEY("CNC2", cnc2, 0, 2, 0),
    UNSIGNED_KEY("CNC3", cnc3, 0, 2, 0),
};

#undef SIGNED_KEY
#undef UNSIGNED_KEY

// The configuration is otherwise one whose reading prints nothing, so that the output is about the key alone.
class NumberKey : public PlatformValuesReader, public testing::WithParamInterface<number_key_t> {
 protected:
  NumberKey() { tree_.fill_completely(); }

  static std::string out_of_limits(const char *text, std::int64_t value) {
    const number_key_t &key = GetParam();
    const auto printed = [](std::int64_t number) { return std::to_string(static_cast<i32>(number)); };
    return warning_line("utility", key.getter,
                        "The value for platform path:" + domain + key.key + text + " Min:" + printed(key.min) +
                            " Val:" + printed(value) + " Max:" + printed(key.max));
  }
};

TEST_P(NumberKey, TakesItsLimitsWithoutAWord) {
  for (const std::int64_t limit : {GetParam().min, GetParam().max}) {
    tree_.set(GetParam().key, limit);
    ASSERT_TRUE(platform_values_destroy(&values_));
    ASSERT_TRUE(platform_values_init(&values_));
    EXPECT_EQ(read(), "");
    EXPECT_EQ(GetParam().stored(values_), limit);
  }
}

TEST_P(NumberKey, AbsentOrHoldingATextItFallsBack) {
  const std::string expected = warning_line("utility", GetParam().getter,
                                            "Unable to find the platform path:" + domain + GetParam().key +
                                                " Defaulting to:" + std::to_string(GetParam().fallback));
  tree_.remove(GetParam().key);
  EXPECT_EQ(read(), expected);
  EXPECT_EQ(GetParam().stored(values_), GetParam().fallback);

  tree_.set(GetParam().key, std::string("1"));
  ASSERT_TRUE(platform_values_destroy(&values_));
  ASSERT_TRUE(platform_values_init(&values_));
  EXPECT_EQ(read(), expected);
  EXPECT_EQ(GetParam().stored(values_), GetParam().fallback);
}

// Keys of which some 32-bit number is smaller, or larger, than the limits.
class NumberKeyWithMinimum : public NumberKey {};
class NumberKeyWithMaximum : public NumberKey {};
class UnsignedNumberKeyWithMaximum : public NumberKey {};

TEST_P(NumberKeyWithMinimum, BelowItBecomesTheMinimum) {
  const std::int64_t value = GetParam().min - 1;
  tree_.set(GetParam().key, value);
  EXPECT_EQ(read(), out_of_limits(" is smaller than the minimum value. Setting to minimum.", value));
  EXPECT_EQ(GetParam().stored(values_), GetParam().min);
}

TEST_P(NumberKeyWithMaximum, AboveItBecomesTheMaximum) {
  const std::int64_t value = GetParam().max + 1;
  tree_.set(GetParam().key, value);
  EXPECT_EQ(read(), out_of_limits(" is larger than the maximum value. Setting to maximum.", value));
  EXPECT_EQ(GetParam().stored(values_), GetParam().max);
}

TEST_P(UnsignedNumberKeyWithMaximum, NegativeNumberIsHuge) {
  tree_.set(GetParam().key, -1);
  EXPECT_EQ(read(), out_of_limits(" is larger than the maximum value. Setting to maximum.", -1));
  EXPECT_EQ(GetParam().stored(values_), GetParam().max);
}

bool is_unsigned(const number_key_t &key) {
  return key.getter == std::string("get_pc_uint");
}

bool has_smaller_numbers(const number_key_t &key) {
  return !is_unsigned(key) || key.min > 0;
}

bool has_larger_numbers(const number_key_t &key) {
  return key.max < 0xFFFFFFFF;
}

bool has_larger_negative_numbers(const number_key_t &key) {
  return is_unsigned(key) && has_larger_numbers(key);
}

std::vector<number_key_t> keys_that(bool (*condition)(const number_key_t &)) {
  std::vector<number_key_t> keys;
  std::copy_if(std::begin(number_keys), std::end(number_keys), std::back_inserter(keys), condition);
  return keys;
}

std::string name_of(const testing::TestParamInfo<number_key_t> &key) {
  std::string name = key.param.key;
  std::replace_if(
      name.begin(), name.end(), [](char letter) { return letter == '.' || letter == '_'; }, 'X');
  return name;
}

INSTANTIATE_TEST_SUITE_P(PlatformValuesReader, NumberKey, testing::ValuesIn(number_keys), name_of);
INSTANTIATE_TEST_SUITE_P(PlatformValuesReader, NumberKeyWithMinimum, testing::ValuesIn(keys_that(has_smaller_numbers)),
                         name_of);
INSTANTIATE_TEST_SUITE_P(PlatformValuesReader, NumberKeyWithMaximum, testing::ValuesIn(keys_that(has_larger_numbers)),
                         name_of);
INSTANTIATE_TEST_SUITE_P(PlatformValuesReader, UnsignedNumberKeyWithMaximum,
                         testing::ValuesIn(keys_that(has_larger_negative_numbers)), name_of);

std::string unrecognised_rate(int rate) {
  return composer_lines::warning("_read_platform_values",
                                 "Value in the platform config file for the domain "
                                 "\"platform.software.drivers.vorex.edid.native_refresh_rate\" is an unrecognized "
                                 "value:" +
                                     std::to_string(rate) + ". Valid values: 50,60. Using:60");
}

TEST_F(PlatformValuesReader, RefreshRateBetweenTheTwoFamiliesBecomes60) {
  tree_.fill_completely();
  for (int rate = 51; rate <= 59; ++rate) {
    tree_.set("native_refresh_rate", rate);
    ASSERT_TRUE(platform_values_destroy(&values_));
    ASSERT_TRUE(platform_values_init(&values_));
    EXPECT_EQ(read(), unrecognised_rate(rate));
    EXPECT_EQ(values_.native_refresh_rate, 60);
  }
}

TEST_F(PlatformValuesReader, RefreshRateAbove60IsClampedOnly) {
  tree_.fill_completely();
  tree_.set("native_refresh_rate", 70);
  EXPECT_EQ(read(), warning_line("utility", "get_pc_int",
                                 "The value for platform path:" + domain +
                                     "native_refresh_rate is larger than the maximum value. Setting to maximum. Min:50 "
                                     "Val:70 Max:60"));
  EXPECT_EQ(values_.native_refresh_rate, 60);
}

TEST_F(PlatformValuesReader, RefreshRateIsJudgedBeforeTheNextKeyIsRead) {
  tree_.set("native_refresh_rate", 55);
  const std::string output = read();
  const std::string expected = unrecognised_rate(55) + warning_line("utility", "get_pc_int",
                                                                    "Unable to find the platform path:" + domain +
                                                                        "current_mode_set_to_priority Defaulting to:0");
  EXPECT_EQ(output.substr(0, expected.size()), expected);
}

TEST_F(PlatformValuesReader, WeekAboveTheCalendarBecomes53InSilence) {
  tree_.fill_completely();
  for (u32 week = 0; week <= 255; ++week) {
    tree_.set("week", week);
    ASSERT_TRUE(platform_values_destroy(&values_));
    ASSERT_TRUE(platform_values_init(&values_));
    EXPECT_EQ(read(), "");
    EXPECT_EQ(values_.week, week > 53 && week < 255 ? 53U : week);
  }
}

TEST_F(PlatformValuesReader, WeekAbove255IsClampedToTheModelYearMark) {
  tree_.fill_completely();
  tree_.set("week", 300);
  EXPECT_EQ(read(), warning_line("utility", "get_pc_uint",
                                 "The value for platform path:" + domain +
                                     "week is larger than the maximum value. Setting to maximum. Min:0 Val:300 "
                                     "Max:255"));
  EXPECT_EQ(values_.week, 255U);
}

TEST_F(PlatformValuesReader, TextsAreCutToTheirFields) {
  tree_.fill_completely();
  tree_.set("manufacturer_id", std::string("ABCDEF"));
  tree_.set("monitor_name", std::string("A name of more than thirteen"));
  tree_.set("monitor_serial", std::string("1234567890123"));
  EXPECT_EQ(read(), "");
  EXPECT_STREQ(values_.manufacturer_id, "ABC");
  EXPECT_STREQ(values_.monitor_name, "A name of mor");
  EXPECT_STREQ(values_.monitor_serial, "1234567890123");
}

TEST_F(PlatformValuesReader, TextsThatAreAbsentOrNumbersFallBackWithAWarning) {
  tree_.fill_completely();
  tree_.remove("manufacturer_id");
  tree_.set("monitor_name", 5);
  tree_.remove("monitor_serial");
  const auto warning = [](const std::string &key, const std::string &text) {
    return warning_line("utility", "get_pc_str",
                        "Error trying to read \"" + domain + key + "\" from the platform config. Using:" + text);
  };
  EXPECT_EQ(read(), warning("manufacturer_id", "YYY") + warning("monitor_name", "") + warning("monitor_serial", ""));
  EXPECT_STREQ(values_.manufacturer_id, "YYY");
  EXPECT_STREQ(values_.monitor_name, "");
  EXPECT_STREQ(values_.monitor_serial, "");
}

TEST_F(PlatformValuesReader, CompleteConfigurationIsStoredWithoutAWord) {
  tree_.fill_completely();
  EXPECT_EQ(read(), "");

  EXPECT_EQ(test_support::elements_of<i32>(values_.audio_list), (std::vector<i32>{0x070709, 0x500715}));
  using modes_t = std::vector<test_support::mode_pair_t>;
  EXPECT_EQ(test_support::modes_of(values_.video_50_priority), (modes_t{{31, 5}, {19, 5}, {20, 2}, {17, 0}}));
  EXPECT_EQ(test_support::modes_of(values_.video_50_additional), (modes_t{{18, 0}, {21, 0}}));
  EXPECT_EQ(test_support::modes_of(values_.video_60_priority), (modes_t{{16, 5}, {4, 5}, {5, 2}, {2, 0}}));
  EXPECT_EQ(test_support::modes_of(values_.video_60_additional), (modes_t{{3, 0}, {1, 0}}));
  EXPECT_EQ(std::vector<i32>(std::begin(values_.modes_4k_x_2k_priority), std::end(values_.modes_4k_x_2k_priority)),
            (std::vector<i32>{1, 2, 3, 0, 0, 0, 0}));
  EXPECT_EQ(std::vector<i32>(std::begin(values_.modes_4k_x_2k_addition), std::end(values_.modes_4k_x_2k_addition)),
            (std::vector<i32>{4, 0, 0, 0, 0, 0, 0}));
  EXPECT_EQ(values_.native_refresh_rate, 50);
  EXPECT_EQ(values_.tmds_override, 300);
  EXPECT_EQ(values_.serial, 0x01020304U);
  EXPECT_STREQ(values_.monitor_name, "Living room");
  EXPECT_EQ(values_.established_timings_1, 0x21U);
  EXPECT_EQ(values_.established_timings_2, 0x08U);
  EXPECT_EQ(values_.manufacturer_timings, 0x80U);
  EXPECT_EQ(test_support::std_timings_of(values_.std_timings),
            (std::vector<test_support::std_timing_words_t>{{1280, 2, 60}, {1920, 3, 60}}));
}

TEST_F(PlatformValuesReader, AudioEntriesAreTakenInLetterOrderWithGaps) {
  tree_.fill_completely();
  tree_.remove("audio.entry_a");
  tree_.remove("audio.entry_c");
  tree_.set("audio.entry_z", -1);
  tree_.set("audio.entry_c", 3);
  tree_.set("audio.entry_a", 1);
  tree_.set("audio.entry_b", std::string("2"));  // Not an integer: left out as if it were absent.
  tree_.set("audio.entry_A", 4);
  tree_.set("audio.entry_aa", 5);
  EXPECT_EQ(read(), "");
  EXPECT_EQ(test_support::elements_of<i32>(values_.audio_list), (std::vector<i32>{1, 3, -1}));
}

TEST_F(PlatformValuesReader, AudioEntriesAreTracedByNobody) {
  tree_.fill_completely();
  const std::string output = traced_output_of([&] { EXPECT_TRUE(_read_platform_values(&values_, nullptr)); });
  EXPECT_EQ(output.find("audio.entry"), std::string::npos);
}

TEST_F(PlatformValuesReader, AllTwentySixAudioEntriesAreTaken) {
  tree_.fill_completely();
  std::vector<i32> expected;
  for (char letter = 'a'; letter <= 'z'; ++letter) {
    tree_.set(std::string("audio.entry_") + letter, letter);
    expected.push_back(letter);
  }
  EXPECT_EQ(read(), "");
  EXPECT_EQ(test_support::elements_of<i32>(values_.audio_list), expected);
}

TEST_F(PlatformValuesReader, AudioEntryThatIsNotAcceptedEndsTheReadingAtOnce) {
  tree_.fill_completely();
  ASSERT_TRUE(ll_delete_list(&values_.audio_list));
  ASSERT_TRUE(ll_init(&values_.audio_list, "std_timing_t"));
  bool result = true;
  const std::string output = output_of([&] { result = _read_platform_values(&values_, nullptr); });
  EXPECT_FALSE(result);
  EXPECT_EQ(test_support::count_of(output, "\n"), 2) << output;
  EXPECT_NE(
      output.find("linked_list:N:ll_add_entry_to_back() BUG: This entry represents a different type and cannot be "
                  "added to this list. List:0x"),
      std::string::npos);
  EXPECT_NE(output.find(composer_lines::error("_read_platform_values", "Failed adding entry to the back of the list.")),
            std::string::npos);
  EXPECT_EQ(values_.year, 2014U);  // What was read before stays.
  EXPECT_EQ(values_.video_50_priority.size, 0U);
  EXPECT_STREQ(values_.manufacturer_id, "");
}

TEST_F(PlatformValuesReader, AudioEntryWithoutMemoryEndsTheReadingAtOnce) {
  tree_.fill_completely();
  for (const auto &[nth, storage, kept] :
       {std::tuple{1, "the entry", 0U}, std::tuple{2, "the data storage", 0U}, std::tuple{3, "the entry", 1U}}) {
    ASSERT_TRUE(platform_values_destroy(&values_));
    ASSERT_TRUE(platform_values_init(&values_));
    bool result = true;
    const std::string output = output_of([&, nth = nth] {
      const test_support::failing_allocation_t failing(nth);
      result = _read_platform_values(&values_, nullptr);
    });
    EXPECT_FALSE(result);
    EXPECT_EQ(output,
              test_support::bug_line("linked_list", "ll_create_entry",
                                     std::string("calloc failed to allocate memory for ") + storage + ". ptr:PTR") +
                  composer_lines::error("_read_platform_values", "Failed creating entry."));
    EXPECT_EQ(values_.audio_list.size, kept);
    EXPECT_EQ(values_.video_50_priority.size, 0U);
  }
}

}  // namespace
