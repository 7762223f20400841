// The CEA-861 extension (CEA-861, section 7.5) and its HDMI vendor-specific data block (HDMI 1.4a, section 8.3.2).
#pragma once

#include "edid_decode_encode/layout.h"

namespace edid_composer {
namespace cea_extension {

inline constexpr u32 tag = 0;
inline constexpr u32 revision = 1;
inline constexpr u32 timings_offset = 2;
inline constexpr u32 flags = 3;
inline constexpr u32 data_blocks = 4;

inline constexpr u8 cea_tag = 0x02;
inline constexpr u8 supported_revision = 3;
inline constexpr u32 largest_timings_offset = 110;

inline constexpr u8 underscan = 0x80;
inline constexpr u8 basic_audio = 0x40;
inline constexpr u8 ycbcr_444 = 0x20;
inline constexpr u8 ycbcr_422 = 0x10;
inline constexpr u8 native_timings_mask = 0x0F;
inline constexpr flag_t support_flags[] = {
    {&edid_t::underscan, underscan},
    {&edid_t::basic_audio, basic_audio},
    {&edid_t::ycbcr_444, ycbcr_444},
    {&edid_t::ycbcr_422, ycbcr_422},
};

}  // namespace cea_extension

/// The header byte of a data block and what stands behind it (CEA-861, section 7.5).
namespace data_block {

inline constexpr u32 tag_shift = 5;
inline constexpr u8 length_mask = 0x1F;

inline constexpr u32 reserved_0 = 0;
inline constexpr u32 audio = 1;
inline constexpr u32 video = 2;
inline constexpr u32 vendor_specific = 3;
inline constexpr u32 speaker_allocation = 4;
inline constexpr u32 vesa_dtc = 5;
inline constexpr u32 reserved_6 = 6;
inline constexpr u32 extended = 7;

inline constexpr u32 speaker_length = 3;
inline constexpr u8 extended_colorimetry = 5;
inline constexpr flag_t colorimetry_flags[] = {{&edid_t::xvycc601, 0x01}, {&edid_t::xvycc709, 0x02}};

constexpr u8 header(u32 tag, u32 length) {
  return low_byte(tag << tag_shift | (length & length_mask));
}

}  // namespace data_block

namespace short_video {

inline constexpr u8 native = 0x80;
inline constexpr u8 vic_mask = 0x7F;

}  // namespace short_video

namespace short_audio {

inline constexpr u32 size = 3;
inline constexpr u32 format_shift = 3;
inline constexpr u32 format_mask = 0x0F;
inline constexpr u32 channels_mask = 0x07;
inline constexpr u32 frequencies_mask = 0x7F;
inline constexpr u32 pcm_bits_mask = 0x07;
inline constexpr u32 wma_profile_mask = 0x07;
inline constexpr u32 bitrate_unit = 8;
inline constexpr u32 extension_shift = 3;

inline constexpr u32 pcm = 1;
inline constexpr u32 first_with_bitrate = 2;
inline constexpr u32 last_with_bitrate = 8;
inline constexpr u32 first_with_value = 9;
inline constexpr u32 last_with_value = 13;
inline constexpr u32 wma_pro = 14;
inline constexpr u32 extension_escape = 15;
/// Extension code 1 is type 16, and so on up to extension code 3.
inline constexpr u32 extended_type_base = 15;
inline constexpr u32 last_extension = 3;

}  // namespace short_audio

/// Offsets are counted from the block's header byte.
namespace hdmi_vendor_block {

inline constexpr u32 oui = 1;
inline constexpr u32 physical_address = 4;
inline constexpr u32 support = 6;
inline constexpr u32 max_tmds_clock = 7;
inline constexpr u32 video_flags = 8;
inline constexpr u32 latencies = 9;

inline constexpr u32 hdmi_oui = 0x000C03;
inline constexpr u8 oui_bytes[3] = {0x03, 0x0C, 0x00};
inline constexpr u32 max_tmds_clock_unit = 5;

inline constexpr flag_t support_flags[] = {
    {&edid_t::supports_ai, 0x80}, {&edid_t::dc_48bit, 0x40}, {&edid_t::dc_36bit, 0x20},
    {&edid_t::dc_30bit, 0x10},    {&edid_t::dc_y444, 0x08},  {&edid_t::dvi_dual, 0x01},
};

inline constexpr u8 latency_present = 0x80;
inline constexpr u8 i_latency_present = 0x40;
inline constexpr flag_t content_flags[] = {
    {&edid_t::hdmi_video_present, 0x20},
    {&edid_t::cnc3, 0x08},
    {&edid_t::cnc2, 0x04},
    {&edid_t::cnc1, 0x02},
    {&edid_t::cnc0, 0x01},
};

inline constexpr u8 present_3d = 0x80;
inline constexpr u32 multi_present_shift = 5;
inline constexpr u32 multi_present_mask = 0x03;
inline constexpr u32 image_size_shift = 3;
inline constexpr u32 image_size_mask = 0x03;
inline constexpr u32 vic_length_shift = 5;
inline constexpr u32 vic_length_mask = 0x07;
inline constexpr u32 length_3d_mask = 0x1F;
inline constexpr u8 vic_mask = 0x7F;
inline constexpr u32 most_vics = 7;

/// Only the first 16 short video descriptors can be given 3D structures.
inline constexpr i32 most_3d_modes = 16;

/// 3D_Structure (appendix H): its code in a 2D_VIC_order entry, its bit in the record's mask, its name in traces. In
/// the order in which a mode's structures are written.
struct structure_3d_t {
  u32 code;
  u32 stereo;
  char name[8];
};
inline constexpr u32 side_by_side_half = 8;  ///< The one structure that has a 3D_Detail byte behind it.
inline constexpr structure_3d_t structures_3d[] = {
    {0, STEREO_FRAME_PACKING, "FP"},
    {1, STEREO_FIELD_ALTERNATIVE, "FA"},
    {2, STEREO_LINE_ALTERNATIVE, "LA"},
    {3, STEREO_SIDE_BY_SIDE_FULL, "SBSF"},
    {4, STEREO_L_DEPTH, "LD"},
    {5, STEREO_L_DEPTH_GRAPHICS, "LDGD"},
    {side_by_side_half, STEREO_SIDE_BY_SIDE_HALF, "SBSH"},
    {6, STEREO_TOP_AND_BOTTOM, "TBH"},
};

inline constexpr u32 index_shift = 4;
inline constexpr u32 structure_mask = 0x0F;

}  // namespace hdmi_vendor_block
}  // namespace edid_composer
