// EDIDs of the displays at this machine: "sinks", and connectors in place of files.
#include <gmock/gmock.h>

#include <filesystem>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

using testing::HasSubstr;

/// A machine with its own connectors.
class Connectors : public cli_fixture_t {
 protected:
  Connectors() {
    std::filesystem::create_directory(machine_);
    std::filesystem::create_directory(machine_ + "/renderD128");
    connect("card1-HDMI-A-1", sample_bytes("tv_4k"));
    connect("card0-DP-1", "");
    connect("card0-VGA-1", sample_bytes("monitor_base_block"));
  }

  void connect(const std::string &name, const std::string &edid) {
    std::filesystem::create_directory(machine_ + "/" + name);
    directory_.write("drm/" + name + "/edid", edid);
  }

  process_result_t run(std::vector<std::string> arguments) {
    arguments.insert(arguments.end(), {"--drm-dir", machine_});
    return run_cli(arguments);
  }

  const std::string machine_ = directory_.path("drm");
};

TEST_F(Connectors, AreListedByNameWithTheirDisplays) {
  std::string damaged = sample_bytes("tv_4k");
  damaged[9] = static_cast<char>(damaged[9] + 1);
  connect("card2-HDMI-A-2", damaged);
  connect("card2-HDMI-A-3", "not an EDID");
  std::string hostile = sample_bytes("monitor_base_block");
  const std::size_t name = hostile.find(std::string("\0\0\0\xFC\0", 5));
  ASSERT_NE(name, std::string::npos);
  hostile[127] = static_cast<char>(hostile[127] + hostile[name + 5] - '\x1B');
  hostile[name + 5] = '\x1B';
  connect("card3-DP-1", hostile);

  const process_result_t result = run({"sinks"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  EXPECT_EQ(result.output.substr(0, result.output.find("card3")),
            "CONNECTOR       MONITOR                 ADDRESS\n"
            "card0-DP-1      (not connected)         -\n"
            "card0-VGA-1     SAMPLE 22W              -\n"
            "card1-HDMI-A-1  SAMPLE 4K TV            2.0.0.0\n"
            "card2-HDMI-A-2  (EDID does not decode)  -\n"
            "card2-HDMI-A-3  (EDID cannot be read)   -\n");
  EXPECT_THAT(result.output, HasSubstr("\ncard3-DP-1      ?"));
}

TEST_F(Connectors, AreFoundThroughTheEnvironmentToo) {
  process_t process{cli_program(), {"sinks"}};
  process.environment = {"EDID_COMPOSER_DRM_DIR=" + machine_};
  EXPECT_EQ(process.run().output, run({"sinks"}).output);
}

TEST_F(Connectors, AMachineWithoutAnyIsAnError) {
  const std::string empty = directory_.path("empty");
  expect_bad_input(run_cli({"sinks", "--drm-dir", empty}), empty + ": No such file or directory");
  std::filesystem::create_directory(empty);
  expect_bad_input(run_cli({"sinks", "--drm-dir", empty}), empty + ": holds no connectors");
}

TEST_F(Connectors, StandInPlaceOfFilesInEveryCommand) {
  const std::string file = directory_.write("tv.bin", sample_bytes("tv_4k"));
  const std::string expected = composed({"--sink", file});
  EXPECT_EQ(composed({"--sink", "card1-HDMI-A-1", "--drm-dir", machine_}), expected);
  EXPECT_EQ(composed({"--sink", "HDMI-A-1", "--drm-dir", machine_}), expected);
  const process_result_t printed = run({"print", "card1-HDMI-A-1"});
  EXPECT_EQ(printed.status, 0);
  EXPECT_THAT(printed.output, HasSubstr("card1-HDMI-A-1\nVersion.Revision    = 1.3\n"));
  EXPECT_EQ(run({"diff", "HDMI-A-1", file}).status, 0);
}

TEST_F(Connectors, AFileOfThatNameComesFirst) {
  directory_.write("HDMI-A-1", sample_bytes("tv_720p_50hz"));
  process_t shell{"/bin/sh", {"-c", "cd \"$PLACE\" && exec \"$PROGRAM\" print --brief HDMI-A-1"}};
  shell.environment = {"PLACE=" + directory_.path(""), std::string("PROGRAM=") + cli_program(),
                       "EDID_COMPOSER_DRM_DIR=" + machine_};
  const process_result_t result = shell.run();
  EXPECT_EQ(result.status, 0) << result.error;
  EXPECT_EQ(result.output.find("SAMPLE 4K TV"), std::string::npos);
}

TEST_F(Connectors, WithoutADisplayAreRefused) {
  expect_bad_input(run({"print", "card0-DP-1"}), "card0-DP-1: no display is connected");
}

TEST_F(Connectors, OfSeveralCardsAreNotGuessed) {
  connect("card2-HDMI-A-1", sample_bytes("tv_720p_50hz"));
  expect_bad_input(run({"print", "HDMI-A-1"}), "HDMI-A-1: may be card1-HDMI-A-1 or card2-HDMI-A-1");
}

TEST_F(Connectors, ThatAreNoneAreMissingFiles) {
  expect_bad_input(run({"print", "card1-HDMI-A-9"}), "card1-HDMI-A-9: No such file or directory");
}

TEST_F(Connectors, WhatIsNoEdidIsNamedWithItsFile) {
  connect("card1-HDMI-A-1", std::string(100, '\0'));
  expect_bad_input(
      run({"print", "HDMI-A-1"}),
      machine_ + "/card1-HDMI-A-1/edid: 100 bytes are not an EDID, which has 1 to 256 blocks of 128 bytes");
}

}  // namespace
}  // namespace host_test
