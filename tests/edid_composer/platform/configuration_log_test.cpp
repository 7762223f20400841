// The complete log of reading a configuration: what is asked for, in which order, and what is said about it.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/platform/configuration_keys.h"
#include "edid_composer/platform/platform_values_reader.h"
#include "support/configuration_tree.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::error;
using composer_lines::trace;
using edid_composer::_read_platform_values;
using test_support::config_operation_t;
using test_support::configuration_tree_t;

const std::string domain = "platform.software.drivers.vorex.edid.";

/// The lines of one reading; tracing or not.
class empty_configuration_log_t {
 public:
  explicit empty_configuration_log_t(bool traced) : traced_(traced) {}

  void absent_number(const std::string &getter, const std::string &key, const std::string &fallback) {
    text_ += test_support::warning_line(
        "utility", getter, "Unable to find the platform path:" + domain + key + " Defaulting to:" + fallback);
    if (traced_) text_ += trace(getter, "Platform config read. Path:" + domain + key + " val:" + fallback);
  }
  void absent_text(const std::string &key, const std::string &fallback) {
    text_ += test_support::warning_line(
        "utility", "get_pc_str",
        "Error trying to read \"" + domain + key + "\" from the platform config. Using:" + fallback);
  }
  void absent_list(const std::string &key) {
    text_ += error("_get_generic_platform_list", "Unabled to find the platform node:" + domain + key + ".\n");
  }
  void absent_video_list(const std::string &kind, const std::string &key, const std::string &type) {
    if (traced_) text_ += trace("_get_platform_list", "Reading " + kind + " list from platform config.");
    absent_list(key);
    text_ += error("_get_platform_list",
                   "A mode list (" + type +
                       ") is empty. Please verify that all of the video mode lists are properly populated with 3D "
                       "mode formated strings.\n");
  }
  const std::string &text() const { return text_; }

 private:
  bool traced_;
  std::string text_;
};

std::string expected_log(bool traced) {
  empty_configuration_log_t log(traced);
  log.absent_number("get_pc_int", "native_refresh_rate", "60");
  log.absent_number("get_pc_int", "current_mode_set_to_priority", "0");
  log.absent_number("get_pc_int", "audio.pass_through", "0");
  log.absent_number("get_pc_int", "underscan", "0");
  log.absent_number("get_pc_int", "is_tv", "0");
  log.absent_number("get_pc_int", "geometry_limit", "0");
  log.absent_number("get_pc_int", "dc_30bit", "0");
  log.absent_number("get_pc_int", "dc_36bit", "0");
  log.absent_number("get_pc_int", "tmds_override", "0");
  log.absent_number("get_pc_int", "supports_ai", "0");
  log.absent_number("get_pc_int", "speaker_entry", "1");
  log.absent_number("get_pc_int", "xvYCC601", "0");
  log.absent_number("get_pc_int", "xvYCC709", "0");
  log.absent_number("get_pc_int", "native_bit", "1");
  log.absent_number("get_pc_uint", "product_id", "0");
  log.absent_number("get_pc_uint", "serial", "0");
  log.absent_number("get_pc_uint", "week", "1");
  log.absent_number("get_pc_uint", "year", "2012");
  log.absent_number("get_pc_uint", "CNC0", "0");
  log.absent_number("get_pc_uint", "CNC1", "0");
  log.absent_number("get_pc_uint", "CNC2", "0");
  log.absent_number("get_pc_uint", "CNC3", "0");
  log.absent_video_list("50Hz priority", "50_hz_priority_list", "0");
  log.absent_video_list("50Hz additional", "50_hz_addition_list", "2");
  log.absent_video_list("60Hz priority", "60_hz_priority_list", "1");
  log.absent_video_list("60Hz additional", "60_hz_addition_list", "3");
  log.absent_list("4k_x_2k_priority_list");
  log.absent_list("4k_x_2k_addition_list");
  log.absent_text("manufacturer_id", "YYY");
  log.absent_text("monitor_name", "");
  log.absent_text("monitor_serial", "");
  log.absent_list("established_timings_1");
  log.absent_list("established_timings_2");
  log.absent_list("manufacturer_timings");
  log.absent_list("standard_timings");
  return log.text();
}

TEST(ConfigurationLog, EmptyConfigurationIsReportedKeyByKeyInTheOrderOfReading) {
  const configuration_tree_t tree;
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  EXPECT_EQ(test_support::output_of([&] { EXPECT_TRUE(_read_platform_values(&values, nullptr)); }),
            expected_log(false));
  EXPECT_TRUE(platform_values_destroy(&values));
}

TEST(ConfigurationLog, EmptyConfigurationIsTracedKeyByKeyToo) {
  const configuration_tree_t tree;
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  EXPECT_EQ(test_support::traced_output_of([&] { EXPECT_TRUE(_read_platform_values(&values, nullptr)); }),
            expected_log(true));
  EXPECT_TRUE(platform_values_destroy(&values));
}

TEST(ConfigurationLog, EveryPathIsAskedForOnceAndFromTheRoot) {
  const configuration_tree_t tree;
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  test_support::output_of([&] { EXPECT_TRUE(_read_platform_values(&values, nullptr)); });
  EXPECT_TRUE(platform_values_destroy(&values));

  std::vector<std::string> paths;
  for (const auto &call : tree.calls()) {
    EXPECT_EQ(call.handle, 0U);
    ASSERT_EQ(call.path.substr(0, domain.size()), domain);
    paths.push_back(call.path.substr(domain.size()));
  }
  std::vector<std::string> expected;
  for (const auto &row : edid_composer::platform_keys()) {
    if (row.key.kind == CONFIGURATION_AUDIO_FORMATS) {
      for (char letter = 'a'; letter <= 'z'; ++letter)
        expected.push_back(std::string("audio.entry_") + letter);
    } else {
      expected.emplace_back(row.key.name);
    }
  }
  EXPECT_EQ(paths, expected);
}

TEST(ConfigurationLog, TextsAreAskedForWithTheSizesOfTheirFields) {
  const configuration_tree_t tree;
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  test_support::output_of([&] { EXPECT_TRUE(_read_platform_values(&values, nullptr)); });
  EXPECT_TRUE(platform_values_destroy(&values));
  std::vector<u32> sizes;
  for (const auto &call : tree.calls()) {
    if (call.operation == config_operation_t::get_str) sizes.push_back(call.size);
  }
  EXPECT_EQ(sizes, (std::vector<u32>{4, 14, 14}));
}

TEST(ConfigurationLog, FinalValueIsTracedAndUnsignedNumbersAsSignedOnes) {
  configuration_tree_t tree;
  tree.fill_completely();
  tree.set("serial", 0xFFFFFFFF);
  tree.set("week", 100);
  tree.set("year", 1985);
  platform_values_t values;
  ASSERT_TRUE(platform_values_init(&values));
  const std::string output =
      test_support::traced_output_of([&] { EXPECT_TRUE(_read_platform_values(&values, nullptr)); });
  const std::string expected =
      trace("get_pc_uint", "Platform config read. Path:" + domain + "serial val:-1") +
      trace("get_pc_uint", "Platform config read. Path:" + domain + "week val:100") +
      test_support::warning_line("utility", "get_pc_uint",
                                 "The value for platform path:" + domain +
                                     "year is smaller than the minimum value. Setting to minimum. Min:1990 Val:1985 "
                                     "Max:2100") +
      trace("get_pc_uint", "Platform config read. Path:" + domain + "year val:1990");
  EXPECT_NE(output.find(expected), std::string::npos) << output;
  EXPECT_EQ(values.serial, 0xFFFFFFFFU);
  EXPECT_EQ(values.week, 53U);
  EXPECT_TRUE(platform_values_destroy(&values));
}

}  // namespace
