#include "edid_decode_encode/hdmi_vendor_block_encoder.h"

#include <algorithm>

#include "diagnostics.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/hdmi_vendor_block_layout.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

REPORTS_AS(encode_edid);

namespace layout = hdmi_vendor_block;

/// The structures of a mode without those that 3D_present implies, which aren't written one by one.
u32 written_structures(const short_video_desc_t &video) {
  for (const auto &mandatory : _3d_man_modes) {
    if (mandatory.vic == video.vic) return video.stereo & ~mandatory.stereo;
  }
  return video.stereo;
}

/// Writes the 2D_VIC_order entries of one mode.
void encode_3d_structures(u32 index, u32 stereo, byte_writer_t *block) {
  for (const auto &structure : layout::structures_3d) {
    if ((stereo & structure.stereo) == 0) continue;
    const u8 order = low_byte(index << layout::index_shift | structure.code);
    block->put(order);
    if (structure.code == layout::side_by_side_half) {
      constexpr u8 detail = 0;
      block->put(detail);
      LOG_TRACE("order[%d] %s, %02x, %02x", index, structure.name, order, detail);
    } else {
      LOG_TRACE("order[%d] %s, %02x", index, structure.name, order);
    }
  }
}

void encode_3d_modes(edid_t *edid, byte_writer_t *block) {
  u32 index = 0;
  for (auto &video : counted_elements<short_video_desc_t>(edid->video_list)) {
    if (index == layout::most_3d_modes) break;
    video.stereo = written_structures(video);
    encode_3d_structures(index, video.stereo, block);
    ++index;
  }
}

/// The flags byte, and the latencies that it announces.
void encode_latencies(const edid_t &edid, byte_writer_t *block) {
  const layout::latency_fields_t fields = layout::latency_fields(edid);
  u32 flags = encode_flags(layout::content_flags, edid);
  if (fields.progressive) flags |= layout::latency_present;
  if (fields.interlaced) flags |= layout::i_latency_present;
  block->put(low_byte(flags));
  if (fields.progressive) {
    block->put(encode_edid_latency_value(edid.video_latency));
    block->put(encode_edid_latency_value(edid.audio_latency));
  }
  if (fields.interlaced) {
    block->put(encode_edid_latency_value(edid.i_video_latency));
    block->put(encode_edid_latency_value(edid.i_audio_latency));
  }
}

/// The HDMI video fields: 3D and 4Kx2K.
void encode_video(edid_t *edid, byte_writer_t *block) {
  const u32 present = edid->hdmi_3d_present != 0 ? layout::present_3d : 0U;
  block->put(low_byte(present | (edid->image_size & layout::image_size_mask) << layout::image_size_shift));
  const u32 lengths = block->reserve();
  const u32 vics = std::min<u32>(edid->hdmi_vic_len, layout::most_vics);
  for (u32 i = 0; i < vics; ++i)
    block->put(low_byte(edid->hdmi_vic[i]));

  const u32 begin_3d = block->position();
  if (edid->hdmi_3d_present != 0) encode_3d_modes(edid, block);
  const u32 length_3d = block->position() - begin_3d;
  block->put_at(lengths, low_byte(vics << layout::vic_length_shift | (length_3d & layout::length_3d_mask)));
}

}  // namespace

u32 written_3d_bytes(const edid_t &edid, u32 modes) {
  if (edid.hdmi_3d_present == 0) return 0;
  u32 bytes = 0;
  u32 index = 0;
  for (const auto &video : elements<const short_video_desc_t>(edid.video_list.head)) {
    if (index == layout::most_3d_modes || index++ == modes) break;
    const u32 stereo = written_structures(video);
    for (const auto &structure : layout::structures_3d) {
      if ((stereo & structure.stereo) != 0) bytes += structure.code == layout::side_by_side_half ? 2 : 1;
    }
  }
  return bytes;
}

u32 hdmi_vendor_block_length(const edid_t &edid, u32 bytes_3d) {
  constexpr u32 before_vics = 2;
  const u32 latencies = layout::video_fields(layout::latency_fields(edid)) - 1;
  if (edid.hdmi_video_present == 0) return latencies;
  return latencies + before_vics + std::min<u32>(edid.hdmi_vic_len, layout::most_vics) + bytes_3d;
}

void encode_hdmi_vendor_block(edid_t *edid, byte_writer_t *extension) {
  const u32 header = extension->reserve();
  extension->put(layout::oui_bytes, sizeof layout::oui_bytes);
  const u8 *const address = edid->physical_address;
  extension->put(low_byte((address[0] & 0x0FU) << 4 | (address[1] & 0x0FU)));
  extension->put(low_byte((address[2] & 0x0FU) << 4 | (address[3] & 0x0FU)));
  extension->put(encode_flags(layout::support_flags, *edid));
  extension->put(low_byte(edid->max_tmds_clock / layout::max_tmds_clock_unit));
  encode_latencies(*edid, extension);
  if (edid->hdmi_video_present != 0) encode_video(edid, extension);
  // kept: a length above 31 wraps.
  const u32 length = extension->position() - header - 1;
  extension->put_at(header, data_block::header(data_block::vendor_specific, length));
}

}  // namespace edid_composer

u8 encode_edid_latency_value(u16 latency_ms) {
  REPORTS_AS(encode_edid_latency_value);
  constexpr u16 longest_ms = 500;
  constexpr u16 not_supported_ms = 65535;
  if (latency_ms > longest_ms && latency_ms != not_supported_ms) LOG_TRACE("latency = %d exceed 500ms", latency_ms);
  return edid_composer::hdmi_vendor_block::latency_code(latency_ms);
}
