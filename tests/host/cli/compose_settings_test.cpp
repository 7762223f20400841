// "compose": what its options change.
#include <gmock/gmock.h>

#include "cli/cli_fixture.h"
#include "cli/composed_edid.h"

namespace host_test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;

class ComposeSettings : public cli_fixture_t {
 protected:
  composed_edid_t composed_for(const std::string &sink, std::vector<std::string> arguments) {
    arguments.insert(arguments.end(), {"--sink", sample_sink(sink)});
    return composed_edid_t(composed(arguments));
  }

  /// The byte that begins the HDMI block's video part, for a sink without latencies.
  static bool offers_3d(const composed_edid_t &edid) {
    const std::string block = edid.hdmi();
    return block.size() > 5 && (static_cast<u8>(block[4]) & 0x20) != 0 && (static_cast<u8>(block[5]) & 0x80) != 0;
  }
};

TEST_F(ComposeSettings, ThePortContinuesTheSinksAddress) {
  EXPECT_EQ(composed_for("tv_4k", {}).physical_address(), "2.1.0.0");
  EXPECT_EQ(composed_for("tv_4k", {"--port", "0"}).physical_address(), "2.1.0.0");
  EXPECT_EQ(composed_for("tv_4k", {"--port", "2"}).physical_address(), "2.3.0.0");
  EXPECT_EQ(composed_for("av_receiver", {"--port", "3"}).physical_address(), "3.1.4.0");
  EXPECT_EQ(composed_for("tv_4k", {"--port", "14"}).physical_address(), "2.15.0.0");
}

TEST_F(ComposeSettings, TheAudioMaskTakesFormatsAway) {
  EXPECT_THAT(composed_for("tv_4k", {}).audio_formats(), ElementsAre(1, 1, 2, 10, 7));
  EXPECT_THAT(composed_for("tv_4k", {"--audio-mask", "0xFFFFFFFF"}).audio_formats(), ElementsAre(1, 1, 2, 10, 7));
  EXPECT_THAT(composed_for("tv_4k", {"--audio-mask", "0x3"}).audio_formats(), ElementsAre(1, 1, 2));
  EXPECT_THAT(composed_for("tv_4k", {"--audio-mask", "65"}).audio_formats(), ElementsAre(1, 1, 7));
}

TEST_F(ComposeSettings, TheSinkFilterLeavesOnlyWhatTheSinkPlays) {
  EXPECT_THAT(composed_for("tv_1080p_3d", {}).audio_formats(), ElementsAre(1, 1, 2, 10, 7));
  EXPECT_THAT(composed_for("tv_1080p_3d", {"--audio-sink-filter"}).audio_formats(), ElementsAre(1, 2));
  EXPECT_THAT(composed_for("tv_1080p_3d", {"--audio-sink-filter", "--audio-sink-filter"}).audio_formats(),
              ElementsAre(1, 2));
}

TEST_F(ComposeSettings, ThreeDFollowsTheSinkUnlessToldOtherwise) {
  EXPECT_TRUE(offers_3d(composed_for("tv_1080p_3d", {})));
  EXPECT_TRUE(offers_3d(composed_for("tv_1080p_3d", {"--3d", "sink"})));
  EXPECT_FALSE(offers_3d(composed_for("tv_1080p_3d", {"--3d", "off"})));
  EXPECT_FALSE(offers_3d(composed_for("tv_720p_50hz", {})));
  EXPECT_TRUE(offers_3d(composed_for("tv_720p_50hz", {"--3d", "on"})));
}

TEST_F(ComposeSettings, LatenciesAreAddedToTheSinks) {
  const auto latency_bytes = [this](const std::string &latency) {
    return hex_of(composed_for("tv_4k", {"--latency", latency}).hdmi().substr(5, 4));
  };
  EXPECT_EQ(latency_bytes("0,0,0,0"), "2e 2e 33 33");
  EXPECT_EQ(latency_bytes("10,20,30,40"), "33 38 42 47");
  EXPECT_EQ(latency_bytes("501,0,65535,0"), "ff 2e ff 33");
}

TEST_F(ComposeSettings, TheCurrentModeComesFirstWhenThePlatformWantsIt) {
  std::string platform = content_of(DEFAULT_PLATFORM_FILE);
  const std::string key = "current_mode_set_to_priority = ";
  platform.replace(platform.find(key), key.size() + 1, key + "1");
  const std::string file = directory_.write("current.toml", platform);

  EXPECT_EQ(composed_for("tv_4k", {"--platform", file, "--current-mode", "1280x720p50"}).vics().front(), 19);
  EXPECT_EQ(composed_for("tv_4k", {"--platform", file, "--current-mode", "1920x1080i60"}).vics().front(), 5);
  EXPECT_EQ(composed_for("tv_4k", {"--platform", file}).vics().front(), 16);
  EXPECT_EQ(composed_for("tv_4k", {"--current-mode", "1280x720p50"}).vics().front(), 16);
}

TEST_F(ComposeSettings, DebugTracesOnStandardOutput) {
  const std::string quiet = composed({});
  EXPECT_EQ(output_, "");
  EXPECT_EQ(composed({"--debug"}), quiet);
  EXPECT_THAT(output_, HasSubstr("Setting up the new EDID:"));
  EXPECT_THAT(output_, HasSubstr("\n00 FF FF FF FF FF FF 00 "));
  EXPECT_FALSE(holds_diagnostics(output_));
}

}  // namespace
}  // namespace host_test
