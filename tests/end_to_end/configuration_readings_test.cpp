// What an observer of the configuration receives, and the table of keys: through the shared library.
#include <gtest/gtest.h>

#include <cstddef>
#include <functional>
#include <map>
#include <set>

#include "composition.h"
#include "support/configuration_keys.h"
#include "support/configuration_tree.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using test_support::configuration_keys;
using test_support::configuration_tree_t;
using test_support::output_of;
using test_support::traced_output_of;

/// A reading with texts of its own.
struct kept_reading_t {
  std::string key;
  u32 reason;
  i32 entry;
  i32 place;
  std::string node;
  std::string text;
  i32 found;
  i32 used;

  bool operator==(const kept_reading_t &) const = default;
};

std::ostream &operator<<(std::ostream &stream, const kept_reading_t &reading) {
  return stream << reading.key << "[" << reading.entry << "] " << configuration_reason_string(reading.reason)
                << " place " << reading.place << " node \"" << reading.node << "\" text \"" << reading.text
                << "\" found " << reading.found << " used " << reading.used;
}

void keep(const configuration_reading_t *reading, void *readings) {
  EXPECT_EQ(reading->size, sizeof(configuration_reading_t));
  static_cast<std::vector<kept_reading_t> *>(readings)->push_back({reading->key->name, reading->reason, reading->entry,
                                                                   reading->place, reading->node, reading->text,
                                                                   reading->found, reading->used});
}

class ConfigurationReadings : public testing::Test {
 protected:
  ConfigurationReadings() { tree_.fill_completely(); }

  compose_request_t request() {
    compose_request_t request{};
    request.size = sizeof request;
    request.new_edid = new_edid_;
    request.new_edid_bytes = sizeof new_edid_;
    request.settings = &settings_;
    return request;
  }

  /// Everything that an observer receives of one composition.
  std::vector<kept_reading_t> observe() {
    std::vector<kept_reading_t> readings;
    compose_request_t observed = request();
    observed.configuration_observer = keep;
    observed.configuration_observer_context = &readings;
    compose_result_t result{};
    result.size = sizeof result;
    output_ = output_of([&] { EXPECT_TRUE(compose_edid_request(&observed, &result)); });
    return readings;
  }

  /// What is received of one key.
  std::vector<kept_reading_t> of(const std::string &key) {
    std::vector<kept_reading_t> found;
    for (const kept_reading_t &reading : observe()) {
      if (reading.key == key) found.push_back(reading);
    }
    return found;
  }

  /// Of the first entry of a list that is given one more, in front of nothing else.
  template <typename value_t>
  kept_reading_t of_entry(const std::string &key, const value_t &value) {
    tree_.remove(key);
    tree_.add(key, value, "node");
    const std::vector<kept_reading_t> readings = of(key);
    EXPECT_EQ(readings.size(), 2U);
    return readings.empty() ? kept_reading_t{} : readings.front();
  }

  configuration_tree_t tree_;
  compose_cfg_t settings_ = test_support::plain_settings();
  u8 new_edid_[256]{};
  std::string output_;
};

const configuration_key_t *key_named(const std::string &name) {
  for (const configuration_key_t *key : configuration_keys()) {
    if (key->name == name) return key;
  }
  return nullptr;
}

TEST(ConfigurationKeys, HoldEachKeyOnceWithWhatItsKindHas) {
  std::set<std::string> names;
  for (const configuration_key_t *key : configuration_keys()) {
    SCOPED_TRACE(key->name);
    EXPECT_EQ(key->size, sizeof *key);
    EXPECT_TRUE(names.insert(key->name).second);
    EXPECT_EQ(key->path, "platform.software.drivers.vorex.edid." + std::string(key->name));
    EXPECT_GE(key->kind, CONFIGURATION_INTEGER);
    EXPECT_LE(key->kind, CONFIGURATION_EXTENDED_VICS);
    EXPECT_LE(key->minimum, key->maximum);
    EXPECT_STRNE(key->meaning, "");
    const bool has_text_entries = key->kind == CONFIGURATION_VIDEO_MODES || key->kind == CONFIGURATION_STANDARD_TIMINGS;
    EXPECT_EQ(key->entry_characters, has_text_entries ? 28U : 0U);
  }
  EXPECT_EQ(names.size(), 69U);
  EXPECT_EQ(configuration_key(69), nullptr);
  EXPECT_EQ(configuration_key(0xFFFFFFFF), nullptr);
}

TEST_F(ConfigurationReadings, CoverEachKeyOnceInTheOrderOfTheTable) {
  tree_.set("hdmi2.enable", 1);
  std::vector<std::string> read;
  for (const kept_reading_t &reading : observe()) {
    if (reading.entry == -1) read.push_back(reading.key);
  }
  std::vector<std::string> keys;
  for (const configuration_key_t *key : configuration_keys())
    keys.emplace_back(key->name);
  EXPECT_EQ(read, keys);
}

TEST_F(ConfigurationReadings, AnEmptyConfigurationGivesTheDefaultsOfTheTable) {
  tree_.clear();
  for (const kept_reading_t &reading : observe()) {
    SCOPED_TRACE(reading.key);
    const configuration_key_t *key = key_named(reading.key);
    EXPECT_EQ(reading.reason, CONFIGURATION_ABSENT);
    EXPECT_EQ(static_cast<u32>(reading.used), key->default_number);
    EXPECT_EQ(reading.text, key->default_text);
    EXPECT_EQ(reading.found, 0);
  }
}

TEST_F(ConfigurationReadings, NumbersStopAtTheLimitsOfTheTable) {
  for (const configuration_key_t *key : configuration_keys()) {
    const bool is_signed = key->kind == CONFIGURATION_INTEGER;
    if (!is_signed && key->kind != CONFIGURATION_UNSIGNED) continue;
    SCOPED_TRACE(key->name);
    for (const std::int64_t value :
         {std::int64_t{INT32_MIN}, std::int64_t{key->minimum} - 1, std::int64_t{key->minimum},
          std::int64_t{key->maximum}, std::int64_t{key->maximum} + 1, std::int64_t{INT32_MAX}}) {
      tree_.set(key->name, value);
      const std::int64_t compared = is_signed ? value : static_cast<u32>(value);
      const std::vector<kept_reading_t> readings = of(key->name);
      ASSERT_EQ(readings.size(), 1U);
      EXPECT_EQ(readings[0].found, static_cast<i32>(value));
      if (compared < key->minimum) {
        EXPECT_EQ(readings[0].reason, CONFIGURATION_TOO_SMALL) << value;
        EXPECT_EQ(static_cast<u32>(readings[0].used), key->minimum);
      } else if (compared > key->maximum) {
        EXPECT_EQ(readings[0].reason, CONFIGURATION_TOO_LARGE) << value;
        EXPECT_EQ(static_cast<u32>(readings[0].used), key->maximum);
      } else {
        EXPECT_EQ(readings[0].reason, CONFIGURATION_TAKEN) << value;
        EXPECT_EQ(readings[0].used, readings[0].found);
      }
    }
  }
}

TEST_F(ConfigurationReadings, NumbersWithoutAMeaningAreReplaced) {
  tree_.set("native_refresh_rate", 55);
  EXPECT_EQ(
      of("native_refresh_rate"),
      (std::vector<kept_reading_t>{{"native_refresh_rate", CONFIGURATION_WITHOUT_MEANING, -1, -1, "", "", 55, 60}}));
  tree_.set("week", 254);
  EXPECT_EQ(of("week"),
            (std::vector<kept_reading_t>{{"week", CONFIGURATION_WITHOUT_MEANING, -1, -1, "", "", 254, 53}}));
  tree_.set("week", 255);
  EXPECT_EQ(of("week"), (std::vector<kept_reading_t>{{"week", CONFIGURATION_TAKEN, -1, -1, "", "", 255, 255}}));
}

TEST_F(ConfigurationReadings, TextsAreThoseThatCount) {
  tree_.set("monitor_name", "0123456789ABCDEF");
  EXPECT_EQ(of("monitor_name"),
            (std::vector<kept_reading_t>{{"monitor_name", CONFIGURATION_TAKEN, -1, -1, "", "0123456789ABC", 0, 0}}));
  tree_.set("manufacturer_id", 5);
  EXPECT_EQ(of("manufacturer_id"),
            (std::vector<kept_reading_t>{{"manufacturer_id", CONFIGURATION_ABSENT, -1, -1, "", "YYY", 0, 0}}));
}

TEST_F(ConfigurationReadings, EntriesStandByTheirPlaceInTheListAndAmongThoseThatCount) {
  tree_.remove("60_hz_priority_list");
  tree_.add("60_hz_priority_list", "16 FP", "first");
  tree_.add("60_hz_priority_list", 4, "second");
  tree_.add_empty("60_hz_priority_list", "third");
  tree_.add("60_hz_priority_list", "3", "fourth");
  const std::string key = "60_hz_priority_list";
  EXPECT_EQ(of(key), (std::vector<kept_reading_t>{{key, CONFIGURATION_TAKEN, 0, 0, "first", "16 FP", 16, 16},
                                                  {key, CONFIGURATION_WRONG_KIND, 1, -1, "second", "", 0, 0},
                                                  {key, CONFIGURATION_WRONG_KIND, 2, -1, "third", "", 0, 0},
                                                  {key, CONFIGURATION_TAKEN, 3, 1, "fourth", "3", 3, 3},
                                                  {key, CONFIGURATION_TAKEN, -1, -1, "", "", 4, 2}}));
}

TEST_F(ConfigurationReadings, EachKindOfListHasItsReasons) {
  const std::string modes = "50_hz_addition_list";
  EXPECT_EQ(of_entry(modes, std::string("abc")),
            (kept_reading_t{modes, CONFIGURATION_NOT_A_NUMBER, 0, -1, "node", "abc", 0, 0}));
  EXPECT_EQ(of_entry(modes, std::string("65")),
            (kept_reading_t{modes, CONFIGURATION_OUT_OF_RANGE, 0, -1, "node", "65", 65, 0}));
  EXPECT_EQ(of_entry(modes, std::string("16 FP 3D")),
            (kept_reading_t{modes, CONFIGURATION_3D_UNKNOWN, 0, -1, "node", "16 FP 3D", 16, 0}));
  const std::string vics = "4k_x_2k_addition_list";
  EXPECT_EQ(of_entry(vics, 5), (kept_reading_t{vics, CONFIGURATION_OUT_OF_RANGE, 0, -1, "node", "", 5, 0}));
  EXPECT_EQ(of_entry(vics, std::string("1")),
            (kept_reading_t{vics, CONFIGURATION_WRONG_KIND, 0, -1, "node", "", 0, 0}));
  const std::string bits = "manufacturer_timings";
  EXPECT_EQ(of_entry(bits, -1), (kept_reading_t{bits, CONFIGURATION_OUT_OF_RANGE, 0, -1, "node", "", -1, 0}));
  EXPECT_EQ(of_entry(bits, 7), (kept_reading_t{bits, CONFIGURATION_TAKEN, 0, 0, "node", "", 7, 7}));
  const std::string timings = "standard_timings";
  const std::map<std::string, kept_reading_t> expected = {
      {"1280 720 60", {timings, CONFIGURATION_TAKEN, 0, 0, "node", "1280 720 60", 60, 60}},
      {"1280 720 59.94", {timings, CONFIGURATION_RATE_ROUNDED_UP, 0, 0, "node", "1280 720 59.94", 59, 60}},
      {"1366 768 60", {timings, CONFIGURATION_WIDTH_NOT_IN_EIGHTS, 0, -1, "node", "1366 768 60", 1366, 0}},
      {"1280 800 60", {timings, CONFIGURATION_HEIGHT_UNKNOWN, 0, -1, "node", "1280 800 60", 800, 0}},
      {"1280 720 124", {timings, CONFIGURATION_OUT_OF_RANGE, 0, -1, "node", "1280 720 124", 124, 0}},
      {"4096 2304 60", {timings, CONFIGURATION_WIDTH_NOT_ENCODABLE, 0, 0, "node", "4096 2304 60", 4096, 2048}},
      {"2288 1287 60", {timings, CONFIGURATION_TAKEN, 0, 0, "node", "2288 1287 60", 60, 60}},
      {"256 256 60", {timings, CONFIGURATION_TAKEN, 0, 0, "node", "256 256 60", 60, 60}},
      {"248 248 60", {timings, CONFIGURATION_WIDTH_NOT_ENCODABLE, 0, 0, "node", "248 248 60", 248, 248}},
  };
  for (const auto &[text, reading] : expected)
    EXPECT_EQ(of_entry(timings, text), reading);
}

/// What the record says of a width is what a reader of the new EDID finds.
TEST_F(ConfigurationReadings, AWidthThatCannotBeEncodedIsReadAsTheRecordSays) {
  const kept_reading_t reading = of_entry("standard_timings", std::string("4096 2304 60"));
  test_support::scoped_edid_t edid;
  ASSERT_EQ(decode_edid_block_0(new_edid_, edid.get()), 1);
  const auto timings = test_support::std_timings_of(edid->std_timings);
  ASSERT_EQ(timings.size(), 1U);
  EXPECT_EQ(timings[0][0], static_cast<u32>(reading.used));
}

TEST_F(ConfigurationReadings, EntriesAfterTheLastThatCountsHaveNoRoom) {
  tree_.remove("4k_x_2k_priority_list");
  for (int count = 0; count < 8; ++count)
    tree_.add("4k_x_2k_priority_list", 1 + count % 4);
  const std::vector<kept_reading_t> readings = of("4k_x_2k_priority_list");
  ASSERT_EQ(readings.size(), 9U);
  EXPECT_EQ(readings[6].reason, CONFIGURATION_TAKEN);
  EXPECT_EQ(readings[7].reason, CONFIGURATION_NO_ROOM);
  EXPECT_EQ(readings[7].place, -1);
  EXPECT_EQ(readings[8].used, 7);
  EXPECT_EQ(readings[8].found, 8);
}

TEST_F(ConfigurationReadings, AListOfModesWithoutAnEntryThatCountsIsEmpty) {
  tree_.remove("50_hz_priority_list");
  tree_.add("50_hz_priority_list", "65");
  EXPECT_EQ(of("50_hz_priority_list").back().reason, CONFIGURATION_EMPTY);
  tree_.remove("standard_timings");
  tree_.add_list("standard_timings");
  EXPECT_EQ(of("standard_timings").back().reason, CONFIGURATION_TAKEN);
}

TEST_F(ConfigurationReadings, AudioFormatsStandByTheirLetters) {
  tree_.clear();
  tree_.set("audio.entry_b", 0x077F09);
  tree_.set("audio.entry_z", -1);
  tree_.set("audio.entry_c", "PCM");
  const std::string key = "audio.entry_?";
  EXPECT_EQ(of(key), (std::vector<kept_reading_t>{{key, CONFIGURATION_TAKEN, 1, 0, "", "", 0x077F09, 0x077F09},
                                                  {key, CONFIGURATION_TAKEN, 25, 1, "", "", -1, -1},
                                                  {key, CONFIGURATION_TAKEN, -1, -1, "", "", 2, 2}}));
}

TEST_F(ConfigurationReadings, NothingElseChangesForBeingObserved) {
  tree_.set("tmds_override", 5000);
  tree_.add("60_hz_priority_list", "65");
  compose_request_t plain = request();
  compose_result_t result{};
  result.size = sizeof result;
  const std::string unobserved = output_of([&] { EXPECT_TRUE(compose_edid_request(&plain, &result)); });
  const std::vector<u8> bytes(std::begin(new_edid_), std::end(new_edid_));
  EXPECT_FALSE(observe().empty());
  EXPECT_EQ(output_, unobserved);
  EXPECT_EQ(bytes, std::vector<u8>(std::begin(new_edid_), std::end(new_edid_)));
}

TEST_F(ConfigurationReadings, GivenPlatformValuesAreNotObserved) {
  test_support::scoped_values_t values;
  std::vector<kept_reading_t> readings;
  compose_request_t observed = request();
  observed.platform_values = values.get();
  observed.configuration_observer = keep;
  observed.configuration_observer_context = &readings;
  compose_result_t result{};
  result.size = sizeof result;
  output_of([&] { compose_edid_request(&observed, &result); });
  EXPECT_TRUE(readings.empty());
}

/// A caller that was compiled before the observer was added has a request that ends where it begins.
TEST_F(ConfigurationReadings, ARequestOfTheFirstVersionIsServed) {
  compose_request_t old = request();
  old.size = offsetof(compose_request_t, configuration_observer);
  old.configuration_observer = [](const configuration_reading_t *, void *) { ADD_FAILURE() << "called"; };
  compose_result_t result{};
  result.size = sizeof result;
  output_of([&] { EXPECT_TRUE(compose_edid_request(&old, &result)); });
  EXPECT_EQ(result.bytes_written, 256U);
  old.size -= 1;
  const std::string refusal = output_of([&] { EXPECT_FALSE(compose_edid_request(&old, &result)); });
  EXPECT_NE(refusal.find("The size of the request is too small."), std::string::npos) << refusal;
}

/// A caller that was compiled with a later header has a result that is larger.
TEST_F(ConfigurationReadings, AResultOfALaterVersionKeepsWhatThisOneDoesNotKnow) {
  struct later_t {
    compose_result_t result;
    u32 added;
  } later{};
  later.result.size = sizeof later;
  later.added = 0xA5A5A5A5;
  const compose_request_t plain = request();
  output_of([&] { EXPECT_TRUE(compose_edid_request(&plain, &later.result)); });
  EXPECT_EQ(later.result.size, sizeof(compose_result_t));
  EXPECT_EQ(later.added, 0xA5A5A5A5U);
}

TEST(ConfigurationReasons, HaveWords) {
  std::set<std::string> words;
  for (u32 reason = CONFIGURATION_TAKEN; reason <= CONFIGURATION_OUT_OF_MEMORY; ++reason)
    words.insert(configuration_reason_string(reason));
  EXPECT_EQ(words.size(), 16U);
  EXPECT_FALSE(words.contains("unknown"));
  EXPECT_STREQ(configuration_reason_string(0), "unknown");
  EXPECT_STREQ(configuration_reason_string(17), "unknown");
}

}  // namespace
