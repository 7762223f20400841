#include "edid_composer/hdmi2/picture_blocks.h"

#include <algorithm>
#include <iterator>

#include "bytes.h"
#include "edid_composer/hdmi2/platform_values.h"

namespace edid_composer {
namespace {

constexpr u8 metadata_type_1 = 0x01;

/// Beside the EOTFs.
void fill_luminance(const layer_inputs_t &inputs, hdmi2_t *blocks) {
  constexpr i32 own = 1;
  constexpr i32 as_sink = 2;
  const hdmi2_values_t &platform = inputs.platform;
  const auto put = [blocks](u8 maximum, u8 average, u8 minimum) {
    blocks->luminance[0] = maximum;
    blocks->luminance[1] = average;
    blocks->luminance[2] = minimum;
  };
  if (platform.hdr_luminance == own) {
    blocks->luminance_count = static_cast<u8>(std::size(blocks->luminance));
    put(low_byte(static_cast<u32>(platform.hdr_max)), low_byte(static_cast<u32>(platform.hdr_average)),
        low_byte(static_cast<u32>(platform.hdr_min)));
  } else if (platform.hdr_luminance == as_sink) {
    blocks->luminance_count = inputs.sink.luminance_count;
    put(inputs.sink.luminance[0], inputs.sink.luminance[1], inputs.sink.luminance[2]);
  }
}

}  // namespace

void fill_video_capability(const layer_inputs_t &inputs, hdmi2_t *blocks) {
  constexpr u8 underscanned = 2;
  constexpr u8 both = 3;
  const u8 scan = inputs.base.platform.underscan != 0 ? underscanned : both;
  blocks->video_capability_present = 1;
  blocks->rgb_quantization = tri_state(inputs.platform.rgb_quantization, inputs.sink.rgb_quantization != 0);
  blocks->ycc_quantization = tri_state(inputs.platform.ycc_quantization, inputs.sink.ycc_quantization != 0);
  blocks->preferred_scan = 0;
  blocks->it_scan = scan;
  blocks->ce_scan = scan;
}

void fill_colorimetry(const layer_inputs_t &inputs, const edid_t &record, hdmi2_t *blocks) {
  constexpr u8 metadata_profile_0 = 0x01;
  u32 xvycc = 0;
  if (record.xvycc601 != 0) xvycc |= HDMI2_XVYCC601;
  if (record.xvycc709 != 0) xvycc |= HDMI2_XVYCC709;
  u32 color_spaces = xvycc;
  for (const auto &[color_space, key] : color_space_keys) {
    if (tri_state(inputs.platform.*key, (inputs.sink.colorimetry & color_space) != 0)) color_spaces |= color_space;
  }
  blocks->colorimetry_present = color_spaces != 0;
  blocks->colorimetry = low_byte(color_spaces);
  blocks->gamut_metadata = xvycc != 0 ? metadata_profile_0 : 0;
}

u8 eotfs_of_sink(const hdmi2_t &sink) {
  return (sink.metadata_types & metadata_type_1) != 0 ? sink.eotfs : u8{0};
}

void fill_hdr_static(const layer_inputs_t &inputs, hdmi2_t *blocks) {
  const u8 of_sink = eotfs_of_sink(inputs.sink);
  u32 eotfs = 0;
  for (const auto &[eotf, key] : eotf_keys) {
    if (tri_state(inputs.platform.*key, (of_sink & eotf) != 0)) eotfs |= eotf;
  }
  if (eotfs == 0) return;
  blocks->hdr_static_present = 1;
  blocks->eotfs = low_byte(eotfs | HDMI2_EOTF_SDR);
  blocks->metadata_types = metadata_type_1;
  fill_luminance(inputs, blocks);
}

}  // namespace edid_composer
