// How the new EDID takes pictures: HDR, colorimetry, quantization ranges and scan.
#pragma once

#include "edid_composer/hdmi2/layer_inputs.h"

namespace edid_composer {

/// Video capability is always told.
void fill_video_capability(const layer_inputs_t &inputs, hdmi2_t *blocks);

/// @p record has the colorimetry that is told without HDMI 2. Absent when there is none of either.
void fill_colorimetry(const layer_inputs_t &inputs, const edid_t &record, hdmi2_t *blocks);

/// Absent without an EOTF beside that of SDR.
void fill_hdr_static(const layer_inputs_t &inputs, hdmi2_t *blocks);

/// An EOTF, and the platform's say about it.
struct eotf_key_t {
  hdmi2_eotf eotf;
  i32 hdmi2_values_t::*key;
};
inline constexpr eotf_key_t eotf_keys[] = {
    {HDMI2_EOTF_GAMMA, &hdmi2_values_t::hdr_gamma},
    {HDMI2_EOTF_PQ, &hdmi2_values_t::hdr_pq},
    {HDMI2_EOTF_HLG, &hdmi2_values_t::hdr_hlg},
};

/// A colour space, and the platform's say about it.
struct color_space_key_t {
  hdmi2_colorimetry color_space;
  i32 hdmi2_values_t::*key;
};
inline constexpr color_space_key_t color_space_keys[] = {
    {HDMI2_BT2020_RGB, &hdmi2_values_t::bt2020_rgb},
    {HDMI2_BT2020_YCC, &hdmi2_values_t::bt2020_ycc},
    {HDMI2_BT2020_CYCC, &hdmi2_values_t::bt2020_cycc},
};

/// The sink's EOTFs that count: those of a sink that takes static metadata of type 1.
u8 eotfs_of_sink(const hdmi2_t &sink);

}  // namespace edid_composer
