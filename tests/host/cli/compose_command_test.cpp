// "compose": which EDID arrives for which sink and platform.
#include <gmock/gmock.h>

#include "cli/cli_fixture.h"
#include "cli/composed_edid.h"

namespace host_test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;

class ComposeCommand : public cli_fixture_t {};

TEST_F(ComposeCommand, ComposesFromTheDefaultPlatformAloneWithoutASingleComplaint) {
  const composed_edid_t edid(composed({}));
  EXPECT_TRUE(edid.is_well_formed());
  EXPECT_EQ(edid.monitor_name(), "Media Box");
  EXPECT_THAT(edid.vics(), ElementsAre(16, 4, 5, 3, 2, 1));
  EXPECT_THAT(edid.audio_formats(), ElementsAre(1, 1, 2, 10, 7));
  EXPECT_EQ(edid.physical_address(), "15.15.15.15");
  EXPECT_EQ(output_, "");
}

TEST_F(ComposeCommand, ComposesForEverySampleSinkWithoutASingleComplaint) {
  for (const char *name : sample_names) {
    EXPECT_TRUE(composed_edid_t(composed({"--sink", sample_sink(name)})).is_well_formed()) << name;
    EXPECT_EQ(output_, "") << name;
  }
}

TEST_F(ComposeCommand, TheDefaultPlatformFitsTheExtensionInEveryCase) {
  const std::string all_formats = directory_.write("all.toml", [] {
    std::string platform = content_of(DEFAULT_PLATFORM_FILE);
    const std::string key = "pass_through = 0";
    return platform.replace(platform.find(key), key.size(), "pass_through = 1");
  }());
  for (const char *name : sample_names) {
    EXPECT_TRUE(composed_edid_t(composed({"--sink", sample_sink(name), "--3d", "on", "--latency", "10,20,30,40",
                                          "--platform", all_formats}))
                    .is_well_formed())
        << name;
    EXPECT_THAT(output_, Not(HasSubstr("() ERROR: "))) << name;
  }
}

TEST_F(ComposeCommand, OffersWhatA4kTelevisionTakes) {
  const composed_edid_t edid(composed({"--sink", sample_sink("tv_4k")}));
  EXPECT_THAT(edid.vics(), ElementsAre(16, 31, 32, 34, 33, 4, 19, 5, 20, 3, 2, 18, 17, 1));
  EXPECT_EQ(edid.physical_address(), "2.1.0.0");
  // Flags, deep colour, 300 MHz, latencies, HDMI video, 3D, four HDMI VICs, and 3D of the mandatory modes only.
  EXPECT_EQ(hex_of(edid.hdmi()), "21 00 38 3c ef 2e 2e 33 33 88 80 01 02 03 04");
}

TEST_F(ComposeCommand, TakesTheFiftyHertzFamilyForAFiftyHertzSink) {
  const composed_edid_t edid(composed({"--sink", sample_sink("tv_720p_50hz")}));
  EXPECT_THAT(edid.vics(), ElementsAre(31, 19, 4, 20, 5, 18, 17, 3, 2, 22, 21, 7, 6, 1));
}

TEST_F(ComposeCommand, AMonitorWithoutAnExtensionGivesNoAddress) {
  const composed_edid_t edid(composed({"--sink", sample_sink("monitor_base_block")}));
  EXPECT_EQ(edid.physical_address(), "15.15.15.15");
}

TEST_F(ComposeCommand, ReadsAPlatformFromAFile) {
  std::string platform = content_of(DEFAULT_PLATFORM_FILE);
  platform.replace(platform.find("Media Box"), 9, "Other Box");
  const composed_edid_t edid(composed({"--platform", directory_.write("box.toml", platform)}));
  EXPECT_TRUE(edid.is_well_formed());
  EXPECT_EQ(edid.monitor_name(), "Other Box");
  EXPECT_EQ(output_, "");
}

TEST_F(ComposeCommand, ReadsAPlatformFromStandardInput) {
  std::string platform = content_of(DEFAULT_PLATFORM_FILE);
  platform.replace(platform.find("Media Box"), 9, "Piped Box");
  EXPECT_EQ(composed_edid_t(composed({"--platform", "-"}, platform)).monitor_name(), "Piped Box");
}

TEST_F(ComposeCommand, TheDefaultPlatformAsAFileGivesTheSameEdid) {
  EXPECT_EQ(composed({"--platform", DEFAULT_PLATFORM_FILE}), composed({}));
}

TEST_F(ComposeCommand, AnEmptyPlatformIsComposedFromWithWarningsOnStandardOutput) {
  const std::string bytes = composed({"--platform", directory_.write("empty.toml", "")});
  EXPECT_EQ(bytes.size(), 256U);
  EXPECT_THAT(output_, HasSubstr("() WARNING: Unable to find the platform path:"
                                 "platform.software.drivers.vorex.edid.native_refresh_rate Defaulting to:60\n"));
}

TEST_F(ComposeCommand, ASinkThatDoesNotDecodeIsReportedAndLeftOut) {
  std::string sink = sample_bytes("tv_4k");
  sink[127] = static_cast<char>(sink[127] + 1);
  const composed_edid_t edid(composed({"--sink", directory_.write("bad.bin", sink)}));
  EXPECT_TRUE(edid.is_well_formed());
  EXPECT_EQ(edid.physical_address(), "15.15.15.15");
  EXPECT_THAT(output_, HasSubstr("() ERROR: Failed decoding the edid block 0. Continuing.\n"));
}

class RefusedComposition : public cli_fixture_t {
 protected:
  /// An audio format of unknown extended type, at the place that no mask reaches: it cannot be encoded.
  std::string platform_ = directory_.write(
      "refused.toml", "[platform.software.drivers.vorex.edid.audio]\npass_through = 0\nentry_a = 0x200779\n");
};

TEST_F(RefusedComposition, EndsWithStatusOneAndSaysSo) {
  const process_result_t result = run_cli({"compose", "--platform", platform_, "-o", directory_.path("new.bin")});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.error,
            "edid-composer: the library refused to compose an EDID: Failed encoding short audio. Index:1 Type:0\n");
  EXPECT_THAT(result.output, HasSubstr("() ERROR: Failed encoding the new edid.\n"));
}

TEST_F(RefusedComposition, StrictRefusesAnEdidThatNoSourceCanUse) {
  const std::string nameless = directory_.write("nameless.toml", "[platform.software.drivers.vorex.edid]\n");
  const std::string output = directory_.path("new.bin");
  EXPECT_EQ(run_cli({"compose", "--platform", nameless, "-o", output}).status, 0);
  std::filesystem::remove(output);
  const process_result_t result = run_cli({"compose", "--platform", nameless, "-o", output, "--strict"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.error, HasSubstr("edid-composer: --strict: without a name of 2 characters or more"));
  EXPECT_FALSE(std::filesystem::exists(output));
}

TEST_F(RefusedComposition, StrictRefusesASinkThatIsNotRead) {
  std::string damaged = sample_bytes("tv_4k");
  damaged[127] = static_cast<char>(damaged[127] + 1);
  const std::string sink = directory_.write("sink.bin", damaged);
  const process_result_t result = run_cli({"compose", "--sink", sink, "-o", directory_.path("new.bin"), "--strict"});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.error, "edid-composer: --strict: the sink is not read to its end: base block refused: checksum\n");
  EXPECT_EQ(run_cli({"compose", "--sink", sample_sink("tv_4k"), "-o", directory_.path("new.bin"), "--strict"}).status,
            0);
}

class PlatformSettings : public cli_fixture_t {
 protected:
  std::string platform_with(const std::string &settings) {
    return directory_.write("box.toml", content_of(DEFAULT_PLATFORM_FILE) + "\n[edid-composer]\n" + settings);
  }
};

TEST_F(PlatformSettings, StandInForOptions) {
  const std::string sink = sample_sink("tv_1080p_3d");
  const std::vector<std::string> options = {"--sink", sink,        "--3d",        "off",          "--port",
                                            "2",      "--latency", "40,20,60,20", "--audio-mask", "0x80000001"};
  EXPECT_EQ(composed({"--sink", sink, "--platform",
                      platform_with("3d = \"off\"\nport = 2\nlatency = [40, 20, 60, 20]\naudio-mask = 0x80000001\n")}),
            composed(options));
}

TEST_F(PlatformSettings, GiveWayToTheCommandLine) {
  const std::string sink = sample_sink("tv_1080p_3d");
  EXPECT_EQ(composed({"--sink", sink, "--platform", platform_with("port = 2\n"), "--port", "0"}),
            composed({"--sink", sink}));
}

TEST_F(PlatformSettings, ThatAreWrongAreBadInput) {
  const std::string platform = platform_with("prot = 2\n");
  const process_result_t result = run_cli({"compose", "--platform", platform, "-o", directory_.path("new.bin")});
  EXPECT_EQ(result.status, 2);
  EXPECT_THAT(result.error, HasSubstr(": edid-composer.prot: there is no such setting: did you mean port?\n"));
}

TEST_F(RefusedComposition, WritesNothing) {
  const std::string kept = directory_.write("kept.bin", "what was here before");
  run_cli({"compose", "--platform", platform_, "-o", kept});
  run_cli({"compose", "--platform", platform_, "-o", directory_.path("new.bin")});
  EXPECT_EQ(content_of(kept), "what was here before");
  EXPECT_THAT(directory_.names(), ElementsAre("kept.bin", "refused.toml"));
  EXPECT_EQ(run_cli({"compose", "--platform", platform_, "-o", "-"}).output, "");
}

}  // namespace
}  // namespace host_test
