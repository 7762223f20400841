// "check-platform": what is read of a configuration, and every mistake with its place.
#include <gmock/gmock.h>

#include <map>
#include <regex>
#include <sstream>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

using testing::ContainsRegex;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

constexpr const char *domain = "platform.software.drivers.vorex.edid";

/// A row of the table.
struct row_t {
  std::string value;
  std::string default_value;
  std::string limits;
  std::string origin;
};

class CheckPlatform : public cli_fixture_t {
 protected:
  process_result_t check(const std::string &content) {
    return run_cli({"check-platform", directory_.write("box.toml", content)});
  }

  /// A configuration without mistakes, in which @p line, if any, takes the place of the line of its key.
  static std::string complete_with(const std::string &line = "") {
    const std::string complete = std::string("[") + domain +
                                 "]\n"
                                 "monitor_name = \"Box\"\n"
                                 "60_hz_priority_list = [\"16\", \"4\", \"3\", \"1\"]\n"
                                 "60_hz_addition_list = [\"16\", \"4\", \"3\", \"1\"]\n"
                                 "50_hz_priority_list = [\"31\", \"19\", \"18\", \"1\"]\n"
                                 "50_hz_addition_list = [\"31\", \"19\", \"18\", \"1\"]\n"
                                 "4k_x_2k_priority_list = []\n"
                                 "4k_x_2k_addition_list = []\n"
                                 "established_timings_1 = []\n"
                                 "established_timings_2 = []\n"
                                 "manufacturer_timings = []\n"
                                 "standard_timings = []\n";
    const std::string key = line.substr(0, line.find(" = "));
    const std::size_t begin = line.empty() ? std::string::npos : complete.find("\n" + key + " = ");
    if (begin == std::string::npos) {
      return complete + line + "\n";
    }
    return complete.substr(0, begin + 1) + line + complete.substr(complete.find('\n', begin + 1));
  }

  /// The findings about a configuration, without the name of its file.
  std::vector<std::string> findings(const std::string &content) {
    const process_result_t result = check(content);
    const std::string prefix = directory_.path("box.toml") + ":";
    std::vector<std::string> found;
    std::istringstream lines(result.output);
    for (std::string line; std::getline(lines, line);) {
      if (line.starts_with(prefix)) {
        found.push_back(line.substr(prefix.size()));
      }
    }
    EXPECT_EQ(result.error, "");
    EXPECT_EQ(result.status, found.empty() ? 0 : 1);
    const std::string count =
        found.empty() ? "no findings" : std::to_string(found.size()) + (found.size() == 1 ? " finding" : " findings");
    EXPECT_THAT(result.output, EndsWith("\n" + count + "\n"));
    return found;
  }

  /// The table about a configuration.
  std::map<std::string, row_t> table(const std::string &content) {
    std::map<std::string, row_t> rows;
    std::istringstream lines(check(content).output);
    const std::regex cells("(.+?)  +(.+?)  +(.+?)  +(.+?)  +(.+)");
    for (std::string line; std::getline(lines, line) && !line.empty();) {
      std::smatch row;
      EXPECT_TRUE(std::regex_match(line, row, cells)) << line;
      rows[row[1]] = {row[2], row[3], row[4], row[5]};
    }
    rows.erase("KEY");
    return rows;
  }
};

TEST_F(CheckPlatform, FindsNothingInTheDefaultPlatform) {
  EXPECT_THAT(findings(content_of(DEFAULT_PLATFORM_FILE)), IsEmpty());
  EXPECT_THAT(findings(complete_with()), IsEmpty());
}

TEST_F(CheckPlatform, TellsValueDefaultLimitsAndOrigin) {
  const auto rows = table(complete_with("year = 2020"));
  EXPECT_EQ(rows.at("year").value, "2020");
  EXPECT_EQ(rows.at("year").default_value, "2012");
  EXPECT_EQ(rows.at("year").limits, "1990 to 2100");
  EXPECT_EQ(rows.at("year").origin, "line 13");
  EXPECT_EQ(rows.at("week").value, "1");
  EXPECT_EQ(rows.at("week").origin, "default");
  EXPECT_EQ(rows.at("monitor_name").value, "\"Box\"");
  EXPECT_EQ(rows.at("monitor_name").limits, "13 characters");
  EXPECT_EQ(rows.at("60_hz_priority_list").value, "4 entries");
  EXPECT_EQ(rows.at("60_hz_priority_list").origin, "line 3");
  EXPECT_EQ(rows.at("audio.entry_a to audio.entry_z").value, "absent");
}

TEST_F(CheckPlatform, ShowsAudioFormatsInWords) {
  const auto rows = table(complete_with("audio = { entry_c = 0x500715 }"));
  EXPECT_EQ(rows.at("audio.entry_c").value, "0x500715 (AC3, 6 channels)");
  EXPECT_EQ(rows.at("audio.entry_c").origin, "line 13");
}

/// What the library itself says of keys, defaults and limits, when it finds nothing, too little and too much.
class KeyTable : public CheckPlatform {
 protected:
  std::string said(const std::string &platform) {
    return run_cli({"compose", "--platform", "-", "-o", directory_.path("new.bin")}, platform).output;
  }

  std::vector<std::smatch> matches(const std::string &text, const char *pattern) {
    const std::regex expression(pattern);
    return {std::sregex_iterator(text.begin(), text.end(), expression), std::sregex_iterator()};
  }
};

TEST_F(KeyTable, NamesTheKeysAndDefaultsThatTheLibraryTells) {
  const std::string empty = std::string("[") + domain + "]\n";
  auto rows = table(empty);
  const std::string output = said(empty);
  const auto numbers =
      matches(output, "path:platform\\.software\\.drivers\\.vorex\\.edid\\.(\\S+) Defaulting to:(-?\\d+)");
  const auto texts =
      matches(output, "read \"platform\\.software\\.drivers\\.vorex\\.edid\\.(\\S+)\" from .* Using:(.*)");
  const auto lists = matches(output, "node:platform\\.software\\.drivers\\.vorex\\.edid\\.(\\S+)\\.\n");
  ASSERT_EQ(numbers.size() + texts.size() + lists.size(), 35U);
  for (const auto &number : numbers) {
    EXPECT_EQ(rows.at(number[1]).default_value, number[2]) << number[1];
    rows.erase(number[1]);
  }
  for (const auto &text : texts) {
    EXPECT_EQ(rows.at(text[1]).default_value, "\"" + text[2].str() + "\"") << text[1];
    rows.erase(text[1]);
  }
  for (const auto &list : lists) {
    EXPECT_EQ(rows.at(list[1]).default_value, "empty") << list[1];
    rows.erase(list[1]);
  }
  ASSERT_EQ(rows.size(), 1U);
  EXPECT_EQ(rows.begin()->first, "audio.entry_a to audio.entry_z");
}

TEST_F(KeyTable, NamesTheLimitsThatTheLibraryTells) {
  const auto rows = table("");
  std::map<std::string, std::string> limits;
  for (const char *value : {"-2147483648", "2147483647", "4294967295"}) {
    std::string platform;
    for (const auto &[key, row] : rows) {
      if (row.limits.find(" to ") != std::string::npos && !row.limits.ends_with("each")) {
        platform += std::string(domain) + "." + key + " = " + value + "\n";
      }
    }
    const std::string output = said(platform);
    for (const auto &match : matches(output,
                                     "path:platform\\.software\\.drivers\\.vorex\\.edid\\.(\\S+) is \\w+ than .* "
                                     "Min:(\\d+) Val:\\S+ Max:(\\d+)")) {
      limits[match[1]] = match[2].str() + " to " + match[3].str();
    }
  }
  EXPECT_EQ(limits.size(), 21U);
  for (const auto &[key, expected] : limits) {
    EXPECT_EQ(rows.at(key).limits, expected) << key;
  }
  EXPECT_EQ(rows.at("serial").limits, "0 to 4294967295");
}

TEST_F(CheckPlatform, NumbersOutsideTheirLimitsAreTold) {
  EXPECT_THAT(findings(complete_with("tmds_override = 2000")),
              ElementsAre("13:1: tmds_override: 2000 is not within 0 to 1275: 1275 is taken"));
  EXPECT_THAT(findings(complete_with("  year = 1985")),
              ElementsAre("13:3: year: 1985 is not within 1990 to 2100: 1990 is taken"));
  EXPECT_THAT(findings(complete_with("dc_36bit = -1")),
              ElementsAre("13:1: dc_36bit: -1 is not within 0 to 1: 0 is taken"));
  EXPECT_EQ(table(complete_with("tmds_override = 2000")).at("tmds_override").value, "1275");
}

TEST_F(CheckPlatform, ANegativeNumberThatIsReadUnsignedIsTooLarge) {
  EXPECT_THAT(findings(complete_with("product_id = -1")),
              ElementsAre("13:1: product_id: 4294967295 is not within 0 to 65535: 65535 is taken"));
  EXPECT_THAT(findings(complete_with("serial = 0xFFFFFFFF")), IsEmpty());
}

TEST_F(CheckPlatform, NumbersWithoutAMeaningAreTold) {
  EXPECT_THAT(findings(complete_with("native_refresh_rate = 55")),
              ElementsAre("13:1: native_refresh_rate: 55 has no meaning: 60 is taken"));
  EXPECT_THAT(findings(complete_with("week = 54")), ElementsAre("13:1: week: 54 has no meaning: 53 is taken"));
  EXPECT_THAT(findings(complete_with("week = 255")), IsEmpty());
  EXPECT_THAT(findings(complete_with("week = 53")), IsEmpty());
}

TEST_F(CheckPlatform, ValuesOfAnotherKindAreTold) {
  EXPECT_THAT(findings(complete_with("week = \"first\"")),
              ElementsAre("13:1: week: holds a text, but an integer is read: the default 1 is taken"));
  EXPECT_THAT(findings(complete_with("week = [1]")),
              ElementsAre("13:1: week: holds a table or list, but an integer is read: the default 1 is taken"));
  EXPECT_THAT(findings(complete_with("manufacturer_id = 5")),
              ElementsAre("13:1: manufacturer_id: holds an integer, but a text is read: the default \"YYY\" is taken"));
  EXPECT_THAT(findings(complete_with("standard_timings = 5")),
              ElementsAre("12:1: standard_timings: holds an integer, but a list is read: it counts as empty"));
}

TEST_F(CheckPlatform, TextsThatAreCutAreTold) {
  EXPECT_THAT(findings(complete_with("monitor_name = \"0123456789ABCDE\"")),
              ElementsAre("2:1: monitor_name: longer than 13 characters: \"0123456789ABC\" is taken"));
  EXPECT_THAT(findings(complete_with("manufacturer_id = \"ABCD\"")),
              ElementsAre("13:1: manufacturer_id: longer than 3 characters: \"ABC\" is taken"));
}

TEST_F(CheckPlatform, ANameThatWouldHideTheExtensionIsTold) {
  const std::string problem =
      " is no name, which has 2 characters or more and begins with no blank: without a name in the EDID, sources find "
      "no extension: neither HDMI nor audio";
  EXPECT_THAT(findings(complete_with("monitor_name = \"B\"")), ElementsAre("2:1: monitor_name: \"B\"" + problem));
  EXPECT_THAT(findings(complete_with("monitor_name = \" Box\"")), ElementsAre("2:1: monitor_name: \" Box\"" + problem));
}

TEST_F(CheckPlatform, EntriesThatACompositionSkipsAreToldWithTheirPlace) {
  EXPECT_THAT(findings(complete_with("60_hz_priority_list = [\"16 FP XYZ\", \"4\",\n  \"65\", 5, \"abc\", \"3\"]")),
              ElementsAre("3:24: 60_hz_priority_list[0]: skipped: Invalid 3D flag \"XYZ\" in 60_hz_priority_list",
                          "4:3: 60_hz_priority_list[2]: skipped: Read a vic value from the platform config file that "
                          "has an unexpected value:65. Range:(1-64) Ignoring and continuing.",
                          "4:9: 60_hz_priority_list[3]: skipped: Invalid platform configuration entry. Expected a "
                          "string. Entry name:3",
                          "4:12: 60_hz_priority_list[4]: skipped: Invalid string \"abc\" in 60_hz_priority_list"));
  EXPECT_THAT(findings(complete_with("established_timings_2 = [0, 8, \"1\"]")),
              ElementsAre("10:29: established_timings_2[1]: skipped: Mode value is not 0 to 7. Val:8 Node:1",
                          "10:32: established_timings_2[2]: skipped: Invalid platform configuration entry. Expected an "
                          "integer. Entry name:2"));
  EXPECT_EQ(table(complete_with("established_timings_2 = [0, 8, \"1\"]")).at("established_timings_2").value,
            "1 of 3 entries");
}

TEST_F(CheckPlatform, EntriesThatAreTakenInAnotherWayAreTold) {
  EXPECT_THAT(findings(complete_with("standard_timings = [\"1280 1024 59.94\"]")),
              ElementsAre("12:21: standard_timings[0]: Only whole refresh rates(59.94) are supported, ie 60 not 59.94. "
                          "Incrementing refresh rate and continuing. Entry:1280 1024 59.94"));
  EXPECT_THAT(findings(complete_with("60_hz_priority_list = [\"16 FP                                      TBH\"]")),
              ElementsAre("3:24: 60_hz_priority_list[0]: longer than 28 characters: the rest is not read"));
}

TEST_F(CheckPlatform, EntriesBeyondWhatCountsAreTold) {
  EXPECT_THAT(findings(complete_with("4k_x_2k_priority_list = [1, 2, 9, 3, 4, 1, 2, 3, 4]")),
              ElementsAre("7:32: 4k_x_2k_priority_list[2]: skipped: Detected a 4k x 2k mode that is not supported. "
                          "Max:4 Received:9 Node:2",
                          "7:50: 4k_x_2k_priority_list[8]: has no effect: only the first 7 entries count"));
  const std::string timing = "\"1280 1024 60\", ";
  std::string nine;
  for (int count = 0; count < 9; ++count) {
    nine += timing;
  }
  EXPECT_THAT(findings(complete_with("standard_timings = [" + nine + "]")),
              ElementsAre("12:" + std::to_string(21 + 8 * timing.size()) +
                          ": standard_timings[8]: has no effect: only the first 8 entries count"));
}

TEST_F(CheckPlatform, ListsThatAreMissingOrLeftEmptyAreTold) {
  std::string platform = complete_with();
  platform.erase(platform.find("manufacturer_timings"), sizeof "manufacturer_timings = []");
  EXPECT_THAT(findings(platform), ElementsAre(" manufacturer_timings: is missing: it counts as empty, and each "
                                              "composition tells an error"));
  EXPECT_THAT(findings(complete_with("50_hz_addition_list = []")),
              ElementsAre("6:1: 50_hz_addition_list: no entry is left, and each composition tells an error: no mode of "
                          "it counts"));
}

TEST_F(CheckPlatform, UnknownKeysAreToldWithTheKeyThatMayBeMeant) {
  EXPECT_THAT(findings(complete_with("60_hz_addtion_list = [\"1\"]")),
              ElementsAre("13:1: 60_hz_addtion_list: nobody reads this key: did you mean 60_hz_addition_list?"));
  EXPECT_THAT(findings(complete_with("cnc0 = 1")),
              ElementsAre("13:1: cnc0: nobody reads this key: did you mean CNC0?"));
  EXPECT_THAT(findings(complete_with("pass_through = 1")),
              ElementsAre("13:1: pass_through: nobody reads this key: did you mean audio.pass_through?"));
  EXPECT_THAT(findings(complete_with("something_else = 1")),
              ElementsAre("13:1: something_else: nobody reads this key"));
  EXPECT_THAT(findings(complete_with("audio = { entry_A = 1, pass_trough = 0 }")),
              ElementsAre("13:11: audio.entry_A: nobody reads this key: did you mean audio.entry_a?",
                          "13:24: audio.pass_trough: nobody reads this key: did you mean audio.pass_through?"));
  EXPECT_THAT(findings(complete_with("[" + std::string(domain) + ".audoi]\nentry_a = 1")),
              ElementsAre(ContainsRegex("^13:[0-9]+: audoi: nobody reads this key: did you mean audio\\?$")));
}

TEST_F(CheckPlatform, KeysInFrontOfTheTableAreTold) {
  EXPECT_THAT(findings("week = 5\nother = 1\n" + complete_with()),
              ElementsAre("1:1: week: nobody reads this key here: it belongs into the table " + std::string(domain)));
}

TEST_F(CheckPlatform, TablesOfOthersAreLeftAlone) {
  EXPECT_THAT(findings(complete_with() + "[platform.software.drivers.other]\nweek = 1\nserial = 2\n"), IsEmpty());
}

TEST_F(CheckPlatform, AMissingTableIsTheOneFinding) {
  const std::string problem = std::string("the table ") + domain + " is missing: every value is the default";
  EXPECT_THAT(findings(""), ElementsAre(" " + problem));
  EXPECT_THAT(findings("[platform.software.drivers.vorx.edid]\nweek = 1\n"),
              ElementsAre("1:28: " + problem + " (vorx: did you mean vorex?)"));
}

TEST_F(CheckPlatform, AudioFormatsThatAreNoneAreTold) {
  EXPECT_THAT(findings(complete_with("audio = { entry_a = 0x070001, entry_b = \"PCM\", entry_c = 0x1077F09 }")),
              ElementsAre("13:11: audio.entry_a: 0x070001 is no audio format: skipped",
                          "13:31: audio.entry_b: holds a text, but an integer is read: skipped",
                          "13:48: audio.entry_c: 0x1077F09 has more than 24 bits: those above are not read"));
}

TEST_F(CheckPlatform, WhatTheLibraryRefusesToComposeIsTold) {
  EXPECT_THAT(findings(complete_with("audio.entry_a = 0x200779")),
              ElementsAre(" the library refuses to compose: Failed encoding the new edid.",
                          "13:7: audio.entry_a: 0x200779 is an extended format without a meaning: what offers it is "
                          "refused"));
}

TEST_F(CheckPlatform, MoreAudioFormatsThanAreEncodedAreTold) {
  std::string formats;
  for (char letter = 'a'; letter <= 'k'; ++letter) {
    formats += std::string("audio.entry_") + letter + " = 0x077F09\n";
  }
  EXPECT_THAT(findings(complete_with(formats)),
              ElementsAre("23:7: audio.entry_k: has no effect: only 10 formats are encoded"));
}

TEST_F(CheckPlatform, ReadsStandardInput) {
  const process_result_t result = run_cli({"check-platform", "-"}, complete_with("week = 300"));
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.output, HasSubstr("\nstandard input:13:1: week: 300 is not within 0 to 255: 255 is taken\n"));
}

TEST_F(CheckPlatform, WhatCannotBeReadIsBadInput) {
  expect_bad_input(run_cli({"check-platform", "/nonexistent.toml"}), "/nonexistent.toml: No such file or directory");
  const std::string file = directory_.path("box.toml");
  expect_bad_input(check("gamma = 2.2\n"), file +
                                               ":1:9: gamma: a floating-point number cannot be stored; use an "
                                               "integer, a string, a boolean, an array or a table");
  const process_result_t malformed = check("week = = 1\n");
  EXPECT_EQ(malformed.status, 2);
  EXPECT_THAT(malformed.error, testing::StartsWith("edid-composer: " + file + ":1:"));
}

TEST_F(CheckPlatform, TheLibrarysOwnLinesDoNotShow) {
  const process_result_t result = check("");
  EXPECT_FALSE(holds_diagnostics(result.output));
  EXPECT_THAT(result.output, Not(HasSubstr("print_platform_node")));
}

}  // namespace
}  // namespace host_test
