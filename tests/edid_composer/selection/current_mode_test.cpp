// The platform's current output mode at the head of the selection.
#include "edid_composer/selection/current_mode.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "edid_composer/selection/video_modes.h"
#include "edid_composer/stage_fixture.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::error;
using composer_lines::trace;
using edid_composer::_filter_video_modes;
using edid_composer::_valid_current_mode;
using test_support::append_modes;
using test_support::output_of;
using test_support::traced_output_of;

using modes_t = std::vector<test_support::mode_pair_t>;

constexpr const char *filter = "_filter_video_modes";

class CurrentMode : public composer_fixtures::Stage {
 protected:
  CurrentMode() {
    values_->current_mode_set_to_priority = 1;
    append_modes(values_->video_60_priority, {{4, 1}, {16, 5}, {2, 0}, {16, 4}});
    append_modes(values_->video_60_additional, {{16, 5}, {2, 0}, {4, 5}});
  }
  bool run(ll_list_t *selected) { return _filter_video_modes(inputs(), selected, &journal_).complete; }
  bool run() { return run(selected_.get()); }
  modes_t selected() { return test_support::modes_of(*selected_); }

  const modes_t unchanged_{{4, 1}, {16, 5}, {2, 0}, {16, 4}};
  composer_fixtures::arena_list_t<short_video_desc_t> selected_{&arena_};
};

TEST_F(CurrentMode, MovesToTheFrontAndLosesIts3dStructures) {
  cfg_.hdmi_current_mode = {1920, 1080, 0, 60};
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(run()); }), "");
  EXPECT_EQ(selected(), (modes_t{{16, 0}, {4, 1}, {2, 0}, {16, 4}}));
}

TEST_F(CurrentMode, ThatNobodyNamesIsPutFirstAllTheSame) {
  cfg_.hdmi_current_mode = {1920, 1080, 1, 50};
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(run()); }), "");
  EXPECT_EQ(selected(), (modes_t{{20, 0}, {4, 1}, {16, 5}, {2, 0}, {16, 4}}));
}

TEST_F(CurrentMode, IsLeftAloneUnlessThePlatformAsksForIt) {
  values_->current_mode_set_to_priority = 0;
  cfg_.hdmi_current_mode = {1920, 1080, 0, 60};
  const std::string output = traced_output_of([&] { EXPECT_TRUE(run()); });
  EXPECT_NE(output.find(trace(filter, "\tIgnoring hdmi_current_mode.")), std::string::npos);
  EXPECT_EQ(selected(), unchanged_);
}

TEST_F(CurrentMode, ThatIsImplausibleIsIgnored) {
  cfg_.hdmi_current_mode = {399, 1080, 0, 60};
  const std::string output = traced_output_of([&] { EXPECT_TRUE(run()); });
  EXPECT_NE(output.find(trace(filter, "\tIgnoring hdmi_current_mode.")), std::string::npos);
  EXPECT_EQ(output.find("Mode is"), std::string::npos);
  EXPECT_EQ(selected(), unchanged_);
}

TEST_F(CurrentMode, WithoutVicIsAnErrorThatChangesNothing) {
  cfg_.hdmi_current_mode = {1366, 768, 0, 60};
  EXPECT_EQ(output_of([&] { EXPECT_TRUE(run()); }), error(filter, "Could not obtain a valid hdmi mode. Continuing."));
  EXPECT_EQ(selected(), unchanged_);
}

TEST_F(CurrentMode, IsTracedBetweenTheSelectionAndItsReport) {
  cfg_.hdmi_current_mode = {720, 480, 1, 60};
  const std::string output = traced_output_of([&] { EXPECT_TRUE(run()); });
  const std::string expected =
      trace(filter, "Prioritize the list of valid modes and remove duplicates. Modes:3 MasterList:4") +
      trace("mode_to_vic", "\tMode is 720x480i60. Attempting to find a match.") +
      trace(filter, "\tAdding hdmi output mode as the priority mode:720(1440)x480i60Hz4x3") +
      trace(filter, "\tNew EDID List of VICs:") + "\t\tVIC:6 720(1440)x480i60Hz4x3         \n";
  EXPECT_NE(output.find(expected), std::string::npos) << output;
}

TEST_F(CurrentMode, ThatTheOutputListRefusesFailsTheFilter) {
  composer_fixtures::arena_list_t<std_timing_t> wrong(&arena_);
  ASSERT_TRUE(ll_delete_list(&values_->video_60_priority));
  ASSERT_TRUE(ll_init(&values_->video_60_priority, "short_video_desc_t"));
  cfg_.hdmi_current_mode = {1920, 1080, 0, 60};
  const std::string output = output_of([&] { EXPECT_FALSE(run(wrong.get())); });
  // The list's own refusal with its missing blank, and the text of the other end of the list.
  EXPECT_EQ(test_support::count_of(output, "\n"), 2) << output;
  EXPECT_NE(
      output.find("ll_add_entry_to_front() BUG: This entry represents a different type and cannot be added tothis "
                  "list. List:0x"),
      std::string::npos);
  EXPECT_NE(output.find(error(filter, "Failed adding entry to the back of the list.")), std::string::npos);
}

TEST(CurrentModePlausibility, LimitsBelongToThePlausibleModes) {
  const auto plausible = [](u32 width, u32 height, u32 interlaced, u32 refresh) {
    return _valid_current_mode({width, height, interlaced, refresh});
  };
  EXPECT_TRUE(plausible(1920, 1080, 0, 60));
  EXPECT_TRUE(plausible(1920, 1080, 1, 60));
  EXPECT_FALSE(plausible(1920, 1080, 2, 60));
  EXPECT_FALSE(plausible(1920, 1080, 0xFFFFFFFF, 60));
  EXPECT_TRUE(plausible(400, 1080, 0, 60));
  EXPECT_FALSE(plausible(399, 1080, 0, 60));
  EXPECT_TRUE(plausible(16000, 1080, 0, 60));
  EXPECT_FALSE(plausible(16001, 1080, 0, 60));
  EXPECT_FALSE(plausible(0xFFFFFFFF, 1080, 0, 60));
  EXPECT_TRUE(plausible(1920, 100, 0, 60));
  EXPECT_FALSE(plausible(1920, 99, 0, 60));
  EXPECT_TRUE(plausible(1920, 8000, 0, 60));
  EXPECT_FALSE(plausible(1920, 8001, 0, 60));
  EXPECT_FALSE(plausible(1920, 0xFFFFFFFF, 0, 60));
  EXPECT_TRUE(plausible(1920, 1080, 0, 20));
  EXPECT_FALSE(plausible(1920, 1080, 0, 19));
  EXPECT_TRUE(plausible(1920, 1080, 0, 1000));
  EXPECT_FALSE(plausible(1920, 1080, 0, 1001));
}

}  // namespace
