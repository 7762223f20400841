// "diff": two EDIDs field by field.
#include <gmock/gmock.h>

#include <sstream>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

using testing::ContainsRegex;
using testing::EndsWith;
using testing::HasSubstr;
using testing::Not;

std::vector<std::string> lines_of(const std::string &text) {
  std::vector<std::string> lines;
  std::istringstream stream(text);
  for (std::string line; std::getline(stream, line);) {
    lines.push_back(line);
  }
  return lines;
}

class DiffCommand : public cli_fixture_t {
 protected:
  process_result_t diff(const std::string &left, const std::string &right, std::vector<std::string> options = {}) {
    options.insert(options.begin(), "diff");
    options.insert(options.end(), {directory_.write("a.bin", left), directory_.write("b.bin", right)});
    return run_cli(options);
  }

  /// Changes bytes and sets the checksums right again.
  static std::string changed(std::string bytes, std::size_t offset, u8 value) {
    const std::size_t checksum = offset / 128 * 128 + 127;
    bytes[checksum] = static_cast<char>(bytes[checksum] + bytes[offset] - static_cast<char>(value));
    bytes[offset] = static_cast<char>(value);
    return bytes;
  }

  const std::string tv_ = sample_bytes("tv_4k");
};

TEST_F(DiffCommand, OfTheSameEdidMarksNothingAndEndsWithStatusZero) {
  for (const char *name : sample_names) {
    const process_result_t result = diff(sample_bytes(name), sample_bytes(name));
    EXPECT_EQ(result.status, 0) << name;
    EXPECT_EQ(result.error, "");
    for (const std::string &line : lines_of(result.output)) {
      EXPECT_FALSE(line.starts_with('*')) << line;
    }
  }
}

TEST_F(DiffCommand, ComparesWhatHdmi2Added) {
  const process_result_t result = diff(sample_bytes("tv_4k_hdr"), sample_bytes("gaming_monitor"));
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.output, ContainsRegex("\n   highest TMDS rate +600 MHz +600 MHz\n"));
  EXPECT_THAT(result.output, ContainsRegex("\n\\*  auto low-latency mode +- +yes\n"));
  EXPECT_THAT(result.output, ContainsRegex("\n\\*  transfer function +HLG +-\n"));
}

TEST_F(DiffCommand, ShowsBothSidesAndMarksWhatDiffers) {
  const process_result_t result = diff(tv_, changed(tv_, 16, 33));
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.error, "");
  EXPECT_THAT(result.output, ContainsRegex("\n\\*  week +20 +33\n"));
  EXPECT_THAT(result.output, ContainsRegex("\n   monitor name +\"SAMPLE 4K TV\" +\"SAMPLE 4K TV\"\n"));
  EXPECT_THAT(result.output, EndsWith("\n2 bytes differ, the first at offset 16 (0x10)\n"));
}

TEST_F(DiffCommand, OnlyChangesLeavesOutWhatIsTheSame) {
  const process_result_t result = diff(tv_, changed(tv_, 16, 33), {"--only-changes"});
  EXPECT_EQ(result.status, 1);
  const auto lines = lines_of(result.output);
  ASSERT_EQ(lines.size(), 3U);
  EXPECT_THAT(lines[0], ContainsRegex("^ +FIELD +.*a\\.bin +.*b\\.bin$"));
  EXPECT_THAT(lines[1], ContainsRegex("^\\*  week +20 +33$"));
  EXPECT_EQ(diff(tv_, tv_, {"--only-changes"}).output, "");
}

TEST_F(DiffCommand, AlignsListsSoThatOneMissingEntryIsOneDifference) {
  const std::size_t mode = tv_.find("\x1F\x05\x14", 128);
  ASSERT_NE(mode, std::string::npos);
  const process_result_t result = diff(tv_, changed(tv_, mode, 21), {"--only-changes"});
  std::size_t marked = 0;
  for (const std::string &line : lines_of(result.output)) {
    marked += line.starts_with("*  video mode") ? 1 : 0;
  }
  EXPECT_EQ(marked, 1U) << result.output;
  EXPECT_THAT(
      result.output,
      ContainsRegex("\n\\*  video mode +1920x1080p50 16:9 \\(VIC 31\\).* +720\\(1440\\)x576i50 4:3 \\(VIC 21\\)"));
}

TEST_F(DiffCommand, AlignsListsThatHaveTheSameEntriesInOtherPlaces) {
  // Three modes: the first goes, the others move up, another follows.
  const std::size_t mode = tv_.find("\x1F\x05\x14", 128);
  ASSERT_NE(mode, std::string::npos);
  const process_result_t result =
      diff(tv_, changed(changed(changed(tv_, mode, 0x05), mode + 1, 0x14), mode + 2, 21), {"--only-changes"});
  EXPECT_THAT(result.output, ContainsRegex("\n\\*  video mode +1920x1080p50 16:9 \\(VIC 31\\) +-\n"));
  EXPECT_THAT(result.output, ContainsRegex("\n\\*  video mode +- +720\\(1440\\)x576i50 4:3 \\(VIC 21\\)\n"));
}

TEST_F(DiffCommand, EntriesThatOneSideLacksStandAlone) {
  const process_result_t result = diff(sample_bytes("monitor_base_block"), tv_);
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.output, ContainsRegex("\n\\*  4Kx2K mode +- +1 3840x2160p30Hz\n"));
  EXPECT_THAT(result.output, ContainsRegex("\n\\*  HDMI +no +yes\n"));
  EXPECT_THAT(diff(tv_, sample_bytes("av_receiver")).output, ContainsRegex("\n\\*  video latency +[0-9]+ ms +"));
  EXPECT_THAT(result.output, ContainsRegex("\n\\*  physical address +- +2\\.0\\.0\\.0\n"));
}

TEST_F(DiffCommand, BytesThatNoFieldTellsOfStillDiffer) {
  const process_result_t result = diff(tv_, tv_ + std::string(128, '\0'));
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.output, EndsWith("No field differs, but 128 bytes differ, the first at offset 256 (0x100)\n"));
}

TEST_F(DiffCommand, ReadsTextAndStandardInput) {
  const process_result_t result = run_cli({"diff", sample_sink("tv_4k"), "-"}, tv_);
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.output, ContainsRegex("^ +FIELD +.*tv_4k\\.txt +standard input\n"));
}

TEST_F(DiffCommand, WhatDoesNotDecodeIsTroubleAndTheLibrarySaysWhy) {
  std::string damaged = tv_;
  damaged[127] = static_cast<char>(damaged[127] + 1);
  for (const process_result_t &result : {diff(damaged, tv_), diff(tv_, damaged)}) {
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.output, "");
    EXPECT_THAT(result.error, HasSubstr("() ERROR: "));
    EXPECT_THAT(result.error, EndsWith(".bin: the library refused to decode this EDID\n"));
  }
}

TEST_F(DiffCommand, WhatCannotBeReadIsTrouble) {
  const std::string missing = directory_.path("missing");
  expect_bad_input(run_cli({"diff", missing, sample_sink("tv_4k")}), missing + ": No such file or directory");
  expect_bad_input(run_cli({"diff", sample_sink("tv_4k"), missing}), missing + ": No such file or directory");
}

TEST_F(DiffCommand, ControlCharactersOfAnEdidDoNotReachTheTerminal) {
  const std::size_t name = tv_.find("SAMPLE 4K TV");
  const process_result_t result = diff(tv_, changed(tv_, name, 0x1B));
  EXPECT_THAT(result.output, HasSubstr("\"?AMPLE 4K TV\""));
  EXPECT_THAT(result.output, Not(HasSubstr("\x1B")));
}

}  // namespace
}  // namespace host_test
