// The bytes of the CEA-861 extension (CEA-861, section 7.5) and of its data blocks.
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
// kept: CEA-861 allows up to 127, where no detailed timing follows.
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

/// The header byte of a data block and what follows it (CEA-861, section 7.5).
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
inline constexpr u8 extended_420_video = 0x0E;
inline constexpr flag_t colorimetry_flags[] = {{&edid_t::xvycc601, 0x01}, {&edid_t::xvycc709, 0x02}};

constexpr u8 header(u32 tag, u32 length) {
  return low_byte(tag << tag_shift | (length & length_mask));
}

}  // namespace data_block

namespace short_video {

inline constexpr u8 native = 0x80;
inline constexpr u8 vic_mask = 0x7F;

}  // namespace short_video

}  // namespace edid_composer
