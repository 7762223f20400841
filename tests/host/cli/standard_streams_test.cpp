// Where output goes, and what happens when it cannot.
#include <gmock/gmock.h>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

using testing::HasSubstr;

class StandardStreams : public cli_fixture_t {
 protected:
  process_result_t run_into_full_device(std::vector<std::string> arguments) {
    process_t process{cli_program(), std::move(arguments)};
    process.output_file = "/dev/full";
    return process.run();
  }
};

TEST_F(StandardStreams, StandardOutputCarriesTheBytesAndNothingElse) {
  const std::string expected = composed({"--sink", sample_sink("tv_4k")});
  const process_result_t result = run_cli({"compose", "--sink", sample_sink("tv_4k"), "-o", "-"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.output, expected);
  EXPECT_EQ(result.error, "");
}

TEST_F(StandardStreams, StandardOutputCarriesHexTextOfSixteenBytesALine) {
  const std::string bytes = composed({"--sink", sample_sink("tv_4k")});
  std::string expected;
  for (std::size_t offset = 0; offset < bytes.size(); offset += 16) {
    expected += hex_of(bytes.substr(offset, 16)) + "\n";
  }
  const process_result_t result = run_cli({"compose", "--sink", sample_sink("tv_4k"), "-o", "-", "--format", "hex"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.output, expected);
  EXPECT_EQ(composed({"--sink", sample_sink("tv_4k"), "--format", "hex"}), expected);
  EXPECT_EQ(composed({"--sink", sample_sink("tv_4k"), "--format", "raw"}), bytes);
}

TEST_F(StandardStreams, TheLibrarysOutputMovesToStandardErrorThen) {
  const std::string expected = composed({"--debug"});
  const process_result_t result = run_cli({"compose", "--debug", "-o", "-"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.output, expected);
  EXPECT_THAT(result.error, HasSubstr("Setting up the new EDID:"));
  EXPECT_THAT(result.error, HasSubstr("\n00 FF FF FF FF FF FF 00 "));
}

TEST_F(StandardStreams, ARefusedCompositionSaysWhyOnStandardErrorThen) {
  const std::string platform =
      directory_.write("refused.toml", "[platform.software.drivers.vorex.edid.audio]\nentry_a = 0x200779\n");
  const process_result_t result = run_cli({"compose", "--platform", platform, "-o", "-"});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.output, "");
  EXPECT_THAT(result.error, HasSubstr("() ERROR: Failed encoding the new edid.\n"));
  EXPECT_THAT(result.error,
              testing::EndsWith("\nedid-composer: the library refused to compose an EDID: Failed encoding short audio. "
                                "Index:1 Type:0\n"));
}

TEST_F(StandardStreams, OutputThatCannotBeWrittenIsAnError) {
  for (const std::vector<std::string> &arguments : {std::vector<std::string>{"platform"},
                                                    {"audio-mask", "1"},
                                                    {"print", sample_sink("tv_4k")},
                                                    {"--help"},
                                                    {"compose", "-o", "-"},
                                                    {"compose", "--debug", "-o", directory_.path("new.bin")}}) {
    const process_result_t result = run_into_full_device(arguments);
    EXPECT_EQ(result.status, 2) << arguments.front();
    EXPECT_EQ(result.error, "edid-composer: standard output: cannot write: No space left on device\n")
        << arguments.front();
  }
}

}  // namespace
}  // namespace host_test
