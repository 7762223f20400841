// Completion of the command line in bash, asked as bash asks.
#include <gmock/gmock.h>
#include <unistd.h>

#include <filesystem>
#include <regex>
#include <sstream>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::IsSupersetOf;
using testing::UnorderedElementsAre;

constexpr const char *bash = "/bin/bash";
constexpr const char *script =
    "set -u; cd \"$PLACE\" || exit 1; source \"$COMPLETION\" || exit 1; COMP_WORDS=(edid-composer \"$@\"); "
    "COMP_CWORD=$#; complete -p edid-composer >/dev/null || exit 1; _edid_composer; printf '%s\\n' \"${COMPREPLY[@]}\"";

class Completion : public cli_fixture_t {
 protected:
  void SetUp() override {
    if (access(bash, X_OK) != 0) {
      GTEST_SKIP() << bash << " is not installed";
    }
    for (const char *folder : {"drm/card0-HDMI-A-1", "drm/card1-DP-1", "other/card7-DP-9", "folder"}) {
      std::filesystem::create_directories(directory_.path(folder));
      directory_.write(std::string(folder) + "/edid", "");
    }
    directory_.write("box.toml", "");
    directory_.write("card.bin", "");
    directory_.write("my tv.bin", "");
  }

  /// What is offered for the last of the words.
  std::vector<std::string> offered(std::vector<std::string> words) {
    words.insert(words.begin(), {"--norc", "-c", script, "bash"});
    process_t process{bash, words};
    process.environment = {"PLACE=" + directory_.path(""), std::string("COMPLETION=") + COMPLETION_FILE,
                           "EDID_COMPOSER_DRM_DIR=drm"};
    const process_result_t result = process.run();
    EXPECT_EQ(result.status, 0);
    EXPECT_EQ(result.error, "");
    std::vector<std::string> lines;
    std::istringstream stream(result.output);
    for (std::string line; std::getline(stream, line);) {
      if (!line.empty()) {
        lines.push_back(line);
      }
    }
    return lines;
  }
};

/// The names in a section of a help text, or its options.
std::vector<std::string> names_in(const std::string &help, const char *pattern) {
  const std::regex expression(pattern);
  std::vector<std::string> names;
  for (auto match = std::sregex_iterator(help.begin(), help.end(), expression); match != std::sregex_iterator();
       ++match) {
    names.push_back((*match)[1]);
  }
  return names;
}

TEST_F(Completion, OffersTheCommandsThatHelpLists) {
  const std::string help = run_cli({"--help"}).output;
  const std::size_t begin = help.find("Subcommands:");
  const auto commands = names_in(help.substr(begin, help.find("\n\n", begin) - begin), "\n  ([a-z][a-z-]*)");
  ASSERT_GE(commands.size(), 7U);
  EXPECT_THAT(offered({""}), testing::UnorderedElementsAreArray(commands));
  EXPECT_THAT(offered({"p"}), UnorderedElementsAre("print", "platform"));
  EXPECT_THAT(offered({"nothing"}), IsEmpty());
}

TEST_F(Completion, OffersTheOptionsThatHelpLists) {
  for (const std::string command :
       {"", "compose", "explain", "print", "diff", "sinks", "check-platform", "audio-mask", "platform"}) {
    const std::vector<std::string> prefix =
        command.empty() ? std::vector<std::string>{} : std::vector<std::string>{command};
    std::vector<std::string> words = prefix;
    words.emplace_back("--help");
    const auto options = names_in(run_cli(words).output, "\n  (?:-[a-z],)?(--[a-z0-9-]+)");
    ASSERT_FALSE(options.empty()) << command;
    words.back() = "--";
    EXPECT_THAT(offered(words), testing::UnorderedElementsAreArray(options)) << command;
  }
}

TEST_F(Completion, OffersTheValuesOfOptions) {
  EXPECT_THAT(offered({"compose", "--3d", ""}), ElementsAre("off", "sink", "on"));
  EXPECT_THAT(offered({"compose", "--3d", "o"}), ElementsAre("off", "on"));
  EXPECT_THAT(offered({"compose", "--format", ""}), ElementsAre("raw", "hex"));
  EXPECT_THAT(offered({"compose", "--port", "1"}), ElementsAre("1", "10", "11", "12", "13", "14"));
  EXPECT_THAT(offered({"compose", "--current-mode", "1280"}), ElementsAre("1280x720p60", "1280x720p50"));
  EXPECT_THAT(offered({"compose", "--latency", ""}), IsEmpty());
}

TEST_F(Completion, OffersWhatTheProgramTakes) {
  for (const std::string option : {"--3d", "--format", "--port", "--current-mode"}) {
    for (const std::string &value : offered({"compose", option, ""})) {
      const process_result_t result =
          run_cli({"compose", option, value, "-o", directory_.path(value == "0..3" ? "several" : "new")});
      EXPECT_EQ(result.status, 0) << option << " " << value << result.error;
    }
  }
}

TEST_F(Completion, OffersValuesBehindAnEqualsSign) {
  EXPECT_THAT(offered({"compose", "--3d", "="}), ElementsAre("off", "sink", "on"));
  EXPECT_THAT(offered({"compose", "--3d", "=", "s"}), ElementsAre("sink"));
}

TEST_F(Completion, OffersFilesAndConnectorsWhereAnEdidIsRead) {
  EXPECT_THAT(offered({"compose", "--sink", "card"}), UnorderedElementsAre("card.bin", "card0-HDMI-A-1", "card1-DP-1"));
  EXPECT_THAT(offered({"print", "--brief", "card0"}), ElementsAre("card0-HDMI-A-1"));
  EXPECT_THAT(offered({"diff", "card.bin", "card1"}), ElementsAre("card1-DP-1"));
  EXPECT_THAT(offered({"print", "my"}), ElementsAre("my tv.bin"));
}

TEST_F(Completion, OffersTheConnectorsOfTheFolderThatIsGiven) {
  EXPECT_THAT(offered({"print", "--drm-dir", "other", "card"}), UnorderedElementsAre("card.bin", "card7-DP-9"));
  EXPECT_THAT(offered({"sinks", "--drm-dir", ""}), UnorderedElementsAre("drm", "other", "folder"));
}

TEST_F(Completion, OffersFilesOnlyWhereNoEdidIsRead) {
  EXPECT_THAT(offered({"check-platform", ""}),
              UnorderedElementsAre("box.toml", "card.bin", "my tv.bin", "drm", "other", "folder"));
  EXPECT_THAT(offered({"compose", "--platform", "b"}), ElementsAre("box.toml"));
  EXPECT_THAT(offered({"compose", "-o", "card"}), ElementsAre("card.bin"));
  EXPECT_THAT(offered({"platform", ""}), IsEmpty());
}

}  // namespace
}  // namespace host_test
