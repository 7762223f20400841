#include "edid_composer/hdmi2/ycbcr_420_blocks.h"

#include "bytes.h"

namespace edid_composer {

void fill_420_video(const extended_modes_t &modes, hdmi2_t *blocks) {
  for (const extended_mode_t &mode : modes) {
    if (mode.place == mode_place_t::ycbcr_420_block) blocks->y420_vics[blocks->y420_count++] = low_byte(mode.vic());
  }
}

void fill_420_map(const extended_modes_t &modes, u32 base_modes, hdmi2_t *blocks) {
  u32 descriptor = base_modes;
  for (const extended_mode_t &mode : modes) {
    if (mode.place != mode_place_t::video_block) continue;
    if (mode.takes_420) {
      u8 &byte = blocks->y420_map[descriptor / 8];
      byte = low_byte(byte | 1U << descriptor % 8);
      blocks->y420_map_present = 1;
      blocks->y420_map_bytes = low_byte(descriptor / 8 + 1);
    }
    ++descriptor;
  }
}

}  // namespace edid_composer
