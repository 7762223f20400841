// What the tests of the population share: the records of one call, and the call.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "edid_composer/population.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace composer_fixtures {

/// Four modes are selected, so that nothing is padded and a plain run prints nothing.
class Population : public testing::Test {
 protected:
  Population() { test_support::append_modes(*selected_, {{16, 0}, {4, 0}, {2, 0}, {1, 0}}); }

  u32 run() {
    return edid_composer::_populate_new_edid(new_.get(), selected_.get(), sink_.get(), port_, hdmi_3d_mode_, latency_,
                                             values_.get());
  }
  /// Runs with success and returns what was printed.
  std::string output() {
    return test_support::output_of([&] { EXPECT_EQ(run(), 1U); });
  }
  std::string traced_output() {
    return test_support::traced_output_of([&] { EXPECT_EQ(run(), 1U); });
  }
  /// Empties the new record, for one more run.
  void prepare_again() {
    ASSERT_EQ(edid_destroy(new_.get()), 1);
    ASSERT_EQ(edid_prepare(new_.get()), 1);
  }
  void select(const std::vector<test_support::mode_pair_t> &modes) {
    ASSERT_TRUE(ll_delete_list(selected_.get()));
    ASSERT_TRUE(ll_init(selected_.get(), "short_video_desc_t"));
    test_support::append_modes(*selected_, modes);
  }

  test_support::scoped_edid_t sink_;
  test_support::scoped_edid_t new_;
  test_support::scoped_values_t values_;
  test_support::scoped_list_t<short_video_desc_t> selected_;
  u8 port_ = 1;
  i32 hdmi_3d_mode_ = 0;
  u32 latency_[4]{};
};

}  // namespace composer_fixtures
