// The bytes of the HDMI vendor-specific data block (HDMI 1.4a, section 8.3.2), counted from its header byte.
#pragma once

#include "edid_decode_encode/layout.h"

namespace edid_composer::hdmi_vendor_block {

inline constexpr u32 oui = 1;
inline constexpr u32 physical_address = 4;
inline constexpr u32 support = 6;
inline constexpr u32 max_tmds_clock = 7;
inline constexpr u32 video_flags = 8;
inline constexpr u32 latencies = 9;

inline constexpr u32 hdmi_oui = 0x000C03;
inline constexpr u8 oui_bytes[3] = {0x03, 0x0C, 0x00};

/// The IEEE identifier of a vendor-specific data block.
constexpr u32 oui_of(const byte_view_t &block) {
  return block.little_endian_16(oui) | u32{block[oui + 2]} << 16;
}

inline constexpr u32 max_tmds_clock_unit = 5;

/// The maximum TMDS clock as the block declares it, MHz.
constexpr u32 declared_tmds_clock(u32 mhz) {
  return mhz / max_tmds_clock_unit * max_tmds_clock_unit;
}

inline constexpr flag_t support_flags[] = {
    {&edid_t::supports_ai, 0x80}, {&edid_t::dc_48bit, 0x40}, {&edid_t::dc_36bit, 0x20},
    {&edid_t::dc_30bit, 0x10},    {&edid_t::dc_y444, 0x08},  {&edid_t::dvi_dual, 0x01},
};

inline constexpr u8 latency_present = 0x80;
inline constexpr u8 i_latency_present = 0x40;
inline constexpr u8 video_present = 0x20;

/// Which latency fields a block holds.
struct latency_fields_t {
  bool progressive;
  bool interlaced;
};

/// The fields that a flags byte announces.
constexpr latency_fields_t latency_fields(u32 flags) {
  const bool progressive = (flags & latency_present) != 0;
  return {progressive, progressive && (flags & i_latency_present) != 0};
}

/// The fields that a record needs.
constexpr latency_fields_t latency_fields(const edid_t &edid) {
  const bool interlaced = edid.i_video_latency != 0 || edid.i_audio_latency != 0;
  return {edid.video_latency != 0 || edid.audio_latency != 0 || interlaced, interlaced};
}

/// Where the HDMI video fields begin, after the latency fields.
constexpr u32 video_fields(latency_fields_t fields) {
  return latencies + (fields.progressive ? 2 : 0) + (fields.interlaced ? 2 : 0);
}

/// A latency byte in milliseconds.
constexpr u16 latency_ms(u8 code) {
  return static_cast<u16>(code == 0 ? 0 : (code - 1) * 2);
}

/// The byte that declares a latency.
constexpr u8 latency_code(u16 latency_ms) {
  constexpr u16 not_supported_ms = 65535;
  constexpr u8 not_supported = 255;
  constexpr u16 longest_ms = 500;
  constexpr u8 longest = 251;
  if (latency_ms == not_supported_ms) return not_supported;
  return latency_ms <= longest_ms ? low_byte(latency_ms / 2U + 1) : longest;
}
inline constexpr flag_t content_flags[] = {
    {&edid_t::hdmi_video_present, video_present},
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
  const char *name;
};
inline constexpr u32 side_by_side_half = 8;  ///< The one structure that a 3D_Detail byte follows.
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

}  // namespace edid_composer::hdmi_vendor_block
