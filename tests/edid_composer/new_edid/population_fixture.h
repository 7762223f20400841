// What the tests of the population share: the inputs and the record of one call, and the call.
#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "edid_composer/new_edid/population.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace composer_fixtures {

/// Four modes are selected, so that nothing is padded and a plain run prints nothing.
class Population : public testing::Test {
 protected:
  edid_composer::inputs_t inputs() { return {*sink_.get(), *values_.get(), cfg_}; }
  /// An empty record with the selected modes.
  void prepare() {
    ASSERT_EQ(edid_destroy(new_.get()), 1);
    ASSERT_EQ(edid_prepare(new_.get()), 1);
    for (const short_video_desc_t &mode : selected_)
      test_support::append(new_->video_list, mode);
  }
  bool populate() { return edid_composer::_populate_new_edid(inputs(), modes_4k_, new_.get()).complete; }
  /// Runs with success and returns what was printed.
  std::string output() {
    prepare();
    return test_support::output_of([&] { EXPECT_TRUE(populate()); });
  }
  std::string traced_output() {
    prepare();
    return test_support::traced_output_of([&] { EXPECT_TRUE(populate()); });
  }
  void select(const std::vector<test_support::mode_pair_t> &modes) {
    selected_.clear();
    for (const auto &[vic, stereo] : modes)
      selected_.push_back({0, vic, stereo});
  }

  test_support::scoped_edid_t sink_;
  test_support::scoped_edid_t new_;
  test_support::scoped_values_t values_;
  std::vector<short_video_desc_t> selected_{{0, 16, 0}, {0, 4, 0}, {0, 2, 0}, {0, 1, 0}};
  edid_composer::hdmi_vics_t modes_4k_;
  compose_cfg_t cfg_ = test_support::plain_settings();
};

}  // namespace composer_fixtures
