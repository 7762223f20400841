// "compose --sink FOLDER": an EDID for every sink of a folder.
#include <gmock/gmock.h>
#include <sys/stat.h>

#include <algorithm>

#include "cli/several_fixture.h"
#include "support/terminal.h"

namespace host_test {
namespace {

using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::Key;
using testing::Not;
using testing::StartsWith;

class SeveralSinks : public several_fixture_t {
 protected:
  void add_samples() {
    for (const char *name : sample_names) {
      add_sink(std::string(name) + ".txt", content_of(sample_sink(name)));
    }
  }
};

TEST_F(SeveralSinks, AreComposedForOneByOne) {
  add_samples();
  const process_result_t result = compose({"--sink", sinks_});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  EXPECT_EQ(result.output, "composed  5\nfailed    0\n");
  EXPECT_EQ(edids().size(), 5U);
  for (const std::string name : sample_names) {
    EXPECT_EQ(edids().at(name + ".bin"), composed({"--sink", sample_sink(name)})) << name;
  }
}

TEST_F(SeveralSinks, GoTogetherWithSeveralPorts) {
  add_sink("a.bin", sample_bytes("tv_4k"));
  add_sink("b.bin", sample_bytes("tv_720p_50hz"));
  EXPECT_EQ(compose({"--sink", sinks_, "--port", "0..1"}).output, "composed  4\nfailed    0\n");
  EXPECT_THAT(edids(), ElementsAre(Key("a-port0.bin"), Key("a-port1.bin"), Key("b-port0.bin"), Key("b-port1.bin")));
  EXPECT_EQ(edids().at("b-port1.bin"), composed({"--sink", sample_sink("tv_720p_50hz"), "--port", "1"}));
}

TEST_F(SeveralSinks, AfterABadOneTheOthersFollow) {
  add_sink("1.bin", sample_bytes("tv_4k"));
  add_sink("2.bin", sample_bytes("tv_4k").substr(0, 100));
  add_sink("4.bin", sample_bytes("tv_4k"));
  const process_result_t result = compose({"--sink", sinks_});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.error, "");
  EXPECT_EQ(result.output, "composed  2\nfailed    1\n\nFAILED  REASON\n2.bin   " + sinks_ +
                               "/2.bin: 100 bytes are not an EDID, which has 1 to 256 blocks of 128 bytes\n");
  EXPECT_THAT(edids(), ElementsAre(Key("1.bin"), Key("4.bin")));
}

TEST_F(SeveralSinks, FilesThatAreNoEdidsArePassedOver) {
  add_sink("1.bin", sample_bytes("tv_4k"));
  add_sink("2.txt", "00 zz\n");
  add_sink("3.bin", "");
  add_sink("README.md", "# Sinks\n");
  const process_result_t result = compose({"--sink", sinks_});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  EXPECT_THAT(result.output,
              StartsWith("composed  1\nfailed    0\n\npassed over: " + sinks_ +
                         "/2.txt:1:4: \"zz\" is not hexadecimal\npassed over: " + sinks_ +
                         "/3.bin: is empty\npassed over: " + sinks_ + "/README.md: 0 bytes are not an EDID"));
  EXPECT_THAT(edids(), ElementsAre(Key("1.bin")));
}

TEST_F(SeveralSinks, AFolderWithoutAnEdidIsRefused) {
  add_sink("README.md", "# Sinks\n");
  const process_result_t result = compose({"--sink", sinks_});
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.error, "edid-composer: " + sinks_ + ": holds no sinks\n");
}

TEST_F(SeveralSinks, LogsNeverTakeTheNameOfAnEdid) {
  add_sink("a.bin", sample_bytes("tv_4k"));
  add_sink("a.log.txt", sample_bytes("tv_720p_50hz"));
  std::filesystem::create_directory(edids_);
  const process_result_t result = run_cli({"compose", "--sink", sinks_, "--log", "-o", edids_ + "/{sink}"});
  EXPECT_EQ(result.status, 0);
  const auto files = edids();
  EXPECT_THAT(files, ElementsAre(Key("a"), Key("a.log"), Key("a.log.log"), Key("a.log.log.log")));
  EXPECT_EQ(files.at("a.log").size(), 256U);
}

TEST_F(SeveralSinks, StrictFailsThoseThatAreNotReadOrOfNoUse) {
  std::string damaged = sample_bytes("tv_4k");
  damaged[255] = static_cast<char>(damaged[255] + 1);
  add_sink("a.bin", sample_bytes("tv_4k"));
  add_sink("b.bin", damaged);
  EXPECT_EQ(compose({"--sink", sinks_}).status, 0);
  std::filesystem::remove_all(edids_);
  const process_result_t result = compose({"--sink", sinks_, "--strict"});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.output,
              HasSubstr("b.bin   --strict: the sink is not read to its end: extension refused: checksum"));
  EXPECT_THAT(edids(), ElementsAre(Key("a.bin")));
}

TEST_F(SeveralSinks, WhatTheLibrarySaidIsCountedOnce) {
  std::string damaged = sample_bytes("tv_4k");
  damaged[127] = static_cast<char>(damaged[127] + 1);
  add_sink("a.bin", damaged);
  add_sink("b.bin", damaged);
  add_sink("c.bin", sample_bytes("tv_4k"));
  const process_result_t result = compose({"--sink", sinks_});
  EXPECT_EQ(result.status, 0);
  EXPECT_THAT(result.output, HasSubstr("composed  3\nfailed    0\n\nTIMES  FIRST  THE LIBRARY SAID\n"));
  EXPECT_THAT(result.output, EndsWith("2      a.bin  ERROR: Failed decoding the edid block 0. Continuing.\n"));
}

TEST_F(SeveralSinks, ManyDifferentMessagesAreSummedUp) {
  for (int number = 0; number < 30; ++number) {
    std::string damaged = sample_bytes("monitor_base_block");
    damaged[0] = static_cast<char>(number + 1);
    add_sink("sink" + std::to_string(number), damaged);
  }
  const process_result_t result = compose({"--sink", sinks_});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(std::count(result.output.begin(), result.output.end(), '\n'), 2 + 1 + 1 + 20 + 1) << result.output;
  EXPECT_THAT(result.output, EndsWith(" other messages\n"));
}

TEST_F(SeveralSinks, NeitherResultsNorOutputDependOnTheNumberOfJobs) {
  add_samples();
  add_sink("bad.bin", sample_bytes("tv_4k").substr(0, 100));
  for (int number = 0; number < 40; ++number) {
    add_sink("more" + std::to_string(number) + ".bin", sample_bytes("tv_4k"));
  }
  const process_result_t one = compose({"--sink", sinks_, "--jobs", "1", "--debug", "--log"});
  const auto expected = edids();
  EXPECT_EQ(one.status, 1);
  EXPECT_EQ(expected.size(), 2U * 45U);
  for (const std::string jobs : {"2", "7", "256"}) {
    std::filesystem::remove_all(edids_);
    const process_result_t several = compose({"--sink", sinks_, "--jobs", jobs, "--debug", "--log"});
    EXPECT_EQ(several.status, 1);
    EXPECT_EQ(several.output, one.output) << jobs;
    EXPECT_EQ(edids(), expected) << jobs;
  }
}

TEST_F(SeveralSinks, LogsStandBesideTheEdids) {
  add_sink("a.bin", sample_bytes("tv_4k"));
  add_sink("b.bin", std::string(128, '\0'));
  EXPECT_EQ(compose({"--sink", sinks_, "--log"}).status, 0);
  EXPECT_THAT(edids(), ElementsAre(Key("a.bin"), Key("a.log"), Key("b.bin"), Key("b.log")));
  EXPECT_EQ(edids().at("a.log"), "");
  EXPECT_THAT(edids().at("b.log"), HasSubstr("() ERROR: Failed decoding the edid block 0. Continuing.\n"));
  const process_result_t traced = compose({"--sink", sinks_, "--log", "--debug"});
  EXPECT_THAT(edids().at("a.log"), HasSubstr("Setting up the new EDID:"));
  EXPECT_THAT(traced.output, testing::StartsWith("==> a.bin <==\n" + edids().at("a.log") + "\n==> b.bin <==\n"));
}

TEST_F(SeveralSinks, WhatIsHiddenOrNoFileIsPassedOver) {
  add_sink("a.bin", sample_bytes("tv_4k"));
  add_sink(".hidden", "no EDID");
  std::filesystem::create_directory(sinks_ + "/folder");
  ASSERT_EQ(mkfifo((sinks_ + "/pipe").c_str(), 0600), 0);
  EXPECT_EQ(compose({"--sink", sinks_}).output, "composed  1\nfailed    0\n");
  EXPECT_THAT(edids(), ElementsAre(Key("a.bin")));
}

TEST_F(SeveralSinks, OfTheSameNameKeepTheirEndings) {
  add_sink("tv.bin", sample_bytes("tv_4k"));
  add_sink("tv.txt", content_of(sample_sink("tv_4k")));
  add_sink("box.bin", sample_bytes("tv_4k"));
  EXPECT_EQ(compose({"--sink", sinks_}).status, 0);
  EXPECT_THAT(edids(), ElementsAre(Key("box.bin"), Key("tv.bin.bin"), Key("tv.txt.bin")));
}

TEST_F(SeveralSinks, NeverShareAFile) {
  add_sink("tv.bin", sample_bytes("tv_4k"));
  add_sink("tv.bin.x", sample_bytes("tv_4k"));
  add_sink("tv.txt", sample_bytes("tv_4k"));
  const process_result_t result = compose({"--sink", sinks_});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.output, HasSubstr("\ntv.bin.x  another EDID has its file name\n"));
  EXPECT_THAT(edids(), ElementsAre(Key("tv.bin.bin"), Key("tv.txt.bin")));
}

TEST_F(SeveralSinks, StayWhatTheyAre) {
  add_sink("a.bin", sample_bytes("tv_4k"));
  const std::string problem = "--output: " + sinks_ + " is the folder of the sinks; name another one";
  expect_bad_input(run_cli({"compose", "--sink", sinks_, "-o", sinks_}), problem);
  expect_bad_input(run_cli({"compose", "--sink", sinks_, "-o", sinks_ + "/../sinks/{sink}.bin"}), problem);
  EXPECT_EQ(content_of(sinks_ + "/a.bin"), sample_bytes("tv_4k"));
}

TEST_F(SeveralSinks, NeedAPlaceForEach) {
  add_sink("a.bin", sample_bytes("tv_4k"));
  expect_bad_input(run_cli({"compose", "--sink", sinks_, "-o", directory_.path("{port}.bin")}),
                   "--output: a file name for several sinks needs {sink} in it");
}

TEST_F(SeveralSinks, AFolderWithoutAnyIsRefused) {
  expect_bad_input(compose({"--sink", sinks_}), sinks_ + ": holds no sinks");
}

TEST_F(SeveralSinks, AnEdidThatCannotBeWrittenIsAFailureOfThatSink) {
  add_sink("a.bin", sample_bytes("tv_4k"));
  add_sink("b.bin", sample_bytes("tv_4k"));
  std::filesystem::create_directories(edids_ + "/a.bin");
  const process_result_t result = compose({"--sink", sinks_});
  EXPECT_EQ(result.status, 1);
  EXPECT_THAT(result.output, HasSubstr("\na.bin   " + edids_ + "/a.bin: cannot write: Is a directory\n"));
  EXPECT_EQ(content_of(edids_ + "/b.bin").size(), 256U);
}

TEST_F(SeveralSinks, AnEdidThatDoesNotFitTheDiskFailsItsSinkOnly) {
  add_sink("a.bin", sample_bytes("tv_4k"));
  add_sink("b.bin", sample_bytes("tv_4k"));
  add_sink("c.bin", sample_bytes("tv_4k"));
  std::filesystem::create_directory(edids_);
  directory_.write("edids/a.bin", "old");
  // The EDIDs outgrow the limit. That of b goes to a device without a size.
  std::filesystem::create_symlink("/dev/null", edids_ + "/b.bin");
  for (const std::string jobs : {"1", "3"}) {
    terminal_t terminal;
    process_t process{cli_program(), {"compose", "--sink", sinks_, "-o", edids_, "--jobs", jobs}};
    process.output_file = terminal.name();
    process.file_size_limit = 200;
    EXPECT_EQ(process.run().status, 1);
    const std::string end = ".bin: cannot write: File too large\n";
    EXPECT_EQ(terminal.content(), "composed  1\nfailed    2\n\nFAILED  REASON\na.bin   " + edids_ + "/a" + end +
                                      "c.bin   " + edids_ + "/c" + end);
    EXPECT_EQ(content_of(edids_ + "/a.bin"), "old");
    EXPECT_THAT(edids(), ElementsAre(Key("a.bin"), Key("b.bin")));
  }
}

// Each thread has its own addresses, and the library prints some.
TEST_F(SeveralSinks, AMessageWithAnAddressIsCountedOnceWhicheverThreadSaysIt) {
  for (int number = 0; number < 20; ++number) {
    add_sink("sink" + std::to_string(number), std::string(128, '\0'));
  }
  const std::string platform = std::string(SAMPLE_SINKS_DIRECTORY) + "/../platforms/receiver_50hz.toml";
  const process_result_t result = compose({"--platform", platform, "--sink", sinks_, "--jobs", "7"});
  EXPECT_THAT(result.output, HasSubstr("20     sink0  BUG: Received a list that contains no entries. List:0x"));
  EXPECT_EQ(result.output.find("List:0x"), result.output.rfind("List:0x"));
}

TEST_F(SeveralSinks, ProgressIsShownOnATerminalOnly) {
  add_samples();
  terminal_t terminal;
  process_t process{cli_program(), {"compose", "--sink", sinks_, "-o", edids_}};
  process.error_file = terminal.name();
  EXPECT_EQ(process.run().output, "composed  5\nfailed    0\n");
  const std::string shown = terminal.content();
  EXPECT_THAT(shown, HasSubstr("\r[########................................] 1 of 5"));
  EXPECT_THAT(shown, EndsWith("\r\x1B[K"));
  EXPECT_THAT(compose({"--sink", sinks_}).error, Not(HasSubstr("[")));
}

}  // namespace
}  // namespace host_test
