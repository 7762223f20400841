#include "edid_decode_encode/hdmi_vendor_block_decoder.h"

#include <algorithm>

#include "diagnostics.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/hdmi_vendor_block_layout.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

REPORTS_AS(_decode_edid_vendor_block);

namespace layout = hdmi_vendor_block;

void decode_physical_address(const byte_view_t &block, edid_t *edid) {
  u8 *const address = edid->physical_address;
  address[0] = block[layout::physical_address] >> 4;
  address[1] = block[layout::physical_address] & 0x0F;
  address[2] = block[layout::physical_address + 1] >> 4;
  address[3] = block[layout::physical_address + 1] & 0x0F;
}

/// Decodes the latency fields and returns the offset after them.
u32 decode_latencies(const byte_view_t &block, edid_t *edid) {
  const layout::latency_fields_t fields = layout::latency_fields(block[layout::video_flags]);
  constexpr u32 offset = layout::latencies;
  if (fields.progressive) {
    edid->video_latency = layout::latency_ms(block[offset]);
    edid->audio_latency = layout::latency_ms(block[offset + 1]);
  }
  if (fields.interlaced) {
    edid->i_video_latency = layout::latency_ms(block[offset + 2]);
    edid->i_audio_latency = layout::latency_ms(block[offset + 3]);
  } else {
    edid->i_video_latency = edid->video_latency;
    edid->i_audio_latency = edid->audio_latency;
  }
  return layout::video_fields(fields);
}

/// The structures that 3D_Structure_ALL names, as the record's mask.
u32 stereo_of_all(u32 structure_all) {
  u32 stereo = 0;
  for (u32 bit = 0; bit < 16; ++bit) {
    if ((structure_all >> bit & 1) != 0) stereo |= _3d_struct_all_array[bit];
  }
  return stereo;
}

/// The modes that a block can give 3D structures: the first 16, looked up once.
class first_modes_t {
 public:
  explicit first_modes_t(const appender_t<short_video_desc_t> &modes) : list_(modes.list()), size_(modes.size()) {
    u32 index = 0;
    for (auto &mode : elements<short_video_desc_t>(size_ > 0 ? list_.head : nullptr)) {
      if (index == layout::most_3d_modes) break;
      modes_[index++] = &mode;
    }
  }

  /// A list that can't be counted reports it each time.
  i32 size() const { return size_ > 0 ? size_ : ll_size(&list_); }
  /// The mode at @p index, 0 to 15; null, with the lines of ll_entry_at, when there is none.
  short_video_desc_t *at(i32 index) const {
    return index < size_ ? modes_[index] : entry_at<short_video_desc_t>(&list_, index);
  }
  /// Adds the structures of 3D_Structure_ALL to the modes of 3D_MASK.
  void mark(u32 stereo, u32 mask) const {
    for (i32 i = 0; i < std::min<i32>(size_, layout::most_3d_modes); ++i) {
      if ((mask >> i & 1) != 0) modes_[i]->stereo |= stereo;
    }
  }

 private:
  const ll_list_t &list_;
  i32 size_;
  short_video_desc_t *modes_[layout::most_3d_modes];
};

/// Adds the structure of one 2D_VIC_order entry to its mode and returns the number of bytes that the entry takes.
u32 mark_one(u8 byte, const first_modes_t &modes) {
  const auto index = static_cast<i32>(u32{byte} >> layout::index_shift);
  const u32 code = byte & layout::structure_mask;
  const u32 length = code == layout::side_by_side_half ? 2 : 1;
  const i32 size = modes.size();
  if (index > size) {
    LOG_WARNING("Index out of range. index:%d Len:%d", index, size);
    return length;
  }
  short_video_desc_t *const mode = modes.at(index);
  if (mode == nullptr) {
    LOG_ERROR(
        "The Vendor Specific Data Block (VSDB) 3D description references an index (%d) that doesn't exist. Continuing. "
        "List len:%d",
        index, size);
    // kept: the 3D_Detail byte of side-by-side (half) is then read as the next entry.
    return 1;
  }
  for (const auto &structure : layout::structures_3d) {
    if (structure.code == code) {
      mode->stereo |= structure.stereo;
      return length;
    }
  }
  LOG_ERROR("It should not arrive here.");
  return length;
}

/// Decodes the @p length bytes of 3D information from @p offset on.
void decode_3d(const byte_view_t &block, u32 offset, u32 length, u32 multi_present,
               const appender_t<short_video_desc_t> &appender) {
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
  const first_modes_t modes(appender);
  modes.mark(stereo_of_all(structure_all), mask);
  while (entries < offset + length)
    entries += mark_one(block[entries], modes);
}

/// Decodes the HDMI video fields, 4Kx2K and 3D, that begin at @p offset. The block's length doesn't bound them.
void decode_video(const byte_view_t &block, u32 offset, const appender_t<short_video_desc_t> &modes, edid_t *edid) {
  const u32 flags = block[offset];
  const u32 lengths = block[offset + 1];
  const u32 multi_present = flags >> layout::multi_present_shift & layout::multi_present_mask;
  const u32 length_3d = lengths & layout::length_3d_mask;
  edid->hdmi_3d_present = (flags & layout::present_3d) != 0 ? 1 : 0;
  edid->image_size = low_byte(flags >> layout::image_size_shift & layout::image_size_mask);
  edid->hdmi_vic_len = low_byte(lengths >> layout::vic_length_shift & layout::vic_length_mask);
  LOG_TRACE(" start parsing 3D and 4Kx2K stuff %s", true_or_false(edid->hdmi_video_present != 0));
  LOG_TRACE(" 3D_present %d", edid->hdmi_3d_present);
  LOG_TRACE(" 3D_multi_present %d", multi_present);
  LOG_TRACE(" image_size %d", edid->image_size);
  LOG_TRACE(" 3D_len %d", length_3d);
  LOG_TRACE(" 4k_2k_vic_len %d", edid->hdmi_vic_len);

  offset += 2;
  for (u32 i = 0; i < edid->hdmi_vic_len; ++i)
    edid->hdmi_vic[i] = block[offset++] & layout::vic_mask;
  if (length_3d != 0 && edid->hdmi_3d_present != 0) decode_3d(block, offset, length_3d, multi_present, modes);
}

}  // namespace

bool _decode_edid_vendor_block(const byte_view_t &vendor_block, const appender_t<short_video_desc_t> &modes,
                               edid_t *edid) {
  const u32 tag = u32{vendor_block[0]} >> data_block::tag_shift;
  const u32 length = vendor_block[0] & data_block::length_mask;
  if (tag != data_block::vendor_specific) {
    LOG_ERROR("Failed decoding the vendor block. Tag is not correct. Expected=0x3 Received=0x%X", tag);
    return false;
  }
  if (length <= 2) {
    LOG_ERROR("Failed decoding the vendor block. Length not long enough to contain the vendor's id. Length=%d", length);
    return false;
  }
  const u32 oui = layout::oui_of(vendor_block);
  if (oui != layout::hdmi_oui) {
    LOG_TRACE("Unrecognized vendor block. Ignoring. Vendor=0x%X", oui);
    return true;
  }
  if (length <= 4) {
    LOG_ERROR("Failed decoding the hdmi block. The length is required to be at least 5 bytes long. Length=%d", length);
    return false;
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
  if (length >= video && edid->hdmi_video_present != 0) decode_video(vendor_block, video, modes, edid);
  return true;
}

}  // namespace edid_composer
