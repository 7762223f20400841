// Filling of the new record from the selections, the sink's record and the platform values.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

class decisions_t;

/// Fills every field of @p new_edid but its audio list and 4Kx2K modes, which hold the selections already.
/// @p port is the input's number in the physical address, from 1; @p edid_latency are the four words of compose_cfg_t.
u32 _populate_new_edid(edid_t *new_edid, ll_list_t *video_list, const edid_t *downstream, u8 port, i32 hdmi_3d_mode,
                       const u32 *edid_latency, const platform_values_t *platform_values,
                       decisions_t *decisions = nullptr);

/// The largest pixel clock of the modes, Hz, with the factor that their 3D structures need; 0 for an empty list.
u32 _maximum_pixel_clock(const ll_list_t *vic_list);

}  // namespace edid_composer
