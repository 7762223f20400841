// Which 4Kx2K modes a new EDID offers.
#include "edid_composer/selection/modes_4k_x_2k.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace {

using composer_lines::trace;
using edid_composer::_filter_4k_modes;

using codes_t = std::vector<u32>;

class Modes4kX2k : public testing::Test {
 protected:
  void sink(const codes_t &codes) {
    sink_->hdmi_vic_len = static_cast<u8>(codes.size());
    std::copy_n(codes.begin(), std::min<std::size_t>(codes.size(), 7), sink_->hdmi_vic);
  }
  void priority(const std::vector<i32> &codes) {
    std::copy(codes.begin(), codes.end(), values_->modes_4k_x_2k_priority);
  }
  void addition(const std::vector<i32> &codes) {
    std::copy(codes.begin(), codes.end(), values_->modes_4k_x_2k_addition);
  }

  /// The selection, by a run that prints nothing.
  codes_t run() {
    codes_t codes;
    EXPECT_EQ(test_support::output_of([&] {
                const auto selected = select();
                codes.assign(selected.begin(), selected.end());
              }),
              "");
    return codes;
  }
  edid_composer::hdmi_vics_t select() {
    return _filter_4k_modes({*sink_.get(), *values_.get(), cfg_, nullptr}).selected;
  }

  test_support::scoped_edid_t sink_;
  test_support::scoped_values_t values_;
  compose_cfg_t cfg_ = test_support::plain_settings();
};

TEST_F(Modes4kX2k, AreNoneWithoutAPriorityList) {
  sink({1, 2, 3, 4});
  addition({1, 2});
  EXPECT_EQ(run(), codes_t{});
}

TEST_F(Modes4kX2k, AreThePrioritiesThatSinkOrAdditionListHaveInPriorityOrder) {
  sink({1, 2});
  addition({4});
  priority({4, 3, 1});
  EXPECT_EQ(run(), (codes_t{4, 1}));
}

TEST_F(Modes4kX2k, AreNoneThatOnlyThePriorityListNames) {
  priority({1});
  EXPECT_EQ(run(), codes_t{});
}

TEST_F(Modes4kX2k, StandAsOftenAsThePriorityListNamesThem) {
  sink({1});
  priority({1, 1});
  EXPECT_EQ(run(), (codes_t{1, 1}));
}

TEST_F(Modes4kX2k, AreAtMostSeven) {
  sink({1});
  priority({1, 1, 1, 1, 1, 1, 1});
  EXPECT_EQ(run(), (codes_t{1, 1, 1, 1, 1, 1, 1}));
}

TEST_F(Modes4kX2k, EndAtTheFirstZeroOfTheListsButNotOfTheSink) {
  sink({0, 3});
  addition({2, 0, 4});
  priority({2, 3, 4, 0, 2});
  EXPECT_EQ(run(), (codes_t{2, 3}));
}

TEST_F(Modes4kX2k, UseEverySlotOfBothLists) {
  addition({9, 9, 9, 9, 9, 9, 4});
  priority({8, 8, 8, 8, 8, 8, 4});
  EXPECT_EQ(run(), codes_t{4});
}

TEST_F(Modes4kX2k, OfASinkAreItsFirstSevenWhateverItsLengthSays) {
  sink({9, 9, 9, 9, 9, 9, 3});
  sink_->hdmi_vic_len = 255;
  priority({3});
  EXPECT_EQ(run(), codes_t{3});
}

TEST_F(Modes4kX2k, OfASinkBehindItsLengthDoNotCount) {
  sink({3, 2});
  sink_->hdmi_vic_len = 1;
  priority({2, 3});
  EXPECT_EQ(run(), codes_t{3});
}

TEST_F(Modes4kX2k, OutsideTheKnownOnesAreCarriedThrough) {
  sink({200});
  addition({-1});
  priority({-1, 200, 5});
  EXPECT_EQ(run(), (codes_t{0xFFFFFFFF, 200}));
}

TEST_F(Modes4kX2k, AreTraced) {
  sink({1, 5});
  addition({4});
  priority({4, 3, 1});
  const auto line = [](const std::string &message) { return trace("_filter_4k_modes", message); };
  EXPECT_EQ(test_support::traced_output_of([&] { select(); }),
            line("Downstream 4k x 2k:") + line("\t1\t3840x2160p30Hz") + line("\t5\tUnknown Value") +
                line("Additional 4k x 2k:") + line("\t4\t4096x2160p24Hz") + line("Priority 4k x 2k:") +
                line("\t4\t4096x2160p24Hz") + line("\t3\t3840x2160p24Hz") + line("\t1\t3840x2160p30Hz") +
                line("\tAdding 4k x 2k mode:4:4096x2160p24Hz") + line("\tAdding 4k x 2k mode:1:3840x2160p30Hz"));
}

}  // namespace
