// The forms in which an EDID may arrive, and what is no EDID.
#include <algorithm>
#include <cctype>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

class EdidInput : public cli_fixture_t {
 protected:
  /// What "print" reports for an input, without its title; status 0 is expected.
  std::string report_of(const std::string &content) {
    const process_result_t result = run_cli({"print", directory_.write("edid", content)});
    EXPECT_EQ(result.status, 0) << result.error;
    return result.output.substr(result.output.find('\n') + 1);
  }

  process_result_t refused(const std::string &content) { return run_cli({"print", directory_.write("edid", content)}); }
  std::string edid_path() const { return directory_.path("edid"); }

  const std::string bytes_ = sample_bytes("tv_4k");
};

TEST_F(EdidInput, SamplesHaveTheSizeOfAnEdid) {
  for (const char *name : sample_names) {
    const std::string bytes = sample_bytes(name);
    EXPECT_TRUE(bytes.size() == 128 || bytes.size() == 256) << name << ": " << bytes.size();
  }
}

TEST_F(EdidInput, RawBytesAndEveryFormOfHexTextReadTheSame) {
  const std::string expected = report_of(bytes_);
  EXPECT_NE(expected.find("SAMPLE 4K TV"), std::string::npos);
  std::string upper = hex_of(bytes_);
  std::transform(upper.begin(), upper.end(), upper.begin(), [](unsigned char c) { return std::toupper(c); });

  EXPECT_EQ(report_of(content_of(sample_sink("tv_4k"))), expected);
  EXPECT_EQ(report_of(hex_of(bytes_)), expected);
  EXPECT_EQ(report_of(upper), expected);
  EXPECT_EQ(report_of(hex_of(bytes_, "")), expected);
  EXPECT_EQ(report_of(hex_of(bytes_, "\n") + "\n"), expected);
  EXPECT_EQ(report_of(hex_of(bytes_, "\r\n")), expected);
  EXPECT_EQ(report_of(hex_of(bytes_, ",\t")), expected);
  EXPECT_EQ(report_of("0x" + hex_of(bytes_, ", 0x") + ",\n"), expected);
  EXPECT_EQ(report_of("0X" + hex_of(bytes_, " 0X")), expected);
  EXPECT_EQ(report_of("# A d\xC3\xBCmp, 0xZZ\n\n" + hex_of(bytes_, " # ff\n")), expected);
}

TEST_F(EdidInput, ComposingReadsHexTextLikeRawBytes) {
  const std::string raw = composed({"--sink", directory_.write("raw.bin", bytes_)});
  EXPECT_EQ(composed({"--sink", sample_sink("tv_4k")}), raw);
  EXPECT_EQ(composed({"--sink", "-"}, bytes_), raw);
  EXPECT_EQ(composed({"--sink", "-"}, hex_of(bytes_)), raw);
}

TEST_F(EdidInput, RawBytesWithoutTheHeaderAreStillRaw) {
  std::string bytes = bytes_;
  bytes[0] = '\x01';
  const process_result_t result = refused(bytes);
  EXPECT_EQ(result.status, 1);
  EXPECT_NE(result.output.find("Failed verifying the header."), std::string::npos);
}

TEST_F(EdidInput, AMissingFileIsNamed) {
  expect_bad_input(run_cli({"print", edid_path()}), edid_path() + ": No such file or directory");
  expect_bad_input(run_cli({"compose", "--sink", edid_path(), "-o", directory_.path("new")}),
                   edid_path() + ": No such file or directory");
}

TEST_F(EdidInput, ADirectoryIsNamed) {
  const std::string path = directory_.path("");
  expect_bad_input(run_cli({"print", path}), path + ": Is a directory");
}

TEST_F(EdidInput, AnEmptyFileIsRefused) {
  expect_bad_input(refused(""), edid_path() + ": is empty");
  expect_bad_input(run_cli({"print", "-"}), "standard input: is empty");
}

TEST_F(EdidInput, WhatIsNotWholeBlocksIsRefused) {
  const std::string problem = " bytes are not an EDID, which has 1 to 256 blocks of 128 bytes";
  expect_bad_input(refused(bytes_.substr(0, 127)), edid_path() + ": 127" + problem);
  expect_bad_input(refused(bytes_.substr(0, 200)), edid_path() + ": 200" + problem);
  expect_bad_input(refused(bytes_ + '\0'), edid_path() + ": 257" + problem);
  expect_bad_input(refused(hex_of(bytes_.substr(0, 100))), edid_path() + ": 100" + problem);
  expect_bad_input(refused("# nothing but a comment\n"), edid_path() + ": 0" + problem);
  expect_bad_input(run_cli({"compose", "--sink", "-", "-o", directory_.path("new")}, bytes_.substr(0, 8)),
                   "standard input: 8" + problem);
}

TEST_F(EdidInput, MoreBlocksThanABaseBlockCanCountAreRefused) {
  const std::string bytes = bytes_ + std::string(254 * 128, '\0');
  EXPECT_EQ(refused(bytes).status, 0);
  expect_bad_input(refused(bytes + std::string(128, '\0')),
                   edid_path() + ": 32896 bytes are not an EDID, which has 1 to 256 blocks of 128 bytes");
}

TEST_F(EdidInput, AFileWithoutEndIsRefused) {
  expect_bad_input(run_cli({"print", "/dev/zero"}), "/dev/zero: larger than 1 MiB");
}

TEST_F(EdidInput, BadHexTextIsNamedWithItsLineAndColumn) {
  expect_bad_input(refused("00 ff\n# comment\n00 zz ff\n"), edid_path() + ":3:4: \"zz\" is not hexadecimal");
  expect_bad_input(refused("00 ff f\n"), edid_path() + ":1:7: \"f\" has an odd number of hexadecimal digits");
  expect_bad_input(refused("00\n0x\n"), edid_path() + ":2:1: \"0x\" is not hexadecimal");
  expect_bad_input(refused("00\n\n\t0xfff"), edid_path() + ":3:2: \"0xfff\" has an odd number of hexadecimal digits");
  expect_bad_input(run_cli({"print", "-"}, "no EDID at all"), "standard input:1:1: \"no\" is not hexadecimal");
  expect_bad_input(refused(std::string(40, 'x')),
                   edid_path() + ":1:1: \"" + std::string(32, 'x') + "\" is not hexadecimal");
}

}  // namespace
}  // namespace host_test
