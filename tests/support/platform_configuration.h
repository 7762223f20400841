// A platform's configuration as data. It goes into a configuration tree, for the library to read, or straight into
// platform values.
#pragma once

#include <string>
#include <vector>

#include "support/configuration_tree.h"
#include "support/records.h"

namespace test_support {

struct platform_configuration_t {
  std::vector<i32> audio;  ///< At most 26.
  std::vector<mode_pair_t> video_50_priority;
  std::vector<mode_pair_t> video_50_additional;
  std::vector<mode_pair_t> video_60_priority;
  std::vector<mode_pair_t> video_60_additional;
  std::vector<i32> modes_4k_x_2k_priority;  ///< At most 7.
  std::vector<i32> modes_4k_x_2k_addition;  ///< At most 7.
  std::vector<std_timing_words_t> std_timings;
  i32 native_refresh_rate = 60;
  i32 current_mode_set_to_priority = 0;
  i32 geometry_limit = 0;
  i32 audio_pass_through = 0;
  i32 underscan = 0;
  i32 is_tv = 0;
  i32 dc_30bit = 0;
  i32 dc_36bit = 0;
  i32 tmds_override = 0;
  i32 supports_ai = 0;
  i32 speaker_entry = 1;
  i32 xvYCC601 = 0;
  i32 xvYCC709 = 0;
  i32 native_bit = 1;
  u32 product_id = 0;
  u32 serial = 0;
  u32 week = 1;
  u32 year = 2012;
  u32 cnc[4] = {};
  std::string manufacturer_id = "YYY";
  std::string monitor_name;
  std::string monitor_serial;
  u32 established_timings_1 = 0;
  u32 established_timings_2 = 0;
  u32 manufacturer_timings = 0;

  /// Puts everything into an empty tree, every scalar and every list also where it is the default. Of the 3D masks only
  /// what a list entry can name: frame packing, side-by-side (half) and top-and-bottom.
  void write_to(configuration_tree_t &tree) const;

  /// Puts everything into values that were initialised and are otherwise empty.
  void write_to(platform_values_t *values) const;
};

}  // namespace test_support
