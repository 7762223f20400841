// The HDMI Forum vendor-specific data block of the new EDID: rate, SCDC, deep colour in 4:2:0, ALLM and VRR.
#pragma once

#include "edid_composer/hdmi2/plan.h"

namespace edid_composer {

/// A range of refresh rates, Hz.
struct refresh_range_t {
  i32 minimum;
  i32 maximum;  ///< 0: none told.
};

/// What becomes of the variable refresh rate.
struct vrr_offer_t {
  bool offered;
  refresh_range_t range;  ///< As it was worked out, offered or not.
  compose_reason reason;
};

vrr_offer_t offer_vrr(const layer_inputs_t &inputs);

/// True when the sink's VRR, or its lack of it, stands unchanged in the new EDID.
bool is_vrr_of_sink(const layer_inputs_t &inputs, const vrr_offer_t &vrr);

/// What becomes of the colour depths in 4:2:0.
struct depths_420_t {
  bool bits_30;
  bool bits_36;
  bool requires_30;    ///< 30 bit is offered because 36 bit is.
  bool above_rate_30;  ///< Asked for, but no mode in 4:2:0 leaves room for it on the link.
  bool above_rate_36;
};

/// @p rate in MHz.
depths_420_t offer_depths_420(const layer_inputs_t &inputs, const extended_modes_t &modes, u32 rate);

/// Whether the VICs of 4Kx2K modes can be said to be taken: an HDMI_VIC and its VIC are both offered.
bool has_uhd_vic(const edid_t &record, const extended_modes_t &modes);

/// Fills the members of the block; it is absent when it has nothing to say.
void fill_forum_block(const layer_inputs_t &inputs, u32 rate, bool uhd_vic, const depths_420_t &depths,
                      const vrr_offer_t &vrr, hdmi2_t *blocks);

}  // namespace edid_composer
