// The maximum TMDS clock that the new EDID declares.
#pragma once

#include "edid_composer/inputs.h"
#include "edid_composer/new_edid/deep_color.h"

namespace edid_composer {

/// A TMDS clock, and what it follows from.
struct tmds_clock_t {
  u32 wanted_mhz;  ///< 0 when it needn't be declared.
  compose_reason reason;
  u32 pixel_clock;           ///< Of the most demanding mode, Hz; 0 with the platform's own clock.
  u32 percent_of_that;       ///< What the deepest colour takes of it.
  reason_values_t values{};  ///< Of a reason that follows from neither.

  /// What the record holds: the HDMI block has no room for more.
  u32 held_mhz() const;
};

/// The platform's own clock, else the one that @p modes and the 4Kx2K modes need.
tmds_clock_t declare_tmds_clock(const inputs_t &inputs, const ll_list_t &modes, bool has_4k_modes,
                                const deep_color_t &deep_color);

/// The same for modes of which the most demanding has @p pixel_clock, Hz.
tmds_clock_t tmds_clock_for(const platform_values_t &platform, u32 pixel_clock, bool has_4k_modes,
                            const deep_color_t &deep_color);

/// A pixel clock with the factor that the most demanding of the mode's 3D structures needs.
u32 pixel_clock_with_3d(u32 pixel_clock, u32 stereo);

/// The largest pixel clock of the modes, Hz, with the factor that their 3D structures need; 0 for an empty list.
u32 _maximum_pixel_clock(const ll_list_t *vic_list);

}  // namespace edid_composer
