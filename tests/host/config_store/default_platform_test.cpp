// The default platform: complete, within limits, and the same as its printed text.
#include <algorithm>
#include <cstring>

#include "config_store/store_fixture.h"

namespace host_test {
namespace {

const std::string domain = "platform.software.drivers.vorex.edid.";

class DefaultPlatform : public testing::Test {
 protected:
  void SetUp() override { ASSERT_TRUE(config_store_load_default()) << config_store_error(); }
};

struct number_key_t {
  const char *key;
  i32 min;
  i32 max;
};

/// Every number that the library reads, with its limits.
constexpr number_key_t number_keys[] = {
    {"native_refresh_rate", 50, 60},
    {"current_mode_set_to_priority", 0, 1},
    {"audio.pass_through", 0, 2},
    {"underscan", 0, 1},
    {"is_tv", 0, 1},
    {"geometry_limit", 0, 1},
    {"dc_30bit", 0, 1},
    {"dc_36bit", 0, 1},
    {"tmds_override", 0, 1275},
    {"supports_ai", 0, 2},
    {"speaker_entry", 1, 2047},
    {"xvYCC601", 0, 2},
    {"xvYCC709", 0, 2},
    {"native_bit", 0, 1},
    {"product_id", 0, 65535},
    {"serial", INT32_MIN, INT32_MAX},
    {"week", 0, 255},
    {"year", 1990, 2100},
    {"CNC0", 0, 2},
    {"CNC1", 0, 2},
    {"CNC2", 0, 2},
    {"CNC3", 0, 2},
};

TEST_F(DefaultPlatform, HoldsEveryNumberWithinItsLimits) {
  for (const number_key_t &number : number_keys) {
    const auto value = integer_at(domain + number.key);
    ASSERT_TRUE(value.has_value()) << number.key;
    EXPECT_GE(*value, number.min) << number.key;
    EXPECT_LE(*value, number.max) << number.key;
  }
}

TEST_F(DefaultPlatform, HoldsEveryTextAndItFits) {
  EXPECT_EQ(text_at(domain + "manufacturer_id").value().size(), 3U);
  for (const char *key : {"monitor_name", "monitor_serial"}) {
    const std::string text = text_at(domain + key).value();
    EXPECT_GE(text.size(), 2U) << key;
    EXPECT_LE(text.size(), 13U) << key;
    EXPECT_NE(text.front(), ' ') << key;
  }
}

TEST_F(DefaultPlatform, HoldsFourFilledVideoLists) {
  for (const char *key : {"50_hz_priority_list", "50_hz_addition_list", "60_hz_priority_list", "60_hz_addition_list"}) {
    const auto entries = children_of(domain + key);
    EXPECT_GE(entries.size(), 4U) << key;
    EXPECT_LE(entries.size(), 31U) << key;
    for (const std::string &entry : entries) {
      EXPECT_LE(text_at(domain + key + "." + entry).value().size(), 28U) << key;
    }
  }
}

TEST_F(DefaultPlatform, MarksTheMandatory3dModes) {
  for (const char *list : {"60_hz_priority_list", "50_hz_priority_list"}) {
    std::vector<std::string> entries;
    for (const std::string &entry : children_of(domain + list)) {
      entries.push_back(text_at(domain + list + "." + entry).value());
    }
    for (const char *mode : {"32 FP TBH", "4 FP TBH", "5 SBSH", "19 FP TBH", "20 SBSH"}) {
      EXPECT_EQ(std::count(entries.begin(), entries.end(), mode), 1) << list << ": " << mode;
    }
  }
}

TEST_F(DefaultPlatform, HoldsEveryOtherListWithEntriesInTheirLimits) {
  struct list_key_t {
    const char *key;
    i32 min;
    i32 max;
  };
  for (const list_key_t &list : {list_key_t{"4k_x_2k_priority_list", 1, 4}, list_key_t{"4k_x_2k_addition_list", 1, 4},
                                 list_key_t{"established_timings_1", 0, 7}, list_key_t{"established_timings_2", 0, 7},
                                 list_key_t{"manufacturer_timings", 0, 7}}) {
    u32 node = 0;
    EXPECT_EQ(config_node_find(0, (domain + list.key).c_str(), &node), 0) << list.key;
    for (const std::string &entry : children_of(domain + list.key)) {
      const i32 value = integer_at(domain + list.key + "." + entry).value();
      EXPECT_GE(value, list.min) << list.key;
      EXPECT_LE(value, list.max) << list.key;
    }
  }
  EXPECT_FALSE(children_of(domain + "4k_x_2k_priority_list").empty());
  EXPECT_FALSE(children_of(domain + "standard_timings").empty());
}

TEST_F(DefaultPlatform, OffersPcmAc3EnhancedAc3AndDts) {
  std::vector<u32> formats;
  for (char letter = 'a'; letter <= 'z'; ++letter) {
    if (const auto entry = integer_at(domain + "audio.entry_" + letter)) {
      formats.push_back((static_cast<u32>(*entry) & 0x78U) >> 3);
    }
  }
  for (const u32 format : {1U, 2U, 10U, 7U}) {
    EXPECT_NE(std::find(formats.begin(), formats.end(), format), formats.end()) << format;
  }
}

TEST_F(DefaultPlatform, HoldsNoKeyThatTheLibraryDoesNotRead) {
  std::vector<std::string> known{"manufacturer_id",       "monitor_name",
                                 "monitor_serial",        "50_hz_priority_list",
                                 "50_hz_addition_list",   "60_hz_priority_list",
                                 "60_hz_addition_list",   "4k_x_2k_priority_list",
                                 "4k_x_2k_addition_list", "established_timings_1",
                                 "established_timings_2", "manufacturer_timings",
                                 "standard_timings",      "audio"};
  for (const number_key_t &number : number_keys) {
    known.emplace_back(number.key);
  }
  for (const std::string &key : children_of("platform.software.drivers.vorex.edid")) {
    EXPECT_NE(std::find(known.begin(), known.end(), key), known.end()) << key;
  }
}

TEST_F(DefaultPlatform, ItsTextIsItsDocument) {
  const char *text = config_store_default_text();
  EXPECT_EQ(std::string(text).substr(0, 2), "# ");
  const auto before = children_of("platform.software.drivers.vorex.edid");
  ASSERT_TRUE(config_store_load_text(text, std::strlen(text), "printed")) << config_store_error();
  EXPECT_EQ(children_of("platform.software.drivers.vorex.edid"), before);
  EXPECT_GT(before.size(), 30U);
}

}  // namespace
}  // namespace host_test
