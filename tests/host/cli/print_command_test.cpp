// "print": the report, its forms, and EDIDs that do not decode.
#include <gmock/gmock.h>

#include "cli/cli_fixture.h"
#include "support/terminal.h"

namespace host_test {
namespace {

using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

class PrintCommand : public cli_fixture_t {
 protected:
  process_result_t print(const std::string &content) {
    return run_cli({"print", directory_.write("sink.bin", content)});
  }
};

TEST_F(PrintCommand, PrintsEveryFieldUnderTheNameOfTheFile) {
  const process_result_t result = run_cli({"print", sample_sink("tv_4k")});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  EXPECT_THAT(result.output, StartsWith("tv_4k.txt\nVersion.Revision    = 1.3\nManufacture Name    = ZQT\n"));
  EXPECT_THAT(result.output, HasSubstr("\nMonitor name        = \"SAMPLE 4K TV\"\n"));
  EXPECT_THAT(result.output, HasSubstr("\n4k x 2k Modes: Num:4\n\t1\t3840x2160p30Hz\n"));
  EXPECT_THAT(result.output, HasSubstr("\nAddress           = 2.0.0.0\n"));
}

TEST_F(PrintCommand, BriefPrintsTheShortReport) {
  const process_result_t result = run_cli({"print", "--brief", sample_sink("tv_4k")});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  EXPECT_THAT(result.output, StartsWith("tv_4k.txt\n\tManufacter   : ZQT\n\tMonitor Name : \"SAMPLE 4K TV\"\n"));
  EXPECT_THAT(result.output, HasSubstr("\n\tAddress=2.0.0.0\n"));
  EXPECT_THAT(result.output, Not(HasSubstr("Version.Revision")));
}

TEST_F(PrintCommand, ASecondReportFollowsOnHdmi2) {
  const process_result_t result = run_cli({"print", sample_sink("tv_4k_hdr")});
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.output, HasSubstr("\n\ntv_4k_hdr.txt: HDMI 2\n"));
  EXPECT_THAT(result.output, HasSubstr("\t97\t3840x2160p60Hz16x9 YCbCr 4:2:0\n"));
  EXPECT_THAT(result.output, HasSubstr("Max TMDS rate           = 600 MHz\n"));
}

TEST_F(PrintCommand, ThereIsNoSecondReportInShortOrWithoutSuchBlocks) {
  EXPECT_THAT(run_cli({"print", "--brief", sample_sink("tv_4k_hdr")}).output, Not(HasSubstr(": HDMI 2\n")));
  EXPECT_THAT(run_cli({"print", sample_sink("monitor_base_block")}).output, Not(HasSubstr(": HDMI 2\n")));
}

TEST_F(PrintCommand, EverySampleSinkPrintsWithoutASingleComplaint) {
  for (const char *name : sample_names) {
    const process_result_t result = run_cli({"print", sample_sink(name)});
    EXPECT_EQ(result.status, 0) << name;
    EXPECT_EQ(result.error, "") << name;
    EXPECT_FALSE(holds_diagnostics(result.output)) << result.output;
  }
}

TEST_F(PrintCommand, AComposedEdidPrintsWithoutASingleComplaint) {
  const process_result_t result = print(composed({"--sink", sample_sink("tv_4k")}));
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.output, HasSubstr("\nMonitor name        = \"Media Box\"\nSerial Number       = 0x0\n"
                                       "Serial String       = \"MB-000001\"\n"));
  EXPECT_FALSE(holds_diagnostics(result.output)) << result.output;
}

TEST_F(PrintCommand, ReadsStandardInput) {
  const process_result_t result = run_cli({"print", "--brief", "-"}, sample_bytes("monitor_base_block"));
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.output, StartsWith("standard input\n\tManufacter   : ZQM\n"));
}

TEST_F(PrintCommand, WarningsOfTheLibraryStandOnceOnStandardOutput) {
  std::string bytes = sample_bytes("monitor_base_block");
  bytes[20] = '\0';  // Not digital, and the checksum mended.
  bytes[127] = static_cast<char>(bytes[127] + '\x80');
  const process_result_t result = print(bytes);
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  const std::string warning = "() WARNING: EDID inappropriately set to analog. Continuing.\n";
  const std::size_t first = result.output.find(warning);
  ASSERT_NE(first, std::string::npos);
  EXPECT_EQ(result.output.find(warning, first + 1), std::string::npos);
}

TEST_F(PrintCommand, ABaseBlockThatDoesNotDecodeEndsWithStatusOne) {
  std::string bytes = sample_bytes("tv_4k");
  bytes[127] = static_cast<char>(bytes[127] + 1);
  const process_result_t result = print(bytes);
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.error,
            "edid-composer: " + directory_.path("sink.bin") + ": the library refused to decode this EDID\n");
  EXPECT_THAT(result.output, HasSubstr("() ERROR: Failed decoding EDID block 0.\n"));
  EXPECT_THAT(result.output, Not(HasSubstr("sink.bin\n")));
}

TEST_F(PrintCommand, AnExtensionThatDoesNotDecodeEndsWithStatusOne) {
  std::string bytes = sample_bytes("tv_4k");
  bytes[128] = '\x40';
  const process_result_t result = print(bytes);
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.error,
            "edid-composer: " + directory_.path("sink.bin") + ": the library refused to decode this EDID\n");
  EXPECT_THAT(result.output, HasSubstr("() ERROR: Failed decoding EDID block 1.\n"));
}

TEST_F(PrintCommand, OnATerminalTextsOfTheSinkHaveNoControlCharacters) {
  std::string bytes = sample_bytes("tv_4k");
  const std::size_t name = bytes.find("SAMPLE 4K TV");
  ASSERT_NE(name, std::string::npos);
  bytes.replace(name, 4, "\x1B[2J");
  int sum = 0;
  for (std::size_t at = 0; at < 127; ++at) {
    sum += static_cast<unsigned char>(bytes[at]);
  }
  bytes[127] = static_cast<char>(-sum);
  const std::string file = directory_.write("sink.bin", bytes);
  EXPECT_THAT(run_cli({"print", file}).output, HasSubstr("Monitor name        = \"\x1B[2JLE 4K TV\"\n"));
  terminal_t terminal;
  process_t print{cli_program(), {"print", file}};
  print.output_file = terminal.name();
  EXPECT_EQ(print.run().status, 0);
  const std::string shown = terminal.content();
  EXPECT_THAT(shown, HasSubstr("\nMonitor name        = \"?[2JLE 4K TV\"\n"));
  EXPECT_THAT(shown, HasSubstr("\n\tStand-by "));
  EXPECT_EQ(shown.find('\x1B'), std::string::npos);
}

TEST_F(PrintCommand, NamesOfFilesInMessagesHaveNoControlCharacters) {
  EXPECT_EQ(run_cli({"print", "no\x1B[31m\nsuch\xC2\x9Bz"}).error,
            "edid-composer: no?[31m?such?z: No such file or directory\n");
  const std::string file = directory_.write("a\x1B[31m", std::string(128, '\0'));
  EXPECT_THAT(run_cli({"print", file}).error, testing::EndsWith("a?[31m: the library refused to decode this EDID\n"));
}

}  // namespace
}  // namespace host_test
