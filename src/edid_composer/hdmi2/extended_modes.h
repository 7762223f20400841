// Selection of the modes above VIC 64 that the new EDID offers.
#pragma once

#include "edid_composer/hdmi2/codec/extended_vics.h"
#include "edid_composer/hdmi2/link_rates.h"

namespace edid_composer {

enum class mode_place_t : u8 { nowhere, video_block, ycbcr_420_block };

/// A mode that the priority list names, and what becomes of it.
struct extended_mode_t {
  const extended_timing_t *timing;
  i32 index;  ///< Of its first mention in the priority list.
  mode_place_t place;
  mode_place_t chosen_place;  ///< Before room was made.
  bool takes_420;             ///< It may be sent in 4:2:0.
  bool made_by_box;           ///< The link to the box has to carry it, whatever the sink takes.
  compose_reason reason;
  reason_values_t values;

  u32 vic() const { return timing->vic; }
  /// What the link carries: in 4:2:0 half the pixel clock.
  u32 link_khz() const;
};

/// In the order of the priority list.
struct extended_modes_t {
  extended_mode_t modes[HDMI2_MOST_LISTED_VICS];
  u32 count = 0;

  const extended_mode_t *begin() const { return modes; }
  const extended_mode_t *end() const { return modes + count; }
  u32 count_in(mode_place_t place) const;
  /// Leaves out the last mode of a block, and returns its VIC; 0 without one.
  u32 drop_last(mode_place_t place);
};

extended_modes_t select_extended_modes(const layer_inputs_t &inputs, const link_rates_t &rates);

/// The rate that the link to the box has to carry, MHz: that of both, or more for modes that the box makes itself.
u32 rate_for_modes(const extended_modes_t &modes, const link_rates_t &rates);

}  // namespace edid_composer
