// The grammar of a configured video mode: a VIC and up to three 3D flags.
#include "edid_composer/platform/video_mode_entry.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/platform/key_rows.h"
#include "edid_composer/platform/mode_lists.h"
#include "support/configuration_tree.h"
#include "support/failing_allocation.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::error;
using composer_lines::trace;
using composer_lines::warning;
using edid_composer::_get_platform_list;
using key_rows::row;
using test_support::output_of;

using modes_t = std::vector<test_support::mode_pair_t>;

constexpr const char *parser = "_get_vic_list_callback";
constexpr const char *list_key = "60_hz_priority_list";

std::string invalid_string(const std::string &text) {
  return warning(parser, "Invalid string \"" + text + "\" in 60_hz_priority_list");
}

std::string invalid_flag(const std::string &flag) {
  return warning(parser, "Invalid 3D flag \"" + flag + "\" in 60_hz_priority_list");
}

std::string invalid_vic(const std::string &vic) {
  return warning(parser, "Read a vic value from the platform config file that has an unexpected value:" + vic +
                             ". Range:(1-64) Ignoring and continuing.");
}

class VideoModeEntry : public testing::Test {
 protected:
  /// Reads a list of these entries, with VIC 1 at its end so that it is not empty.
  std::string read(const std::vector<std::string> &entries) {
    for (const std::string &entry : entries)
      tree_.add(list_key, entry);
    tree_.add(list_key, std::string("1"));
    return output_of([&] { _get_platform_list(row(list_key), list_.get(), nullptr, {}); });
  }

  /// The modes that were read from the entries.
  modes_t modes() {
    modes_t modes = test_support::modes_of(*list_);
    EXPECT_FALSE(modes.empty());
    if (!modes.empty()) modes.pop_back();
    return modes;
  }

  test_support::configuration_tree_t tree_;
  test_support::scoped_list_t<short_video_desc_t> list_;
};

TEST_F(VideoModeEntry, HoldsAVicAndFlagsInAnyLetterCase) {
  EXPECT_EQ(read({"16 FP tbh", "4 Sbsh", "5", "19 fP TbH sBsH", "20 SBSH FP", "31 FP FP"}), "");
  EXPECT_EQ(modes(), (modes_t{{16, 5}, {4, 2}, {5, 0}, {19, 7}, {20, 3}, {31, 1}}));
}

TEST_F(VideoModeEntry, IsNeverNative) {
  EXPECT_EQ(read({"16 FP"}), "");
  for (const auto &mode : test_support::elements_of<short_video_desc_t>(*list_))
    EXPECT_EQ(mode.native, 0);
}

TEST_F(VideoModeEntry, AllowsAnyWhiteSpaceAndNoneBehindTheVic) {
  EXPECT_EQ(read({"  16 \t FP\n TBH  ", "4FP", "+5 SBSH"}), "");
  EXPECT_EQ(modes(), (modes_t{{16, 5}, {4, 1}, {5, 2}}));
}

TEST_F(VideoModeEntry, FourthFlagIsNotLookedAt) {
  EXPECT_EQ(read({"16 FP TBH SBSH XYZ"}), "");
  EXPECT_EQ(modes(), (modes_t{{16, 7}}));
}

TEST_F(VideoModeEntry, WithAnUnknownFlagIsSkipped) {
  EXPECT_EQ(read({"16 FP XYZ", "4"}), invalid_flag("XYZ") + invalid_string("16 FP XYZ"));
  EXPECT_EQ(modes(), (modes_t{{4, 0}}));
}

TEST_F(VideoModeEntry, FlagsAreExaminedFromTheLastToTheFirst) {
  EXPECT_EQ(read({"16 AAA BBB", "16 AAA FP"}),
            invalid_flag("BBB") + invalid_string("16 AAA BBB") + invalid_flag("AAA") + invalid_string("16 AAA FP"));
  EXPECT_EQ(modes(), modes_t{});
}

TEST_F(VideoModeEntry, FlagsOfTheNamesInReportsAreNoConfigurationFlags) {
  EXPECT_EQ(read({"16 SSH", "16 FA"}),
            invalid_flag("SSH") + invalid_string("16 SSH") + invalid_flag("FA") + invalid_string("16 FA"));
}

TEST_F(VideoModeEntry, FlagIsCutAfterNineLetters) {
  // "%9s" three times: nine letters, and the rest as the next flag.
  EXPECT_EQ(read({"16 ABCDEFGHIJK"}), invalid_flag("JK") + invalid_string("16 ABCDEFGHIJK"));
  EXPECT_EQ(modes(), modes_t{});
}

TEST_F(VideoModeEntry, WithoutANumberIsAnInvalidString) {
  EXPECT_EQ(read({"abc", "FP 16", "", "   ", "-", "x16"}), invalid_string("abc") + invalid_string("FP 16") +
                                                               invalid_string("") + invalid_string("   ") +
                                                               invalid_string("-") + invalid_string("x16"));
  EXPECT_EQ(modes(), modes_t{});
}

TEST_F(VideoModeEntry, VicOutsideTheTableIsSkipped) {
  EXPECT_EQ(read({"65", "0", "-1", "127 FP", "64 TBH", "1"}),
            invalid_vic("65") + invalid_vic("0") + invalid_vic("-1") + invalid_vic("127"));
  EXPECT_EQ(modes(), (modes_t{{64, 4}, {1, 0}}));
}

TEST_F(VideoModeEntry, VicIsJudgedBeforeTheFlags) {
  EXPECT_EQ(read({"65 XYZ", "0x10 FP"}), invalid_vic("65") + invalid_vic("0"));
}

TEST_F(VideoModeEntry, NumberOfAnySizeKeepsItsLow32Bits) {
  EXPECT_EQ(read({"99999999999", "99999999999999999999", "-99999999999999999999", "4294967312 FP"}),
            invalid_vic("1215752191") + invalid_vic("-1") + invalid_vic("0"));
  EXPECT_EQ(modes(), (modes_t{{16, 1}}));
}

TEST_F(VideoModeEntry, ThatIsSkippedIsTracedAsReadOnly) {
  EXPECT_EQ(test_support::traced_output_of([&] {
              auto modes = edid_composer::video_mode_appender(list_.get(), nullptr);
              EXPECT_EQ(edid_composer::_get_vic_list_callback(
                            {&row(list_key).key, 0, edid_composer::entry_kind_t::text, "node", -1, "16 XYZ"}, &modes)
                            .reason,
                        CONFIGURATION_3D_UNKNOWN);
            }),
            trace(parser, "Reading from list:60_hz_priority_list Node:node => 16 XYZ") + invalid_flag("XYZ") +
                invalid_string("16 XYZ"));
}

TEST_F(VideoModeEntry, ThatTheListRefusesIsReportedAndTheWalkGoesOn) {
  ASSERT_TRUE(ll_delete_list(list_.get()));
  ASSERT_TRUE(ll_init(list_.get(), "int"));
  tree_.add(list_key, std::string("16"));
  tree_.add(list_key, std::string("4"));
  const std::string output = output_of([&] { _get_platform_list(row(list_key), list_.get(), nullptr, {}); });
  EXPECT_EQ(test_support::count_of(output, error(parser, "Failed adding entry to the back of the list.")), 2);
  EXPECT_EQ(test_support::count_of(output, "ll_add_entry_to_back() BUG: This entry represents a different type"), 2);
  EXPECT_EQ(test_support::count_of(output, "Found list entry"), 0);
  EXPECT_EQ(ll_size(list_.get()), 0);
}

TEST_F(VideoModeEntry, WithoutMemoryIsReportedAndTheWalkGoesOn) {
  tree_.add(list_key, std::string("16"));
  tree_.add(list_key, std::string("4"));
  const std::string output = output_of([&] {
    const test_support::failing_allocation_t failing(1);
    _get_platform_list(row(list_key), list_.get(), nullptr, {});
  });
  EXPECT_EQ(output, test_support::bug_line("linked_list", "ll_create_entry",
                                           "calloc failed to allocate memory for the entry. ptr:PTR") +
                        error(parser, "Failed creating entry."));
  EXPECT_EQ(test_support::modes_of(*list_), (modes_t{{4, 0}}));
}

}  // namespace
