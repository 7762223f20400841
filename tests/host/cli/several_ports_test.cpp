// "compose --port 0..3": one EDID for each input, and where they go.
#include <gmock/gmock.h>

#include "cli/composed_edid.h"
#include "cli/several_fixture.h"

namespace host_test {
namespace {

using testing::ElementsAre;
using testing::Key;

class SeveralPorts : public several_fixture_t {};

TEST_F(SeveralPorts, GetAnEdidEach) {
  const process_result_t result = compose({"--sink", sample_sink("tv_4k"), "--port", "1..3"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.error, "");
  EXPECT_EQ(result.output, "composed  3\nfailed    0\n");
  const auto files = edids();
  EXPECT_THAT(files, ElementsAre(Key("port1.bin"), Key("port2.bin"), Key("port3.bin")));
  for (const std::string port : {"1", "2", "3"}) {
    EXPECT_EQ(files.at("port" + port + ".bin"), composed({"--sink", sample_sink("tv_4k"), "--port", port}));
  }
  EXPECT_EQ(composed_edid_t(files.at("port3.bin")).physical_address(), "2.4.0.0");
}

TEST_F(SeveralPorts, TakeTheSinkFromStandardInputOnce) {
  const process_result_t result =
      run_cli({"compose", "--sink", "-", "--port", "0..14", "-o", edids_}, sample_bytes("tv_4k"));
  EXPECT_EQ(result.status, 0) << result.error;
  EXPECT_EQ(edids().size(), 15U);
  EXPECT_EQ(edids().at("port14.bin"), composed({"--sink", sample_sink("tv_4k"), "--port", "14"}));
}

TEST_F(SeveralPorts, AreSeveralAlsoIfTheRangeIsOfOne) {
  EXPECT_EQ(compose({"--port", "2..2"}).status, 0);
  EXPECT_THAT(edids(), ElementsAre(Key("port2.bin")));
}

TEST_F(SeveralPorts, TakeHexTextToo) {
  EXPECT_EQ(compose({"--port", "0..1", "--format", "hex"}).status, 0);
  EXPECT_THAT(edids(), ElementsAre(Key("port0.hex"), Key("port1.hex")));
  EXPECT_EQ(composed({"--sink", edids_ + "/port0.hex"}), composed({"--sink", directory_.write("raw", composed({}))}));
}

TEST_F(SeveralPorts, GoWhereAPatternSays) {
  const std::string pattern = directory_.path("{sink}.input-{port}");
  EXPECT_EQ(run_cli({"compose", "--sink", sample_sink("tv_4k"), "--port", "0..1", "-o", pattern}).status, 0);
  EXPECT_EQ(run_cli({"compose", "--port", "0..0", "-o", pattern}).status, 0);
  EXPECT_THAT(directory_.names(), ElementsAre("none.input-0", "sinks", "tv_4k.input-0", "tv_4k.input-1"));
}

TEST_F(SeveralPorts, NeedAPlaceForEach) {
  expect_bad_input(run_cli({"compose", "--port", "0..3", "-o", "-"}),
                   "--output: several EDIDs cannot go to standard output; name a folder");
  const std::string file = directory_.write("file", "kept");
  expect_bad_input(run_cli({"compose", "--port", "0..3", "-o", file}),
                   file + ": is no folder for several EDIDs, and cannot be made one: Not a directory");
  expect_bad_input(run_cli({"compose", "--port", "0..3", "-o", directory_.path("{sink}.bin")}),
                   "--output: a file name for several ports needs {port} in it");
  EXPECT_EQ(content_of(file), "kept");
}

TEST_F(SeveralPorts, ASinkThatCannotBeReadStopsAllOfThem) {
  const std::string missing = directory_.path("missing");
  expect_bad_input(compose({"--sink", missing, "--port", "0..3"}), missing + ": No such file or directory");
}

TEST_F(SeveralPorts, WhatTheLibraryRefusesIsToldForEach) {
  const std::string platform =
      directory_.write("refused.toml", "[platform.software.drivers.vorex.edid.audio]\nentry_a = 0x200779\n");
  const process_result_t result = compose({"--platform", platform, "--port", "0..1"});
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(result.error, "");
  EXPECT_THAT(result.output, testing::StartsWith("composed  0\nfailed    2\n\nFAILED  REASON\n"
                                                 "port 0  the library refused to compose an EDID: "));
  EXPECT_TRUE(edids().empty());
}

}  // namespace
}  // namespace host_test
