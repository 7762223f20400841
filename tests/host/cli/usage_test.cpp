// The command line: help, and each way to get it wrong.
#include <gmock/gmock.h>

#include "cli/cli_fixture.h"

namespace host_test {
namespace {

using testing::HasSubstr;

struct usage_case_t {
  const char *name;
  std::vector<std::string> arguments;
  std::string error;
};

void PrintTo(const usage_case_t &tested, std::ostream *stream) {
  *stream << tested.name;
}

class WrongUsage : public testing::TestWithParam<usage_case_t> {};

TEST_P(WrongUsage, GetsOneLineOnStandardErrorAndStatusTwo) {
  expect_bad_input(run_cli(GetParam().arguments), GetParam().error);
}

/// Wrong usage is found before anything is written; should it not be, this cannot be written.
const std::string nowhere = "/nonexistent/new.bin";

usage_case_t bad_option(const char *name, const std::string &option, const std::string &value,
                        const std::string &expected) {
  return {name, {"compose", "-o", nowhere, option, value}, option + ": \"" + value + "\" is not " + expected};
}

const std::string a_port = "a port from 0 to 14";
const std::string a_mode = "a mode such as 1920x1080p60 or 1920x1080i50";
const std::string a_mask = "a number of 32 bits, decimal or 0x hexadecimal";
const std::string latencies = "four latencies from 0 to 65535 ms, separated by commas";
const std::string a_3d_mode = "off, sink or on";
const std::string jobs = "a number of jobs from 1 to 256";

INSTANTIATE_TEST_SUITE_P(
    Commands, WrongUsage,
    testing::Values(
        usage_case_t{"NoCommand",
                     {},
                     "no command given: compose, explain, print, diff, sinks, check-platform, audio-mask or platform "
                     "(try --help)"},
        usage_case_t{"UnknownCommand", {"compos"}, "The following argument was not expected: compos (try --help)"},
        usage_case_t{"ComposeWithoutOutput", {"compose"}, "--output is required (try --help)"},
        usage_case_t{"OutputWithoutName", {"compose", "-o"}, "--output: 1 required FILE missing (try --help)"},
        usage_case_t{"EmptyOutputName", {"compose", "-o", ""}, "--output: the file name is empty"},
        usage_case_t{"EmptySinkName", {"compose", "-o", nowhere, "--sink", ""}, "--sink: the file name is empty"},
        usage_case_t{"UnknownOption",
                     {"compose", "-o", nowhere, "--sinks", "x"},
                     "The following arguments were not expected: x --sinks (try --help)"},
        usage_case_t{"OptionGivenTwice",
                     {"compose", "-o", nowhere, "--port", "1", "--port", "2"},
                     "--port: At Most 1 required but received 2 (try --help)"},
        usage_case_t{"TwoInputsFromStandardInput",
                     {"compose", "-o", nowhere, "--sink", "-", "--platform", "-"},
                     "--platform and --sink cannot both be read from standard input"},
        usage_case_t{"PrintWithoutFile", {"print"}, "FILE is required (try --help)"},
        usage_case_t{
            "PrintWithTwoFiles", {"print", "a", "b"}, "The following argument was not expected: b (try --help)"},
        usage_case_t{"AudioMaskWithoutMask", {"audio-mask"}, "MASK is required (try --help)"},
        usage_case_t{"RangeOfPortsThatAreNone",
                     {"compose", "-o", nowhere, "--port", "0..15"},
                     "--port: \"15\" is not a port from 0 to 14"},
        usage_case_t{
            "RangeWithoutEnd", {"compose", "-o", nowhere, "--port", "0.."}, "--port: \"\" is not a port from 0 to 14"},
        usage_case_t{"DiffOfOneFile", {"diff", "a"}, "B is required (try --help)"},
        usage_case_t{"DiffOfStandardInputTwice", {"diff", "-", "-"}, "A and B cannot both be read from standard input"},
        usage_case_t{"OptionInPlaceOfAValue", {"compose", "--sink", "-o", "x"}, "--sink: FILE is missing before -o"},
        usage_case_t{"LongOptionInPlaceOfAValue",
                     {"compose", "-o", "--format", "hex"},
                     "--output: FILE is missing before --format"},
        usage_case_t{"CheckPlatformWithoutFile", {"check-platform"}, "FILE is required (try --help)"},
        usage_case_t{"SinksWithArgument", {"sinks", "x"}, "The following argument was not expected: x (try --help)"},
        usage_case_t{"LogOfOne",
                     {"compose", "-o", nowhere, "--log"},
                     "--log needs several EDIDs: a folder of sinks, or a range of ports"},
        usage_case_t{
            "PlatformWithArgument", {"platform", "x"}, "The following argument was not expected: x (try --help)"}),
    [](const auto &tested) { return tested.param.name; });

INSTANTIATE_TEST_SUITE_P(
    Values, WrongUsage,
    testing::Values(bad_option("PortTooHigh", "--port", "15", a_port),
                    bad_option("NegativePort", "--port", "-1", a_port),
                    bad_option("PortInWords", "--port", "one", a_port), bad_option("EmptyPort", "--port", "", a_port),
                    bad_option("RangeDownwards", "--port", "3..1", "a range of ports such as 0..3"),
                    bad_option("UnknownFormat", "--format", "HEX", "raw or hex"),
                    bad_option("NoJobs", "--jobs", "0", jobs), bad_option("TooManyJobs", "--jobs", "257", jobs),
                    bad_option("ModeWithoutWidth", "--current-mode", "1080p60", a_mode),
                    bad_option("ModeWithoutScan", "--current-mode", "1920x1080", a_mode),
                    bad_option("ModeWithoutRate", "--current-mode", "1920x1080p", a_mode),
                    bad_option("ModeWithFraction", "--current-mode", "1920x1080p59.94", a_mode),
                    bad_option("ModeWithUnit", "--current-mode", "1920x1080p60Hz", a_mode),
                    bad_option("ModeTooLarge", "--current-mode", "4294967296x1080p60", a_mode),
                    bad_option("MaskInWords", "--audio-mask", "all", a_mask),
                    bad_option("MaskTooLarge", "--audio-mask", "0x100000000", a_mask),
                    bad_option("ThreeLatencies", "--latency", "1,2,3", latencies),
                    bad_option("FiveLatencies", "--latency", "1,2,3,4,5", latencies),
                    bad_option("EmptyLatency", "--latency", "1,,3,4", latencies),
                    bad_option("LatencyTooLarge", "--latency", "1,2,3,65536", latencies),
                    bad_option("LatencyWithUnit", "--latency", "1ms,2,3,4", latencies),
                    bad_option("Unknown3dMode", "--3d", "yes", a_3d_mode),
                    bad_option("Upper3dMode", "--3d", "ON", a_3d_mode)),
    [](const auto &tested) { return tested.param.name; });

TEST(WrongPlatform, IsNamedWithWhatIsWrong) {
  const temporary_directory_t directory;
  const auto compose = [&directory](const std::string &platform, const std::string &input) {
    return run_cli({"compose", "-o", directory.path("new.bin"), "--platform", platform}, input);
  };
  const std::string cannot_store = " cannot be stored; use an integer, a string, a boolean, an array or a table";

  expect_bad_input(compose("/nonexistent.toml", ""), "/nonexistent.toml: No such file or directory");
  const std::string file = directory.write("box.toml", "[edid]\n\nweek = 1.5\n");
  expect_bad_input(compose(file, ""), file + ":3:8: edid.week: a floating-point number" + cannot_store);
  expect_bad_input(compose("-", "day = 2024-02-29\n"), "standard input:1:7: day: a date" + cannot_store);
}

TEST(WrongInput, WritesNoOutputFile) {
  const temporary_directory_t directory;
  run_cli({"compose", "-o", directory.path("new.bin"), "--sink", "/nonexistent"});
  run_cli({"compose", "-o", directory.path("new.bin"), "--platform", "/nonexistent"});
  EXPECT_TRUE(directory.names().empty());
}

}  // namespace
}  // namespace host_test
