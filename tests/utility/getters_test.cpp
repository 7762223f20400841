// The getters of single configuration values.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "support/configuration_tree.h"
#include "utility/utility_lines.h"

namespace utility_tests {
namespace {

using test_support::config_operation_t;
using test_support::configuration_tree_t;

const std::string domain = "platform.software.drivers.vorex.edid.";

std::string read_trace(const char *getter, const std::string &key, const std::string &value) {
  return trace_line(getter, "Platform config read. Path:" + domain + key + " val:" + value);
}

std::string absent_warning(const char *getter, const std::string &key, const std::string &value) {
  return warning(getter, "Unable to find the platform path:" + domain + key + " Defaulting to:" + value);
}

std::string minimum_warning(const char *getter, const std::string &key, const std::string &numbers) {
  return warning(getter, "The value for platform path:" + domain + key +
                             " is smaller than the minimum value. Setting to minimum. " + numbers);
}

std::string maximum_warning(const char *getter, const std::string &key, const std::string &numbers) {
  return warning(getter, "The value for platform path:" + domain + key +
                             " is larger than the maximum value. Setting to maximum. " + numbers);
}

TEST(GetPcInt, ReadsAValueWithinItsLimits) {
  configuration_tree_t tree;
  tree.set("tmds_override", 1275);
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(get_pc_int("tmds_override", 0, 1275, 5, true), 1275); }),
            read_trace("get_pc_int", "tmds_override", "1275"));
  tree.set("tmds_override", 0);
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(get_pc_int("tmds_override", 0, 1275, 5, true), 0); }),
            read_trace("get_pc_int", "tmds_override", "0"));
}

TEST(Getters, WithoutAKeyAskForOneThatIsCalledNull) {
  const configuration_tree_t tree;
  EXPECT_EQ(output_of([] { EXPECT_EQ(get_pc_int(nullptr, 0, 9, 5, true), 5); }),
            absent_warning("get_pc_int", "(null)", "5"));
  EXPECT_EQ(output_of([] { EXPECT_EQ(get_pc_uint(nullptr, 0, 9, 5, true), 5U); }),
            absent_warning("get_pc_uint", "(null)", "5"));
}

TEST(GetPcInt, AsksForTheWholePathFromTheRoot) {
  configuration_tree_t tree;
  tree.set("audio.pass_through", 2);
  EXPECT_EQ(get_pc_int("audio.pass_through", 0, 2, 0, true), 2);
  ASSERT_EQ(tree.lookups(), 1);
  EXPECT_EQ(tree.calls()[0].operation, config_operation_t::get_int);
  EXPECT_EQ(tree.calls()[0].handle, 0u);
  EXPECT_EQ(tree.calls()[0].path, "platform.software.drivers.vorex.edid.audio.pass_through");
}

TEST(GetPcInt, DefaultsWithAWarningWhenTheKeyIsAbsent) {
  const configuration_tree_t tree;
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(get_pc_int("native_refresh_rate", 50, 60, 60, true), 60); }),
            absent_warning("get_pc_int", "native_refresh_rate", "60") +
                read_trace("get_pc_int", "native_refresh_rate", "60"));
}

TEST(GetPcInt, DefaultsWhenTheKeyHoldsAText) {
  configuration_tree_t tree;
  tree.set("underscan", "1");
  EXPECT_EQ(output_of([] { EXPECT_EQ(get_pc_int("underscan", 0, 1, 0, true), 0); }),
            absent_warning("get_pc_int", "underscan", "0"));
}

TEST(GetPcInt, RaisesToTheMinimumAndTracesTheResult) {
  configuration_tree_t tree;
  tree.set("native_refresh_rate", -3);
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(get_pc_int("native_refresh_rate", 50, 60, 55, true), 50); }),
            minimum_warning("get_pc_int", "native_refresh_rate", "Min:50 Val:-3 Max:60") +
                read_trace("get_pc_int", "native_refresh_rate", "50"));
}

TEST(GetPcInt, LowersToTheMaximumAndTracesTheResult) {
  configuration_tree_t tree;
  tree.set("native_refresh_rate", 70);
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(get_pc_int("native_refresh_rate", 50, 60, 55, true), 60); }),
            maximum_warning("get_pc_int", "native_refresh_rate", "Min:50 Val:70 Max:60") +
                read_trace("get_pc_int", "native_refresh_rate", "60"));
}

TEST(GetPcInt, ComparesSignedNumbers) {
  configuration_tree_t tree;
  tree.set("value", -5);
  EXPECT_EQ(output_of([] { EXPECT_EQ(get_pc_int("value", -10, -1, -2, true), -5); }), "");
  EXPECT_EQ(output_of([] { EXPECT_EQ(get_pc_int("value", INT32_MIN, INT32_MAX, 0, true), -5); }), "");
}

TEST(GetPcInt, KeepsQuietWithoutWarningsButTraces) {
  configuration_tree_t tree;
  tree.set("low", -1);
  tree.set("high", 9);
  const auto read = [] {
    EXPECT_EQ(get_pc_int("low", 0, 2, 1, false), 0);
    EXPECT_EQ(get_pc_int("high", 0, 2, 1, false), 2);
    EXPECT_EQ(get_pc_int("absent", 0, 2, 1, false), 1);
  };
  EXPECT_EQ(output_of(read), "");
  EXPECT_EQ(traced_output_of(read), read_trace("get_pc_int", "low", "0") + read_trace("get_pc_int", "high", "2") +
                                        read_trace("get_pc_int", "absent", "1"));
}

TEST(GetPcInt, WritesNoTraceWhileTracingIsOff) {
  configuration_tree_t tree;
  tree.set("value", 1);
  EXPECT_EQ(output_of([] { EXPECT_EQ(get_pc_int("value", 0, 2, 0, true), 1); }), "");
}

TEST(GetPcInt, TakesAnyStatusButZeroAsNotAvailable) {
  configuration_tree_t tree;
  tree.set("value", 1);
  for (const int status : {-1, 1, 2, 3}) {
    tree.answer(config_operation_t::get_int, status);
    EXPECT_EQ(output_of([] { EXPECT_EQ(get_pc_int("value", 0, 9, 7, true), 7); }),
              absent_warning("get_pc_int", "value", "7"))
        << status;
  }
}

TEST(GetPcUint, RaisesAYearToTheMinimum) {
  configuration_tree_t tree;
  tree.set("year", 1985);
  EXPECT_EQ(
      traced_output_of([] { EXPECT_EQ(get_pc_uint("year", 1990, 2100, 2012, true), 1990u); }),
      minimum_warning("get_pc_uint", "year", "Min:1990 Val:1985 Max:2100") + read_trace("get_pc_uint", "year", "1990"));
}

TEST(GetPcUint, LowersToTheMaximum) {
  configuration_tree_t tree;
  tree.set("week", 300);
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(get_pc_uint("week", 0, 255, 1, true), 255u); }),
            maximum_warning("get_pc_uint", "week", "Min:0 Val:300 Max:255") + read_trace("get_pc_uint", "week", "255"));
}

TEST(GetPcUint, TakesNegativeNumbersForHugeOnes) {
  configuration_tree_t tree;
  tree.set("CNC0", -1);
  EXPECT_EQ(traced_output_of([] { EXPECT_EQ(get_pc_uint("CNC0", 0, 2, 0, true), 2u); }),
            maximum_warning("get_pc_uint", "CNC0", "Min:0 Val:-1 Max:2") + read_trace("get_pc_uint", "CNC0", "2"));
}

TEST(GetPcUint, AcceptsAnySerialAndTracesItAsSigned) {
  configuration_tree_t tree;
  for (const std::int64_t serial : {0ll, 0x7FFFFFFFll, 0x80000000ll, 0xFFFFFFFFll}) {
    tree.set("serial", serial);
    EXPECT_EQ(
        traced_output_of([&] { EXPECT_EQ(get_pc_uint("serial", 0, 0xFFFFFFFF, 0, true), static_cast<u32>(serial)); }),
        read_trace("get_pc_uint", "serial", std::to_string(static_cast<i32>(serial))));
  }
}

TEST(GetPcUint, PrintsItsNumbersAsSigned) {
  configuration_tree_t tree;
  EXPECT_EQ(
      traced_output_of([] { EXPECT_EQ(get_pc_uint("absent", 0xFFFFFFFE, 0xFFFFFFFF, 0xFFFFFFFF, true), 0xFFFFFFFFu); }),
      absent_warning("get_pc_uint", "absent", "-1") + read_trace("get_pc_uint", "absent", "-1"));
  tree.set("value", 3);
  EXPECT_EQ(
      traced_output_of([] { EXPECT_EQ(get_pc_uint("value", 0xFFFFFFFE, 0xFFFFFFFF, 0xFFFFFFFF, true), 0xFFFFFFFEu); }),
      minimum_warning("get_pc_uint", "value", "Min:-2 Val:3 Max:-1") + read_trace("get_pc_uint", "value", "-2"));
}

TEST(GetPcUint, KeepsQuietWithoutWarnings) {
  configuration_tree_t tree;
  tree.set("high", 9);
  tree.set("low", 1);
  EXPECT_EQ(output_of([] {
              EXPECT_EQ(get_pc_uint("absent", 2, 4, 3, false), 3u);
              EXPECT_EQ(get_pc_uint("high", 2, 4, 3, false), 4u);
              EXPECT_EQ(get_pc_uint("low", 2, 4, 3, false), 2u);
            }),
            "");
}

/// A text read into a field of exactly the given size that was filled with @p filling.
struct read_text_t {
  std::vector<char> field;
  bool configured;
};

read_text_t read_text(const char *key, u32 size, const char *default_text, bool warnings = true, char filling = '\0') {
  read_text_t text{std::vector<char>(size, filling), false};
  text.configured = get_pc_str(key, text.field.data(), size, default_text, warnings);
  return text;
}

std::vector<char> field(const std::string &bytes) {
  return {bytes.begin(), bytes.end()};
}

TEST(GetPcStr, ReadsAConfiguredText) {
  configuration_tree_t tree;
  tree.set("manufacturer_id", "ABC");
  EXPECT_EQ(traced_output_of([] {
              const read_text_t text = read_text("manufacturer_id", 4, "YYY");
              EXPECT_TRUE(text.configured);
              EXPECT_EQ(text.field, field(std::string("ABC\0", 4)));
            }),
            "");
  ASSERT_EQ(tree.lookups(), 1);
  EXPECT_EQ(tree.calls()[0].operation, config_operation_t::get_str);
  EXPECT_EQ(tree.calls()[0].handle, 0u);
  EXPECT_EQ(tree.calls()[0].path, domain + "manufacturer_id");
  EXPECT_EQ(tree.calls()[0].size, 4u);
}

TEST(GetPcStr, LeavesTheCuttingToTheConfiguration) {
  configuration_tree_t tree;
  tree.set("monitor_name", "A name that is too long");
  const read_text_t text = read_text("monitor_name", 14, "");
  EXPECT_TRUE(text.configured);
  EXPECT_EQ(text.field, field(std::string("A name that i\0", 14)));
}

TEST(GetPcStr, WritesTheDefaultWithoutATerminator) {
  const configuration_tree_t tree;
  const std::string expected = warning(
      "get_pc_str", "Error trying to read \"" + domain + "manufacturer_id\" from the platform config. Using:YYY");
  EXPECT_EQ(traced_output_of([] {
              const read_text_t text = read_text("manufacturer_id", 4, "YYY");
              EXPECT_FALSE(text.configured);
              EXPECT_EQ(text.field, field(std::string("YYY\0", 4)));
            }),
            expected);
  EXPECT_EQ(read_text("manufacturer_id", 6, "YYY", false, '#').field, field("YYY###"));
}

TEST(GetPcStr, FillsAFieldOfTheDefaultsLengthWholly) {
  const configuration_tree_t tree;
  EXPECT_EQ(read_text("key", 3, "YYY", false, '#').field, field("YYY"));
}

TEST(GetPcStr, CutsADefaultThatIsLongerThanTheField) {
  const configuration_tree_t tree;
  EXPECT_EQ(output_of([] { EXPECT_EQ(read_text("key", 2, "YES", true, '#').field, field("YE")); }),
            warning("get_pc_str", "Error trying to read \"" + domain + "key\" from the platform config. Using:YES"));
}

TEST(GetPcStr, WritesNothingIntoAFieldWithoutRoom) {
  const configuration_tree_t tree;
  char byte = '#';
  EXPECT_FALSE(get_pc_str("key", &byte, 0, "YES", false));
  EXPECT_EQ(byte, '#');
}

TEST(GetPcStr, LeavesTheFieldAloneForAnEmptyDefault) {
  const configuration_tree_t tree;
  EXPECT_EQ(output_of([] { EXPECT_EQ(read_text("key", 3, "", true, '#').field, field("###")); }),
            warning("get_pc_str", "Error trying to read \"" + domain + "key\" from the platform config. Using:"));
}

TEST(GetPcStr, KeepsQuietWithoutWarnings) {
  const configuration_tree_t tree;
  EXPECT_EQ(traced_output_of([] { EXPECT_FALSE(read_text("manufacturer_id", 4, "YYY", false).configured); }), "");
}

TEST(GetPcStr, DefaultsWhenTheKeyHoldsANumber) {
  configuration_tree_t tree;
  tree.set("monitor_name", 5);
  EXPECT_FALSE(read_text("monitor_name", 14, "", false).configured);
}

TEST(GetterPaths, HaveNoSeparatorOfTheirOwn) {
  const configuration_tree_t tree;
  EXPECT_EQ(get_pc_int("", 0, 1, 1, false), 1);
  EXPECT_EQ(get_pc_int(".x", 0, 1, 1, false), 1);
  EXPECT_EQ(tree.calls()[0].path, domain);
  EXPECT_EQ(tree.calls()[1].path, domain + ".x");
}

/// Reads one key of each kind and answers the paths that were asked for, with what was printed.
struct asked_t {
  std::vector<std::string> paths;
  std::string output;
};

asked_t ask_for(const std::string &key) {
  const configuration_tree_t tree;
  asked_t asked;
  asked.output = traced_output_of([&] {
    get_pc_int(key.c_str(), 0, 1, 1, true);
    get_pc_uint(key.c_str(), 0, 1, 1, true);
    read_text(key.c_str(), 4, "YYY");
  });
  for (const auto &call : tree.calls())
    asked.paths.push_back(call.path);
  return asked;
}

TEST(GetterPaths, AreCutTo255Characters) {
  const std::string fitting(255 - domain.size(), 'k');
  for (const std::string &key : {fitting, fitting + "X", fitting + std::string(1000, 'X')}) {
    const asked_t asked = ask_for(key);
    EXPECT_EQ(asked.paths, std::vector<std::string>(3, domain + fitting));
    EXPECT_EQ(asked.output, absent_warning("get_pc_int", fitting, "1") + read_trace("get_pc_int", fitting, "1") +
                                absent_warning("get_pc_uint", fitting, "1") + read_trace("get_pc_uint", fitting, "1") +
                                warning("get_pc_str", "Error trying to read \"" + domain + fitting +
                                                          "\" from the platform config. Using:YYY"));
  }
}

}  // namespace
}  // namespace utility_tests
