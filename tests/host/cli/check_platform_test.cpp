// "check-platform": what is read of a configuration, and every mistake with its place.
#include <gmock/gmock.h>

#include <algorithm>
#include <filesystem>
#include <map>
#include <regex>
#include <sstream>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

using testing::Contains;
using testing::ContainsRegex;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::IsSupersetOf;
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
    EXPECT_EQ(result.status, counted(found, "error") == 0 ? 0 : 1);
    EXPECT_THAT(result.output, EndsWith("\n" + summary_of(found) + "\n"));
    return found;
  }

  static std::size_t counted(const std::vector<std::string> &findings, const std::string &severity) {
    return static_cast<std::size_t>(std::count_if(findings.begin(), findings.end(), [&](const std::string &finding) {
      return finding.find(" " + severity + ": ") != std::string::npos;
    }));
  }

  static std::string summary_of(const std::vector<std::string> &findings) {
    std::string summary;
    for (const char *severity : {"error", "warning", "note"}) {
      if (const std::size_t count = counted(findings, severity); count != 0) {
        summary += (summary.empty() ? "" : ", ") + std::to_string(count) + " " + severity + (count == 1 ? "" : "s");
      }
    }
    return summary.empty() ? "no findings" : summary;
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
  // These have their defaults without a word.
  ASSERT_EQ(rows.size(), 2U);
  EXPECT_EQ(rows.begin()->first, "audio.entry_a to audio.entry_z");
  EXPECT_EQ(rows.rbegin()->first, "hdmi2.enable");
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
              Contains("13:1: warning: tmds_override: 2000 is not within 0 to 1275: 1275 is taken"));
  EXPECT_THAT(findings(complete_with("  year = 1985")),
              ElementsAre("13:3: warning: year: 1985 is not within 1990 to 2100: 1990 is taken"));
  EXPECT_THAT(findings(complete_with("dc_36bit = -1")),
              ElementsAre("13:1: warning: dc_36bit: -1 is not within 0 to 1: 0 is taken"));
  EXPECT_EQ(table(complete_with("tmds_override = 2000")).at("tmds_override").value, "1275");
}

TEST_F(CheckPlatform, ANegativeNumberThatIsReadUnsignedIsTooLarge) {
  EXPECT_THAT(findings(complete_with("product_id = -1")),
              ElementsAre("13:1: warning: product_id: 4294967295 is not within 0 to 65535: 65535 is taken"));
  EXPECT_THAT(findings(complete_with("serial = 0xFFFFFFFF")), IsEmpty());
}

TEST_F(CheckPlatform, NumbersWithoutAMeaningAreTold) {
  EXPECT_THAT(findings(complete_with("native_refresh_rate = 55")),
              ElementsAre("13:1: warning: native_refresh_rate: 55 has no meaning: 60 is taken"));
  EXPECT_THAT(findings(complete_with("week = 54")), ElementsAre("13:1: warning: week: 54 has no meaning: 53 is taken"));
  EXPECT_THAT(findings(complete_with("week = 255")), IsEmpty());
  EXPECT_THAT(findings(complete_with("week = 53")), IsEmpty());
}

TEST_F(CheckPlatform, ValuesOfAnotherKindAreTold) {
  EXPECT_THAT(findings(complete_with("week = \"first\"")),
              ElementsAre("13:1: warning: week: holds a text, but an integer is read: the default 1 is taken"));
  EXPECT_THAT(
      findings(complete_with("week = [1]")),
      ElementsAre("13:1: warning: week: holds a table or list, but an integer is read: the default 1 is taken"));
  EXPECT_THAT(
      findings(complete_with("manufacturer_id = 5")),
      ElementsAre(
          "13:1: warning: manufacturer_id: holds an integer, but a text is read: the default \"YYY\" is taken"));
  EXPECT_THAT(findings(complete_with("standard_timings = 5")),
              ElementsAre("12:1: warning: standard_timings: holds an integer, but a list is read: it counts as empty"));
}

TEST_F(CheckPlatform, TextsThatAreCutAreTold) {
  EXPECT_THAT(findings(complete_with("monitor_name = \"0123456789ABCDE\"")),
              ElementsAre("2:1: warning: monitor_name: longer than 13 characters: \"0123456789ABC\" is taken"));
  EXPECT_THAT(findings(complete_with("manufacturer_id = \"ABCD\"")),
              ElementsAre("13:1: warning: manufacturer_id: longer than 3 characters: \"ABC\" is taken"));
}

TEST_F(CheckPlatform, ANameThatWouldHideTheExtensionIsAnError) {
  const std::string problem =
      "without a name of 2 characters or more that does not begin with a blank, byte 126 stays 0: no source reads the "
      "extension, so there is neither HDMI nor audio (without a sink and 2 more)";
  EXPECT_THAT(findings(complete_with("monitor_name = \"B\"")), Contains("2:1: error: monitor_name: " + problem));
  EXPECT_THAT(findings(complete_with("monitor_name = \" Box\"")),
              Contains("2:1: warning: monitor_name: \" Box\" is not sent: it needs 2 characters or more, the first of "
                       "them no blank"));
}

TEST_F(CheckPlatform, TextsThatSourcesCannotShowAreTold) {
  EXPECT_THAT(findings(complete_with("monitor_name = \"K\xC3\xBC"
                                     "che\"")),
              ElementsAre("2:1: warning: monitor_name: \"K\xC3\xBC"
                          "che\" holds more than printable ASCII: sources show "
                          "something else, or nothing"));
  EXPECT_THAT(findings(complete_with("manufacturer_id = \"A1\"")),
              ElementsAre("13:1: error: manufacturer_id: \"A1\" is not three letters A to Z: sources read another "
                          "maker"));
  EXPECT_THAT(findings(complete_with("manufacturer_id = \"abc\"")), IsEmpty());
}

TEST_F(CheckPlatform, EntriesThatACompositionPassesOverAreToldWithTheirPlace) {
  EXPECT_THAT(
      findings(complete_with("60_hz_priority_list = [\"16 FP XYZ\", \"4\",\n  \"65\", 5, \"abc\", \"3\"]")),
      IsSupersetOf({"3:24: warning: 60_hz_priority_list[0]: passed over: \"16 FP XYZ\" names a 3D structure that "
                    "is not FP, SBSH or TBH",
                    "4:3: warning: 60_hz_priority_list[2]: passed over: VIC 65 is not within 1 to 64",
                    "4:9: warning: 60_hz_priority_list[3]: passed over: holds an integer, but a text is read",
                    "4:12: warning: 60_hz_priority_list[4]: passed over: \"abc\" does not begin with a VIC"}));
  EXPECT_THAT(
      findings(complete_with("established_timings_2 = [0, 8, \"1\"]")),
      ElementsAre("10:29: warning: established_timings_2[1]: passed over: bit 8 is not within 0 to 7",
                  "10:32: warning: established_timings_2[2]: passed over: holds a text, but an integer is read"));
  EXPECT_EQ(table(complete_with("established_timings_2 = [0, 8, \"1\"]")).at("established_timings_2").value,
            "1 of 3 entries");
  EXPECT_THAT(
      findings(complete_with("standard_timings = [\"1366 768 60\", \"1280 800 60\", \"1280 720 59\"]")),
      ElementsAre("12:21: warning: standard_timings[0]: passed over: width 1366 is no multiple of 8",
                  "12:36: warning: standard_timings[1]: passed over: height 800 is none of those for its width: "
                  "1280, 960, 1024, 720",
                  "12:51: warning: standard_timings[2]: passed over: refresh rate 59 is not within 60 to 123"));
}

TEST_F(CheckPlatform, EntriesThatAreTakenInAnotherWayAreTold) {
  EXPECT_THAT(findings(complete_with("standard_timings = [\"1280 1024 59.94\"]")),
              ElementsAre("12:21: note: standard_timings[0]: refresh rate 59 counts as 60: a fraction is rounded up"));
  EXPECT_THAT(
      findings(complete_with("standard_timings = [\"1920 1080 120\", \"640 480 60\"]")),
      ElementsAre("12:38: warning: standard_timings[1]: refresh rate 60 counts as 61: the end of a longer entry "
                  "before it is taken for a fraction; write .0 after the rate"));
  EXPECT_THAT(findings(complete_with("standard_timings = [\"4096 2304 60\"]")),
              ElementsAre("12:21: warning: standard_timings[0]: width 4096 is not within 256 to 2288: sources read "
                          "2048"));
  EXPECT_THAT(findings(complete_with("60_hz_priority_list = [\"16 FP                                      TBH\", "
                                     "\"4\", \"3\", \"1\"]")),
              ElementsAre("3:24: warning: 60_hz_priority_list[0]: longer than 28 characters: the rest is not read"));
}

TEST_F(CheckPlatform, EntriesBeyondWhatCountsAreTold) {
  EXPECT_THAT(findings(complete_with("4k_x_2k_priority_list = [1, 2, 9, 3, 4, 1, 2, 3, 4]")),
              IsSupersetOf({"7:32: warning: 4k_x_2k_priority_list[2]: passed over: 4Kx2K mode 9 is not within 1 to 4",
                            "7:50: warning: 4k_x_2k_priority_list[8]: passed over: only the first 7 entries have an "
                            "effect"}));
  std::string timings;
  for (int width = 1024; width < 1024 + 9 * 32; width += 32) {
    timings += "\"" + std::to_string(width) + " " + std::to_string(width) + " 60\", ";
  }
  EXPECT_THAT(findings(complete_with("standard_timings = [" + timings + "]")),
              ElementsAre(ContainsRegex(
                  "^12:[0-9]+: warning: standard_timings\\[8\\]: only the first 8 entries have an effect$")));
}

TEST_F(CheckPlatform, RepetitionsAreTold) {
  EXPECT_THAT(findings(complete_with("60_hz_priority_list = [\"16\", \"4\", \"3\", \"16 FP\", \"1\"]")),
              ElementsAre("3:40: warning: 60_hz_priority_list[3]: repeats 60_hz_priority_list[0]: VIC 16 is offered "
                          "twice"));
  EXPECT_THAT(findings(complete_with("established_timings_1 = [5, 5]")),
              ElementsAre("9:29: note: established_timings_1[1]: repeats established_timings_1[0]"));
  EXPECT_THAT(findings(complete_with("audio = { entry_a = 0x077F09, entry_b = 0x077F09 }")),
              ElementsAre("13:31: note: audio.entry_b: has no effect: a format before it covers it"));
}

TEST_F(CheckPlatform, AdditionsThatNoCompositionCanOfferAreTold) {
  EXPECT_THAT(findings(complete_with("60_hz_addition_list = [\"16\", \"4\", \"3\", \"1\", \"5\"]")),
              ElementsAre("4:45: warning: 60_hz_addition_list[4]: no composition can offer VIC 5: 60_hz_priority_list "
                          "does not name it"));
  EXPECT_THAT(findings(complete_with("4k_x_2k_addition_list = [2]")),
              ElementsAre("8:26: warning: 4k_x_2k_addition_list[0]: no composition can offer 4Kx2K mode 2: "
                          "4k_x_2k_priority_list does not name it"));
}

/// A list of the first modes.
std::string modes_up_to(int last, const std::string &structures = "") {
  std::string list = "[";
  for (int vic = 1; vic <= last; ++vic) {
    list += "\"" + std::to_string(vic) + structures + "\", ";
  }
  return list + "]";
}

/// Only a sink that has all of them shows it.
TEST_F(CheckPlatform, MoreModesThanABlockHoldsAreAnError) {
  EXPECT_THAT(findings(complete_with("60_hz_priority_list = " + modes_up_to(31))), IsEmpty());
  EXPECT_THAT(findings(complete_with("60_hz_priority_list = " + modes_up_to(32))),
              ElementsAre("3:1: error: 60_hz_priority_list: 32 modes or more are offered, but a video data block holds "
                          "31: its length field wraps, and sources read garbage (with a 60 Hz sink that takes "
                          "everything)"));
  EXPECT_THAT(findings(complete_with("50_hz_priority_list = " + modes_up_to(40))),
              ElementsAre(HasSubstr("(with a 50 Hz sink that takes everything)")));
}

TEST_F(CheckPlatform, AnHdmiBlockThatIsTooLongIsAnError) {
  EXPECT_THAT(findings(complete_with("60_hz_priority_list = " + modes_up_to(16, " FP TBH"))),
              ElementsAre(ContainsRegex("^ error: the HDMI block needs [0-9]+ bytes after its header, but can have 31: "
                                        "its length field wraps, and sources read garbage")));
}

TEST_F(CheckPlatform, TooFewModesAreTold) {
  EXPECT_THAT(findings(complete_with("60_hz_addition_list = [\"16\"]")),
              ElementsAre("3:1: warning: 60_hz_priority_list: 1 modes are offered, but an EDID has 4 at least: VIC 1 "
                          "stands in for the others (without a sink)"));
}

TEST_F(CheckPlatform, AClockThatHdmiDoesNotHaveIsTold) {
  EXPECT_THAT(findings(complete_with("tmds_override = 400")),
              ElementsAre("13:1: warning: tmds_override: a TMDS clock of 400 MHz is declared, but HDMI 1.4 ends at 340 "
                          "MHz (without a sink and 2 more)"));
  EXPECT_THAT(findings(complete_with("tmds_override = 340")), IsEmpty());
}

TEST_F(CheckPlatform, GivenSinksAreComposedForToo) {
  const std::string box = directory_.write("box.toml", complete_with("dc_36bit = 1\ntmds_override = 340"));
  const process_result_t result = run_cli({"check-platform", box, "--sink", sample_sink("tv_720p_50hz")});
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.output,
              HasSubstr(": warning: dc_30bit: deep colour of 36 bits is offered, which the sink does not "
                        "take (with " +
                        sample_sink("tv_720p_50hz") + ")"));
  EXPECT_EQ(run_cli({"check-platform", box, "--sink", sample_sink("tv_720p_50hz"), "--strict"}).status, 1);
}

TEST_F(CheckPlatform, AFolderOfSinksMayHoldOtherFiles) {
  const std::string box = directory_.write("box.toml", complete_with());
  std::filesystem::create_directory(directory_.path("sinks"));
  directory_.write("sinks/README.md", "Sinks of the laboratory\n");
  std::string broken = sample_bytes("tv_4k");
  broken[255] = static_cast<char>(broken[255] + 1);
  directory_.write("sinks/broken.bin", broken);
  const process_result_t result = run_cli({"check-platform", box, "--sink", directory_.path("sinks")});
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.output, HasSubstr("\npassed over: " + directory_.path("sinks/README.md")));
  EXPECT_THAT(result.output, HasSubstr(": note: the sink is not read to its end: extension refused: checksum (with "
                                       "broken.bin)\n"));
}

TEST_F(CheckPlatform, SettingsOfTheProgramAreChecked) {
  EXPECT_THAT(findings(complete_with("[edid-composer]\n3d = \"off\"\nlatency = [40, 20, 60, 20]\nport = 1\n"
                                     "audio-mask = 0xFFFFFFFF\naudio-sink-filter = true")),
              IsEmpty());
  EXPECT_THAT(
      findings(complete_with("[edid-composer]\n3d = \"maybe\"\nprot = 1\nlatency = [1]\naudio-sink-filter = 2")),
      ElementsAre("14:1: error: edid-composer.3d: \"maybe\" is not off, sink or on",
                  "15:1: error: edid-composer.prot: there is no such setting: did you mean port?",
                  "16:1: error: edid-composer.latency: \"1\" is not four latencies from 0 to 65535 ms, separated "
                  "by commas",
                  "17:1: error: edid-composer.audio-sink-filter: is not true or false"));
}

/// The settings decide what fits.
TEST_F(CheckPlatform, CompositionsHaveTheSettingsOfTheFile) {
  EXPECT_THAT(findings(complete_with("60_hz_priority_list = " + modes_up_to(16, " FP TBH")) +
                       "[edid-composer]\n3d = \"off\"\n"),
              IsEmpty());
}

TEST_F(CheckPlatform, ListsThatAreMissingOrLeftEmptyAreTold) {
  std::string platform = complete_with();
  platform.erase(platform.find("manufacturer_timings"), sizeof "manufacturer_timings = []");
  EXPECT_THAT(findings(platform),
              ElementsAre(" warning: manufacturer_timings: is missing: it counts as empty, and each "
                          "composition logs an error"));
  EXPECT_THAT(findings(complete_with("50_hz_addition_list = []")),
              Contains("6:1: warning: 50_hz_addition_list: no entry of it counts, and each composition logs an error"));
}

TEST_F(CheckPlatform, UnknownKeysAreToldWithTheKeyThatMayBeMeant) {
  EXPECT_THAT(
      findings(complete_with("60_hz_addtion_list = [\"1\"]")),
      ElementsAre("13:1: warning: 60_hz_addtion_list: nobody reads this key: did you mean 60_hz_addition_list?"));
  EXPECT_THAT(findings(complete_with("cnc0 = 1")),
              ElementsAre("13:1: warning: cnc0: nobody reads this key: did you mean CNC0?"));
  EXPECT_THAT(findings(complete_with("pass_through = 1")),
              ElementsAre("13:1: warning: pass_through: nobody reads this key: did you mean audio.pass_through?"));
  EXPECT_THAT(findings(complete_with("something_else = 1")),
              ElementsAre("13:1: warning: something_else: nobody reads this key"));
  EXPECT_THAT(
      findings(complete_with("audio = { entry_A = 1, pass_trough = 0 }")),
      ElementsAre("13:11: warning: audio.entry_A: nobody reads this key: did you mean audio.entry_a?",
                  "13:24: warning: audio.pass_trough: nobody reads this key: did you mean audio.pass_through?"));
  EXPECT_THAT(findings(complete_with("[" + std::string(domain) + ".audoi]\nentry_a = 1")),
              ElementsAre(ContainsRegex("^13:[0-9]+: warning: audoi: nobody reads this key: did you mean audio\\?$")));
}

TEST_F(CheckPlatform, KeysInFrontOfTheTableAreTold) {
  EXPECT_THAT(
      findings("week = 5\nother = 1\n" + complete_with()),
      ElementsAre("1:1: warning: week: nobody reads this key here: it belongs into the table " + std::string(domain)));
}

TEST_F(CheckPlatform, TablesOfOthersAreLeftAlone) {
  EXPECT_THAT(findings(complete_with() + "[platform.software.drivers.other]\nweek = 1\nserial = 2\n"), IsEmpty());
}

TEST_F(CheckPlatform, AMissingTableIsTheOneFinding) {
  const std::string problem = std::string("the table ") + domain + " is missing: every value is the default";
  EXPECT_THAT(findings(""), ElementsAre(" error: " + problem));
  EXPECT_THAT(findings("[platform.software.drivers.vorx.edid]\nweek = 1\n"),
              ElementsAre("1:28: error: " + problem + " (vorx: did you mean vorex?)"));
}

TEST_F(CheckPlatform, AudioFormatsThatAreNoneAreTold) {
  EXPECT_THAT(findings(complete_with("audio = { entry_a = 0x070001, entry_b = \"PCM\", entry_c = 0x1077F09 }")),
              ElementsAre("13:11: warning: audio.entry_a: 0x070001 is no audio format: passed over",
                          "13:31: warning: audio.entry_b: holds a text, but an integer is read: passed over",
                          "13:48: warning: audio.entry_c: 0x1077F09 has more than 24 bits: those above are not read"));
}

TEST_F(CheckPlatform, WhatTheLibraryRefusesToComposeIsAnError) {
  EXPECT_THAT(
      findings(complete_with("audio.entry_a = 0x200779")),
      ElementsAre(" error: the library refuses to compose: Failed encoding short audio. Index:1 Type:0 (without "
                  "a sink and 2 more)",
                  "13:7: error: audio.entry_a: 0x200779 is an extended format without a meaning: the library "
                  "composes nothing that offers it"));
}

TEST_F(CheckPlatform, MoreAudioFormatsThanAreEncodedAreTold) {
  std::string formats;
  for (char letter = 'a'; letter <= 'k'; ++letter) {
    formats += std::string("audio.entry_") + letter + " = " + std::to_string(0x070709 + 8 * (letter - 'a')) + "\n";
  }
  EXPECT_THAT(findings(complete_with(formats)),
              Contains("23:7: warning: audio.entry_k: has no effect: only 10 formats are encoded"));
}

TEST_F(CheckPlatform, ReadsStandardInput) {
  const process_result_t result = run_cli({"check-platform", "-"}, complete_with("week = 300"));
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.output,
              HasSubstr("\nstandard input:13:1: warning: week: 300 is not within 0 to 255: 255 is taken\n"));
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

/// The findings about the table of HDMI 2, without place and severity.
class CheckHdmi2 : public CheckPlatform {
 protected:
  std::vector<std::string> about(const std::string &keys) {
    std::vector<std::string> texts;
    for (const std::string &finding : findings(complete_with() + "[" + domain + ".hdmi2]\n" + keys)) {
      const std::size_t key = finding.find("hdmi2");
      texts.push_back(key == std::string::npos ? finding : finding.substr(key));
    }
    return texts;
  }
};

TEST_F(CheckHdmi2, FindsNothingInTheTableThatTheProgramPrints) {
  const std::string printed = run_cli({"platform", "--hdmi2"}).output;
  EXPECT_EQ(counted(findings(printed), "warning"), 0U);
  EXPECT_EQ(counted(findings(printed), "error"), 0U);
}

TEST_F(CheckHdmi2, FindsKeysThatContradictEachOther) {
  const std::string on = "enable = 1\nvic_priority_list = [97]\ntmds_limit = 600\n";
  const std::string bt2020 = "bt2020_ycc = 2\n";
  EXPECT_THAT(about(on), ElementsAre());
  EXPECT_THAT(about(on + bt2020 + "hdr_pq = 2\n"), ElementsAre());
  EXPECT_THAT(about(on + "hdr_pq = 2\n"), ElementsAre(HasSubstr("hdr_pq: HDR with PQ needs BT.2020")));
  EXPECT_THAT(about(on + "hdr_hlg = 1\n"), ElementsAre(HasSubstr("hdr_hlg: HDR with HLG needs BT.2020")));
  EXPECT_THAT(about(on + "y420 = 2\ndc_36bit_420 = 2\n"), ElementsAre(HasSubstr("ask for 30 bits as well")));
  EXPECT_THAT(about(on + "dc_30bit_420 = 2\n"), ElementsAre(HasSubstr("has no effect: y420 is 0")));
  EXPECT_THAT(about(on + "vrr = 1\nvrr_max = 90\n"), ElementsAre(HasSubstr("ends below 100 Hz")));
  EXPECT_THAT(about(on + "pass_freesync = 1\n"), ElementsAre(HasSubstr("with vrr = 2 only")));
  EXPECT_THAT(about("enable = 1\nvic_priority_list = [95]\nread_request = 1\n"),
              ElementsAre(HasSubstr("read_request: has no effect")));
  EXPECT_THAT(
      about("enable = 1\npreferred_extended = 1\n"),
      ElementsAre(HasSubstr("vic_priority_list: names no mode"), HasSubstr("preferred_extended: has no effect")));
  EXPECT_THAT(about("allm = 1\n"), ElementsAre(HasSubstr("has no effect: enable is not 1")));
}

TEST_F(CheckHdmi2, FindsModesThatNobodyCanGet) {
  EXPECT_THAT(about("enable = 1\nvic_priority_list = [97, 95]\n"),
              ElementsAre("hdmi2.vic_priority_list[0]: no composition can offer VIC 97: it needs 594 MHz, and "
                          "tmds_limit is 340"));
  EXPECT_THAT(about("enable = 1\nvic_priority_list = [97]\ny420 = 2\n"), ElementsAre());
  EXPECT_THAT(about("enable = 1\nvic_priority_list = [95]\nvic_addition_list = [94]\n"),
              ElementsAre(HasSubstr("hdmi2.vic_priority_list does not name it")));
}

TEST_F(CheckHdmi2, FindsUnknownKeysLimitsAndEntries) {
  const std::string on = "enable = 1\nvic_priority_list = [95]\n";
  EXPECT_THAT(about(on + "alm = 1\n"), ElementsAre(HasSubstr("did you mean hdmi2.allm?")));
  EXPECT_THAT(about(on + "tmds_limit = 900\n"), ElementsAre(HasSubstr("900 is not within 165 to 600: 600 is taken")));
  EXPECT_THAT(about("enable = 1\nvic_priority_list = [95, 16]\n"),
              ElementsAre(HasSubstr("passed over: VIC 16 is not within 65 to 127 or 193 to 219")));
}

}  // namespace
}  // namespace host_test
