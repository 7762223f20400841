// Composing today gives what is kept.
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <ostream>
#include <set>
#include <stdexcept>
#include <string>
#include <vector>

#include "composition.h"
#include "edid_input/edid_file.h"
#include "first_difference.h"
#include "golden_cases.h"
#include "support/hex_text.h"

namespace golden {

/// Names the case in the message of a failure.
void PrintTo(const golden_case_t &golden_case, std::ostream *stream) {
  *stream << golden_case.name();
}

}  // namespace golden

namespace {

using golden::golden_case_t;
using test_support::hex_lines;

std::set<std::string> names_in(const std::filesystem::path &directory) {
  std::set<std::string> names;
  for (const auto &entry : std::filesystem::directory_iterator(directory))
    names.insert(entry.path().filename().string());
  return names;
}

std::string test_name(const testing::TestParamInfo<golden_case_t> &info) {
  std::string name = info.param.name();
  std::replace(name.begin(), name.end(), '.', '_');
  return name;
}

class Goldens : public testing::TestWithParam<golden_case_t> {};

TEST_P(Goldens, AreWhatIsComposedNow) {
  for (const auto &[name, text] : golden::golden_texts(GetParam())) {
    const std::string kept = golden::content_of(golden::golden_directory() / name);
    const std::string difference = golden::first_difference(kept, text);
    EXPECT_TRUE(difference.empty()) << name << ", " << difference
                                    << "\nIf this is meant to be, run scripts/update_goldens.sh and review the change.";
  }
}

TEST_P(Goldens, SpellTheComposedBytesForTheProgramsReader) {
  const auto file = golden::golden_directory() / (GetParam().name() + ".hex");
  EXPECT_EQ(hex_lines(edid_cli::read_edid_file(file.string())), hex_lines(golden::composed(GetParam(), false).edid));
}

TEST_P(Goldens, DoNotDependOnTracing) {
  const auto traced = golden::composed(GetParam(), true);
  const auto untraced = golden::composed(GetParam(), false);
  EXPECT_EQ(hex_lines(untraced.edid), hex_lines(traced.edid));
  EXPECT_EQ(untraced.address_offset, traced.address_offset);
  // What is written in any case is among the traces, in the same order.
  const auto line_end = [&](std::size_t start) { return untraced.log.find('\n', start) + 1; };
  std::size_t found = 0;
  for (std::size_t start = 0; start < untraced.log.size(); start = line_end(start)) {
    const std::string line = untraced.log.substr(start, line_end(start) - start);
    found = traced.log.find(line, found);
    ASSERT_NE(found, std::string::npos) << line;
    found += line.size();
  }
}

TEST_P(Goldens, DoNotDependOnAnObserver) {
  for (const bool tracing : {false, true}) {
    const auto alone = golden::composed(GetParam(), tracing);
    int decisions = 0;
    const auto observed = golden::observed(GetParam(), tracing, &decisions);
    EXPECT_EQ(hex_lines(observed.edid), hex_lines(alone.edid));
    EXPECT_EQ(observed.address_offset, alone.address_offset);
    EXPECT_EQ(golden::first_difference(alone.log, observed.log), "");
    EXPECT_GT(decisions, 20);
  }
}

TEST_P(Goldens, HaveThePhysicalAddressWhereTheLibrarySaysSo) {
  const auto composition = golden::composed(GetParam(), false);
  ASSERT_GE(composition.address_offset, 128 + 3);
  ASSERT_LT(composition.address_offset, composition.edid.size());
  const auto address = composition.edid.begin() + composition.address_offset;
  EXPECT_EQ(std::vector<u8>(address - 3, address), (std::vector<u8>{0x03, 0x0C, 0x00}));
}

INSTANTIATE_TEST_SUITE_P(All, Goldens, testing::ValuesIn(golden::golden_cases()), test_name);

TEST(GoldenDirectory, HoldsNothingElse) {
  std::set<std::string> expected;
  for (const auto &golden_case : golden::golden_cases()) {
    for (const auto &[name, text] : golden::golden_texts(golden_case))
      expected.insert(name);
  }
  EXPECT_EQ(names_in(golden::golden_directory()), expected);
}

TEST(GoldenCases, BeginWithWhatTheyAreMadeFrom) {
  for (const golden_case_t &golden_case : golden::golden_cases())
    EXPECT_EQ(golden::case_of(golden_case.heading()).heading(), golden_case.heading());
  EXPECT_THROW(golden::case_of("# What the platform shows\n00 FF\n"), std::runtime_error);
}

/// Names of files without their endings, by whether they hold a text.
std::vector<std::string> stems_in(const std::filesystem::path &directory, const char *text, bool holds_it) {
  std::vector<std::string> stems;
  for (const std::string &name : names_in(directory)) {
    const bool holds = golden::content_of(directory / name).find(text) != std::string::npos;
    if (holds == holds_it) stems.push_back(std::filesystem::path(name).stem().string());
  }
  return stems;
}

TEST(GoldenCases, AreEverySampleSinkBehindEveryPlatformOfItsTime) {
  std::set<std::string> expected;
  for (const bool has_hdmi2 : {false, true}) {
    auto platforms = stems_in(golden::platforms_directory(), ".hdmi2]", has_hdmi2);
    platforms.emplace_back(has_hdmi2 ? "hdmi2" : "default");
    for (const std::string &sink : stems_in(golden::sinks_directory(), "BT2020", has_hdmi2)) {
      for (const std::string &platform : platforms)
        expected.insert(sink + "." + platform);
    }
  }
  std::set<std::string> names;
  for (const auto &golden_case : golden::golden_cases())
    names.insert(golden_case.name());
  EXPECT_EQ(names, expected);
  EXPECT_EQ(golden::golden_cases().size(), expected.size());
}

}  // namespace
