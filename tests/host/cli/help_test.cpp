// "--help" and "--version".
#include <gmock/gmock.h>
#include <sys/stat.h>

#include <filesystem>
#include <sstream>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

using testing::HasSubstr;
using testing::MatchesRegex;

constexpr const char *commands[] = {"compose", "explain",        "print",      "diff",
                                    "sinks",   "check-platform", "audio-mask", "platform"};

TEST(Help, ListsTheCommandsOnStandardOutput) {
  const process_result_t result = run_cli({"--help"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  for (const char *command : commands) {
    EXPECT_THAT(result.output, HasSubstr(std::string("\n  ") + command + " "));
  }
}

TEST(Help, ListsTheOptionsOfACommand) {
  const process_result_t result = run_cli({"compose", "--help"});
  EXPECT_EQ(result.status, 0);
  for (const char *option : {"--platform FILE", "--sink FILE", "--port N", "--current-mode MODE", "--audio-mask MASK",
                             "--audio-sink-filter", "--3d off|sink|on", "--latency V,A,IV,IA", "--debug",
                             "-o,--output FILE", "--drm-dir DIR", "--format raw|hex", "--jobs N", "--log"}) {
    EXPECT_THAT(result.output, HasSubstr(std::string("\n  ") + option + " "));
  }
  EXPECT_THAT(result.output, HasSubstr("\nUsage: edid-composer compose "));
}

TEST(Version, TellsThatOfTheProgramAndThatOfTheLibrary) {
  const process_result_t result = run_cli({"--version"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  EXPECT_THAT(result.output,
              MatchesRegex("edid-composer [0-9]+\\.[0-9]+\\.[0-9]+\n#@# libedid_composer\\.so Unofficial Build .+\n"));
}

/// The command lines in the section of examples of a help text.
std::vector<std::string> examples_in(const std::string &help) {
  std::vector<std::string> examples;
  const std::size_t section = help.find("\nExamples:\n");
  std::istringstream lines(section == std::string::npos ? "" : help.substr(section));
  for (std::string line; std::getline(lines, line);) {
    if (line.find("edid-composer ") != std::string::npos) {
      examples.push_back(line);
    }
  }
  return examples;
}

/// A folder where everything is that the examples name.
class Examples : public cli_fixture_t {
 protected:
  Examples() {
    for (const char *folder : {"bin", "sinks", "drm/card0-HDMI-A-1", "edids"}) {
      std::filesystem::create_directories(directory_.path(folder));
    }
    std::filesystem::create_symlink(cli_program(), directory_.path("bin/edid-composer"));
    directory_.write("bin/xrandr", "#!/bin/sh\nprintf 'HDMI-1 connected\\n\\tEDID: \\n'\ncat tv.hex\n");
    chmod(directory_.path("bin/xrandr").c_str(), 0700);
    directory_.write("tv.hex", hex_of(sample_bytes("tv_4k"), "") + "\n");
    for (const char *name : {"tv.bin", "before.bin", "drm/card0-HDMI-A-1/edid", "sinks/tv.bin"}) {
      directory_.write(name, sample_bytes("tv_4k"));
    }
    for (const char *name : {"new.bin", "after.bin", "sinks/other.bin"}) {
      directory_.write(name, sample_bytes("tv_1080p_3d"));
    }
    directory_.write("box.toml", content_of(DEFAULT_PLATFORM_FILE));
  }

  process_result_t run(const std::string &line) {
    process_t shell{"/bin/sh", {"-c", "cd \"$PLACE\" && PATH=\"$PWD/bin:$PATH\" && " + line}};
    shell.environment = {"PLACE=" + directory_.path(""), "EDID_COMPOSER_DRM_DIR=drm"};
    return shell.run();
  }
};

TEST_F(Examples, OfEveryHelpTextRun) {
  std::vector<std::string> texts{run_cli({"--help"}).output};
  for (const char *command : commands) {
    texts.push_back(run_cli({command, "--help"}).output);
  }
  for (const std::string &text : texts) {
    const std::vector<std::string> examples = examples_in(text);
    EXPECT_FALSE(examples.empty()) << text;
    for (const std::string &line : examples) {
      const process_result_t result = run(line);
      const bool is_diff = line.find("edid-composer diff") != std::string::npos;
      EXPECT_EQ(result.status, is_diff ? 1 : 0) << line << "\n" << result.error << result.output;
      EXPECT_EQ(result.error, "") << line;
    }
  }
}

}  // namespace
}  // namespace host_test
