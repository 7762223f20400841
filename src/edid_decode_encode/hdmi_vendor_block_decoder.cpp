#include "edid_decode_encode/hdmi_vendor_block_decoder.h"

#include "diagnostics.h"
#include "edid_decode_encode/cea_extension_layout.h"

namespace edid_composer {
namespace {

namespace layout = hdmi_vendor_block;

constexpr u16 latency_ms(u8 value) {
  return static_cast<u16>(value == 0 ? 0 : (value - 1) * 2);
}

void decode_physical_address(const byte_view_t &block, edid_t *edid) {
  u8 *const address = edid->physical_address;
  address[0] = block[layout::physical_address] >> 4;
  address[1] = block[layout::physical_address] & 0x0F;
  address[2] = block[layout::physical_address + 1] >> 4;
  address[3] = block[layout::physical_address + 1] & 0x0F;
}

/// Answers the offset behind the latency fields.
u32 decode_latencies(const byte_view_t &block, edid_t *edid) {
  const u8 flags = block[layout::video_flags];
  const bool present = (flags & layout::latency_present) != 0;
  const bool interlaced_present = present && (flags & layout::i_latency_present) != 0;
  u32 offset = layout::latencies;
  if (present) {
    edid->video_latency = latency_ms(block[offset++]);
    edid->audio_latency = latency_ms(block[offset++]);
  }
  if (interlaced_present) {
    edid->i_video_latency = latency_ms(block[offset++]);
    edid->i_audio_latency = latency_ms(block[offset++]);
  } else {
    edid->i_video_latency = edid->video_latency;
    edid->i_audio_latency = edid->audio_latency;
  }
  return offset;
}

/// The structures that 3D_Structure_ALL names, as the record's mask.
u32 stereo_of_all(u32 structure_all) {
  u32 stereo = 0;
  for (u32 bit = 0; bit < 16; ++bit) {
    if ((structure_all >> bit & 1) != 0) stereo |= _3d_struct_all_array[bit];
  }
  return stereo;
}

bool video_entry_at(const edid_t &edid, i32 index, short_video_desc_t **entry) {
  void *payload = nullptr;
  const bool found = ll_entry_at(&edid.video_list, index, &payload);
  *entry = static_cast<short_video_desc_t *>(payload);
  return found;
}

/// Gives the structures of 3D_Structure_ALL to the modes of 3D_MASK. False when a mode can't be reached.
bool mark_all(const site_t &site, u32 structure_all, u32 mask, edid_t *edid) {
  const u32 stereo = stereo_of_all(structure_all);
  const i32 size = ll_size(&edid->video_list);
  for (i32 i = 0; i < size && i < layout::most_3d_modes; ++i) {
    // Looked up are the modes of the mask only: each look-up verifies the whole list.
    if ((mask >> i & 1) == 0) continue;
    short_video_desc_t *entry = nullptr;
    if (!video_entry_at(*edid, i, &entry)) {
      LOG_ERROR_AS(site, "Failed reading from an linked list. index:%d", i);
      return false;
    }
    entry->stereo |= stereo;
  }
  return true;
}

/// Adds the structure of one 2D_VIC_order entry to its mode; answers the number of bytes that the entry takes.
u32 mark_one(const site_t &site, u8 byte, edid_t *edid) {
  const auto index = static_cast<i32>(u32{byte} >> layout::index_shift);
  const u32 code = byte & layout::structure_mask;
  const u32 length = code == layout::side_by_side_half ? 2 : 1;
  const i32 size = ll_size(&edid->video_list);
  if (index > size) {
    LOG_WARNING_AS(site, "Index out of range. index:%d Len:%d", index, size);
    return length;
  }
  short_video_desc_t *entry = nullptr;
  if (!video_entry_at(*edid, index, &entry)) {
    LOG_ERROR_AS(site,
                 "The Vendor Specific Data Block (VSDB) 3D description references an index (%d) that doesn't exist. "
                 "Continuing. List len:%d",
                 index, size);
    // kept: the 3D_Detail byte of side-by-side (half) is then read as the next entry.
    return 1;
  }
  for (const auto &structure : layout::structures_3d) {
    if (structure.code == code) {
      entry->stereo |= structure.stereo;
      return length;
    }
  }
  LOG_ERROR_AS(site, "It should not arrive here.");
  return length;
}

/// Decodes the @p length bytes of 3D information from @p offset on.
void decode_3d(const site_t &site, const byte_view_t &block, u32 offset, u32 length, u32 multi_present, edid_t *edid) {
  u32 structure_all = 0;
  u32 mask = 0;
  u32 entries = offset;
  if (multi_present == 1 || multi_present == 2) {
    structure_all = block.big_endian_16(entries);
    mask = 0xFFFF;
    entries += 2;
  }
  if (multi_present == 2) {
    mask = block.big_endian_16(entries);
    entries += 2;
  }
  if (!mark_all(site, structure_all, mask, edid)) return;
  while (entries < offset + length)
    entries += mark_one(site, block[entries], edid);
}

/// Decodes the HDMI video fields, 4Kx2K and 3D, that begin at @p offset. The block's length doesn't bound them.
void decode_video(const site_t &site, const byte_view_t &block, u32 offset, edid_t *edid) {
  const u32 flags = block[offset];
  const u32 lengths = block[offset + 1];
  const u32 multi_present = flags >> layout::multi_present_shift & layout::multi_present_mask;
  const u32 length_3d = lengths & layout::length_3d_mask;
  edid->hdmi_3d_present = (flags & layout::present_3d) != 0 ? 1 : 0;
  edid->image_size = low_byte(flags >> layout::image_size_shift & layout::image_size_mask);
  edid->hdmi_vic_len = low_byte(lengths >> layout::vic_length_shift & layout::vic_length_mask);
  LOG_TRACE_AS(site, " start parsing 3D and 4Kx2K stuff %s", true_or_false(edid->hdmi_video_present != 0));
  LOG_TRACE_AS(site, " 3D_present %d", edid->hdmi_3d_present);
  LOG_TRACE_AS(site, " 3D_multi_present %d", multi_present);
  LOG_TRACE_AS(site, " image_size %d", edid->image_size);
  LOG_TRACE_AS(site, " 3D_len %d", length_3d);
  LOG_TRACE_AS(site, " 4k_2k_vic_len %d", edid->hdmi_vic_len);

  offset += 2;
  for (u32 i = 0; i < edid->hdmi_vic_len; ++i)
    edid->hdmi_vic[i] = block[offset++] & layout::vic_mask;
  if (length_3d != 0 && edid->hdmi_3d_present != 0) decode_3d(site, block, offset, length_3d, multi_present, edid);
}

}  // namespace

u8 _decode_edid_vendor_block(const byte_view_t &vendor_block, edid_t *edid) {
  if (vendor_block.data() == nullptr) {
    LOG_ERROR("Function called with vendor_block set to NULL.");
    return 0;
  }
  if (edid == nullptr) {
    LOG_ERROR("Function called with edid set to NULL.");
    return 0;
  }
  const u32 tag = u32{vendor_block[0]} >> data_block::tag_shift;
  const u32 length = vendor_block[0] & data_block::length_mask;
  if (tag != data_block::vendor_specific) {
    LOG_ERROR("Failed decoding the vendor block. Tag is not correct. Expected=0x3 Received=0x%X", tag);
    return 0;
  }
  if (length <= 2) {
    LOG_ERROR("Failed decoding the vendor block. Length not long enough to contain the vendor's id. Length=%d", length);
    return 0;
  }
  const u32 oui = vendor_block.little_endian_16(layout::oui) | u32{vendor_block[layout::oui + 2]} << 16;
  if (oui != layout::hdmi_oui) {
    LOG_TRACE("Unrecognized vendor block. Ignoring. Vendor=0x%X", oui);
    return 1;
  }
  if (length <= 4) {
    LOG_ERROR("Failed decoding the hdmi block. The length is required to be at least 5 bytes long. Length=%d", length);
    return 0;
  }

  decode_physical_address(vendor_block, edid);
  if (length >= layout::support) decode_flags(layout::support_flags, vendor_block[layout::support], edid);
  if (length >= layout::max_tmds_clock) {
    edid->max_tmds_clock = vendor_block[layout::max_tmds_clock] * layout::max_tmds_clock_unit;
  }
  edid->hdmi_present = 1;
  u32 video = layout::latencies;
  if (length >= layout::video_flags) {
    decode_flags(layout::content_flags, vendor_block[layout::video_flags], edid);
    video = decode_latencies(vendor_block, edid);
  }
  if (length >= video && edid->hdmi_video_present != 0) decode_video(HERE, vendor_block, video, edid);
  return 1;
}

}  // namespace edid_composer
