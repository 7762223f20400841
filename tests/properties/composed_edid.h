// A composed EDID taken apart by where its bytes stand, without the library's decoder.
#pragma once

#include <array>
#include <vector>

#include "support/composition.h"

namespace properties {

struct composed_edid_t {
  std::vector<u32> vics;  ///< Short video descriptors without the native bit: all that were written.
  std::vector<std::array<u8, 3>> audio;
  std::vector<u32> hdmi_vics;
  std::array<u8, 4> physical_address{};
  bool has_3d = false;
  /// 2D_VIC_order entries: mode index and 3D_Structure. Those of a block that is too long to be read back are left out.
  std::vector<std::array<u32, 2>> structures;
  bool native_first = false;
};

/// Takes 256 bytes apart. @p spa_offset is where the physical address was said to stand.
composed_edid_t taken_apart(const test_support::bytes_t &bytes, u8 spa_offset);

/// The audio type of a short audio descriptor: 16 to 18 for the extension codes.
u32 audio_type_of(const std::array<u8, 3> &descriptor);

}  // namespace properties
