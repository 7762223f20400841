// Compositions with HDMI 2, and the parts of the new EDID that their tests are about.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <string>
#include <vector>

#include "edid_composer/explain/observed_composition.h"

namespace hdmi2_test {

using observed::situation_t;
using test_support::bytes_t;

inline constexpr u8 audio = 1;
inline constexpr u8 video = 2;
inline constexpr u8 vendor_specific = 3;
inline constexpr u8 extended = 7;

/// A situation with HDMI 2 and nothing of it offered: no sink, B is 16, 4, 2 and 1.
struct layer_situation_t : situation_t {
  layer_situation_t() : values(enable_hdmi2(*this)) {}
  layer_situation_t(const layer_situation_t &) = delete;
  layer_situation_t &operator=(const layer_situation_t &) = delete;

  hdmi2_values_t &values;

  void name(const std::vector<i32> &vics) { fill(vics, values.vic_priority_list); }
  /// Modes that the box makes itself.
  void add(const std::vector<i32> &vics) { fill(vics, values.vic_addition_list); }

 private:
  static void fill(const std::vector<i32> &vics, i32 (&list)[HDMI2_MOST_LISTED_VICS]) {
    std::fill(std::copy(vics.begin(), vics.end(), std::begin(list)), std::end(list), 0);
  }
};

/// A sink's HDMI Forum block.
inline bytes_t forum_block(u8 rate_in_5_mhz, u8 video_flags = 0, const bytes_t &more = {}) {
  bytes_t payload{0xD8, 0x5D, 0xC4, 1, rate_in_5_mhz, 0x80, video_flags};
  payload.insert(payload.end(), more.begin(), more.end());
  return test_support::data_block(vendor_specific, payload);
}

/// What was composed. The EDID must be a sound one.
struct composed_t {
  bytes_t bytes;
  std::string lines;  ///< Of warnings and errors.

  /// The payload of the first data block with this tag whose payload begins so; nothing without one.
  std::optional<bytes_t> block(u8 tag, const bytes_t &beginning = {}) const {
    for (const bytes_t &block : blocks()) {
      if (block[0] >> 5 == tag && block.size() > beginning.size() &&
          std::equal(beginning.begin(), beginning.end(), block.begin() + 1)) {
        return bytes_t(block.begin() + 1, block.end());
      }
    }
    return std::nullopt;
  }
  /// Data blocks in their order, with their headers.
  std::vector<bytes_t> blocks() const {
    std::vector<bytes_t> found;
    for (std::size_t at = 128 + 4; at < 128U + bytes[130];) {
      const std::size_t end = at + 1 + (bytes[at] & 0x1F);
      found.emplace_back(bytes.begin() + static_cast<std::ptrdiff_t>(at),
                         bytes.begin() + static_cast<std::ptrdiff_t>(end));
      at = end;
    }
    return found;
  }
  std::optional<bytes_t> forum() const { return block(vendor_specific, {0xD8, 0x5D, 0xC4}); }
  /// Maximum TMDS clock of the HDMI block, MHz.
  u32 tmds_clock() const { return block(vendor_specific, {0x03, 0x0C, 0x00})->at(6) * 5U; }
  /// Codes of the video data block, native flag included.
  bytes_t svds() const { return *block(video); }
  /// Bytes from one on, of the whole EDID.
  bytes_t from(std::size_t offset, std::size_t count) const {
    const auto begin = bytes.begin() + static_cast<std::ptrdiff_t>(offset);
    return {begin, begin + static_cast<std::ptrdiff_t>(count)};
  }
};

inline composed_t compose(const situation_t &situation) {
  const observed::composition_t composition = observe(situation);
  EXPECT_TRUE(composition.result) << composition.output;
  EXPECT_EQ(test_support::block_sum(composition.bytes.data()), 0);
  EXPECT_EQ(test_support::block_sum(composition.bytes.data() + 128), 0);
  EXPECT_EQ(composition.bytes[126], 1);
  EXPECT_LE(composition.bytes[130], 109);
  return {composition.bytes, composition.output};
}

/// Expects one line to hold a text, and no other line to be there.
inline void expect_line(const composed_t &composed, const std::string &text) {
  EXPECT_NE(composed.lines.find(text), std::string::npos) << composed.lines;
  EXPECT_EQ(std::count(composed.lines.begin(), composed.lines.end(), '\n'), 1) << composed.lines;
}

}  // namespace hdmi2_test
