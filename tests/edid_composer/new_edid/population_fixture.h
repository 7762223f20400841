// What the tests of the population share: the record of one call, and the call.
#pragma once

#include <string>
#include <vector>

#include "edid_composer/new_edid/population.h"
#include "edid_composer/stage_fixture.h"

namespace composer_fixtures {

/// Four modes are selected, so that nothing is padded and a plain run prints nothing.
class Population : public Stage {
 protected:
  /// An empty record with the selected modes.
  void prepare() {
    new_ = {};
    ASSERT_EQ(edid_prepare(&new_), 1);
    edid_composer::appender_t<short_video_desc_t> modes(&new_.video_list, &arena_, reporter);
    for (const short_video_desc_t &mode : selected_)
      ASSERT_TRUE(modes.append(mode));
  }
  bool populate(edid_composer::entry_arena_t *arena) {
    return edid_composer::_populate_new_edid(inputs(arena), modes_4k_, &new_).complete;
  }
  /// Runs with success and returns what was printed.
  std::string output() {
    prepare();
    return test_support::output_of([&] { EXPECT_TRUE(populate(&arena_)); });
  }
  std::string traced_output() {
    prepare();
    return test_support::traced_output_of([&] { EXPECT_TRUE(populate(&arena_)); });
  }
  void select(const std::vector<test_support::mode_pair_t> &modes) {
    selected_.clear();
    for (const auto &[vic, stereo] : modes)
      selected_.push_back({0, vic, stereo});
  }

  edid_t new_{};
  std::vector<short_video_desc_t> selected_{{0, 16, 0}, {0, 4, 0}, {0, 2, 0}, {0, 1, 0}};
  edid_composer::hdmi_vics_t modes_4k_;
};

}  // namespace composer_fixtures
