// "explain": its tables, and where what goes.
#include <gmock/gmock.h>

#include <algorithm>
#include <sstream>

#include "cli/cli_fixture.h"
#include "cli/composed_edid.h"

namespace host_test {
namespace {

using testing::AllOf;
using testing::EndsWith;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

class Explain : public cli_fixture_t {
 protected:
  /// The tables' lines, with all columns.
  static std::vector<std::string> explained(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), {"explain", "--wide"});
    const process_result_t result = run_cli(arguments);
    EXPECT_EQ(result.status, 0) << result.error;
    std::vector<std::string> lines;
    std::istringstream stream(result.output);
    for (std::string line; std::getline(stream, line);) {
      lines.push_back(line);
    }
    return lines;
  }

  /// The lines of one table, without its heading.
  static std::vector<std::string> table(const std::vector<std::string> &lines, const std::string &title) {
    auto line = std::find(lines.begin(), lines.end(), title);
    EXPECT_NE(line, lines.end()) << title;
    std::vector<std::string> rows;
    for (line += line == lines.end() ? 0 : 2; line < lines.end() && !line->empty(); ++line) {
      rows.push_back(*line);
    }
    return rows;
  }

  static std::string row_of(const std::vector<std::string> &rows, const std::string &name) {
    const auto row = std::find_if(rows.begin(), rows.end(),
                                  [&name](const std::string &text) { return text.find(name) != std::string::npos; });
    EXPECT_NE(row, rows.end()) << name;
    return row != rows.end() ? *row : "";
  }

  /// The default platform with one text replaced by another of as many lines.
  std::string changed_platform(const std::string &old_text, const std::string &new_text) {
    std::string platform = content_of(DEFAULT_PLATFORM_FILE);
    const std::size_t position = platform.find(old_text);
    EXPECT_NE(position, std::string::npos);
    platform.replace(position, old_text.size(), new_text);
    return directory_.write("box.toml", platform);
  }
};

TEST_F(Explain, ListsWhatIsOfferedInTheOrderOfTheEdidBeforeWhatIsLeftOut) {
  const auto rows = table(explained({"--sink", sample_sink("tv_720p_50hz")}), "Video modes");
  const composed_edid_t edid(composed({"--sink", sample_sink("tv_720p_50hz")}));
  const std::vector<u8> vics = edid.vics();
  ASSERT_GT(rows.size(), vics.size());
  for (std::size_t index = 0; index < rows.size(); ++index) {
    if (index < vics.size()) {
      EXPECT_THAT(rows[index], AllOf(StartsWith("offered "), HasSubstr("(VIC " + std::to_string(vics[index]) + ")")));
    } else {
      EXPECT_THAT(rows[index], StartsWith("left out "));
    }
  }
}

TEST_F(Explain, TellsReasonDescriptorAndLine) {
  const auto rows =
      table(explained({"--platform", DEFAULT_PLATFORM_FILE, "--sink", sample_sink("tv_4k")}), "Video modes");
  EXPECT_THAT(row_of(rows, "(VIC 31)"),
              AllOf(HasSubstr("60_hz_priority_list names it, and the sink has it."),
                    HasSubstr("sink: short video descriptor 2"), HasSubstr("platform.toml:77 60_hz_priority_list[1]")));
}

TEST_F(Explain, CountsOnlyEntriesThatAreTakenWhenItTellsTheirLines) {
  const std::string file = changed_platform("\"16\",        # 1920x1080p60", "\"99\", \"16 XY\", \"16\",");
  const auto rows = table(explained({"--platform", file}), "Video modes");
  EXPECT_THAT(row_of(rows, "(VIC 16)"), HasSubstr("box.toml:76 60_hz_priority_list[2]"));
  EXPECT_THAT(row_of(rows, "(VIC 4)"), HasSubstr("box.toml:81 60_hz_priority_list[7]"));
}

TEST_F(Explain, TellsOfTimingsOfTheSinkThatHaveNoVic) {
  const auto rows = table(explained({"--sink", sample_sink("monitor_base_block")}), "Video modes");
  EXPECT_THAT(row_of(rows, "it has no VIC"), AllOf(StartsWith("left out"), HasSubstr("sink: ")));
}

TEST_F(Explain, TellsTheSettingThatAFormatIsLeftOutFor) {
  const auto rows = table(explained({"--audio-mask", "0x1"}), "Audio formats");
  EXPECT_THAT(row_of(rows, "AC3"), AllOf(StartsWith("left out"), HasSubstr("0x1"), EndsWith("--audio-mask 0x1")));
}

TEST_F(Explain, TellsHowAFormatWasNarrowed) {
  const auto rows = table(explained({"--sink", sample_sink("tv_1080p_3d"), "--audio-sink-filter"}), "Audio formats");
  EXPECT_THAT(row_of(rows, " became "), AllOf(StartsWith("changed"), HasSubstr("narrowed")));
}

TEST_F(Explain, TellsTheDerivedValues) {
  const auto rows = table(explained({"--sink", sample_sink("tv_4k"), "--port", "2", "--latency", "10,0,0,0"}),
                          "Limits and derived values");
  EXPECT_THAT(row_of(rows, "refresh family 60 Hz"), HasSubstr("The sink's detailed timing 1 has 60 Hz."));
  EXPECT_THAT(row_of(rows, "physical address 2.3.0.0"), HasSubstr("--port 2"));
  EXPECT_THAT(row_of(rows, "10 ms of the platform"), HasSubstr("video latency"));
  EXPECT_THAT(row_of(rows, "TMDS clock"), HasSubstr("tmds_override = 0"));
}

TEST_F(Explain, WarnsAboveTheTablesOfWhatConcernsTheWholeEdid) {
  const std::string file = changed_platform("monitor_name = \"Media Box\"", "monitor_name = \"\"");
  const auto lines = explained({"--platform", file});
  EXPECT_THAT(row_of(lines, "warning:"), HasSubstr("Without a monitor name"));
  const auto plain = explained({});
  EXPECT_TRUE(std::none_of(plain.begin(), plain.end(),
                           [](const std::string &line) { return line.find("warning") != std::string::npos; }));
}

TEST_F(Explain, BeginsWithWhatMatters) {
  const auto lines = explained({"--sink", sample_sink("tv_4k")});
  ASSERT_GT(lines.size(), 7U);
  EXPECT_THAT(lines[0], AllOf(StartsWith("sink: "), HasSubstr("tv_4k.txt (SAMPLE 4K TV)")));
  EXPECT_EQ(lines[1], "platform:  default platform");
  EXPECT_EQ(lines[2], "status:    All of the sink's EDID was read.");
  EXPECT_EQ(lines[3], "video:     at best 3840x2160p30 (4k:1); preferred: 1920x1080p60 16:9 (VIC 16)");
  EXPECT_THAT(lines[4], StartsWith("audio:     PCM, 8 channels; "));
  EXPECT_THAT(lines[5], StartsWith("lost: "));
  EXPECT_THAT(lines[6], AllOf(StartsWith("reasons: "), HasSubstr(" times: ")));
}

TEST_F(Explain, FitsAHundredColumnsUnlessAllOfItIsAskedFor) {
  for (const char *name : sample_names) {
    const std::string output = run_cli({"explain", "--sink", sample_sink(name)}).output;
    std::istringstream stream(output);
    for (std::string line; std::getline(stream, line);) {
      EXPECT_LE(line.size(), 100U) << line;
    }
    EXPECT_THAT(output, Not(HasSubstr("priority_list[")));
  }
  EXPECT_THAT(run_cli({"explain", "--wide"}).output, HasSubstr("60_hz_priority_list["));
}

TEST_F(Explain, HasAFormatOfBothSidesOnOneRow) {
  const auto rows = table(explained({"--sink", sample_sink("tv_4k")}), "Audio formats");
  EXPECT_THAT(row_of(rows, "AC3, 6 channels"),
              AllOf(StartsWith("offered"), HasSubstr("The platform has it. The sink has it too."),
                    HasSubstr("audio.entry_c"), HasSubstr("sink: short audio descriptor")));
  EXPECT_EQ(std::count_if(rows.begin(), rows.end(),
                          [](const std::string &row) { return row.find("AC3, 6 channels") != std::string::npos; }),
            1);
}

TEST_F(Explain, KeepsWhatTheLibrarySaysOffStandardOutput) {
  const std::string file = changed_platform("week = 1", "week = \"x\"");
  const process_result_t result = run_cli({"explain", "--platform", file});
  EXPECT_EQ(result.status, 0);
  EXPECT_FALSE(holds_diagnostics(result.output));
  EXPECT_TRUE(holds_diagnostics(result.error));
  EXPECT_THAT(run_cli({"explain", "--debug"}).error, HasSubstr("Setting up the new EDID:"));
}

TEST_F(Explain, WritesNoEdid) {
  EXPECT_EQ(explained({}).empty(), false);
  EXPECT_THAT(directory_.names(), testing::IsEmpty());
}

TEST_F(Explain, WritesThePageInsteadOfTheTables) {
  const std::string file = directory_.path("page.html");
  const process_result_t result = run_cli({"explain", "--html", file});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.output, "");
  const std::string page = content_of(file);
  EXPECT_THAT(page, AllOf(StartsWith("<!DOCTYPE html>"), EndsWith("</html>\n"), Not(HasSubstr("{{"))));
  // Of the platform's facts, the decisions, the bytes' fields and the configuration's keys.
  EXPECT_THAT(page, AllOf(HasSubstr("Media Box"), HasSubstr("(VIC 16)"), HasSubstr("148.50 MHz"),
                          HasSubstr("native_refresh_rate")));
  EXPECT_EQ(run_cli({"explain", "--html", "-"}).output, page);
  EXPECT_LT(page.size(), 150000U);
}

TEST_F(Explain, WritesPageAndDocumentTogether) {
  const process_result_t result = run_cli({"explain", "--json", "--html", directory_.path("page.html")});
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.output, StartsWith("{\n  \"version\": 1,"));
  EXPECT_THAT(directory_.names(), testing::ElementsAre("page.html"));
}

TEST_F(Explain, TellsTheExitStatusOfWhatIsWanted) {
  EXPECT_EQ(run_cli({"explain", "--want", "16"}).status, 0);
  EXPECT_EQ(run_cli({"explain", "--want", "4k:1"}).status, 1);
  EXPECT_EQ(run_cli({"explain", "--want", "nothing"}).status, 2);
}

TEST_F(Explain, RefusesWhatDoesNotGoTogether) {
  expect_bad_input(run_cli({"explain", "--port", "0..1"}), "explain looks at one composition: one sink and one port");
  expect_bad_input(run_cli({"explain", "--want", "16", "--html", directory_.path("page.html")}),
                   "--want and --html don't go together");
  for (const std::vector<std::string> &other :
       {std::vector<std::string>{"--json"}, {"--want", "16"}, {"--html", "-"}}) {
    std::vector<std::string> arguments{"explain", "--wide"};
    arguments.insert(arguments.end(), other.begin(), other.end());
    expect_bad_input(run_cli(arguments), "--wide is for the tables: it goes with neither --json, --want nor --html");
  }
  expect_bad_input(run_cli({"explain", "--json", "--html", "-"}),
                   "--json and --html cannot both go to standard output");
  EXPECT_EQ(run_cli({"explain", "--sink", directory_.path("missing.bin")}).status, 2);
  EXPECT_EQ(run_cli({"explain", "--platform", directory_.path("missing.toml")}).status, 2);
  EXPECT_EQ(run_cli({"explain", "--html", directory_.path("no/page.html")}).status, 2);
}

TEST_F(Explain, ReadsThePlatformFromStandardInput) {
  const process_result_t result =
      run_cli({"explain", "--platform", "-", "--want", "63"}, content_of(DEFAULT_PLATFORM_FILE));
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.output, HasSubstr("(standard input:75)"));
}

}  // namespace
}  // namespace host_test
