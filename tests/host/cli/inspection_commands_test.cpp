// "audio-mask" and "platform".
#include "cli/cli_fixture.h"

namespace host_test {
namespace {

void expect_output(const std::vector<std::string> &arguments, const std::string &output) {
  const process_result_t result = run_cli(arguments);
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  EXPECT_EQ(result.output, output);
}

TEST(AudioMaskCommand, NamesTheFormatsOfAMask) {
  expect_output({"audio-mask", "0x201"}, "EDID: Audio mask: 0x00000201 => pcm ac3 \n");
  expect_output({"audio-mask", "513"}, "EDID: Audio mask: 0x00000201 => pcm ac3 \n");
  expect_output({"audio-mask", "0X40"}, "EDID: Audio mask: 0x00000040 => dts \n");
}

TEST(AudioMaskCommand, NamesTheFullAndTheEmptyMask) {
  expect_output({"audio-mask", "0xFFFFFFFF"}, "EDID: Audio mask: 0xFFFFFFFF => All audio formats supported\n");
  expect_output({"audio-mask", "4294967295"}, "EDID: Audio mask: 0xFFFFFFFF => All audio formats supported\n");
  expect_output({"audio-mask", "0"}, "EDID: Audio mask: 0x00000000 => No audio formats\n");
}

TEST(AudioMaskCommand, WhatIsNoMaskIsRefused) {
  for (const std::string mask : {"pcm", "0x", "0x1FFFFFFFF", "4294967296", "-1", "1.5", "0xG", " 1", "1 "}) {
    expect_bad_input(run_cli({"audio-mask", mask}),
                     "MASK: \"" + mask + "\" is not a number of 32 bits, decimal or 0x hexadecimal");
  }
}

TEST(PlatformCommand, PrintsTheDefaultPlatformAsItStandsInItsFile) {
  expect_output({"platform"}, content_of(DEFAULT_PLATFORM_FILE));
}

}  // namespace
}  // namespace host_test
