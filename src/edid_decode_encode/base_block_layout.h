// The base block (EDID 1.3, section 3).
#pragma once

#include "edid_decode_encode/layout.h"

namespace edid_composer::base_block {

inline constexpr u8 header[8] = {0x00, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0x00};

inline constexpr u32 manufacturer = 8;
inline constexpr u32 product_code = 10;
inline constexpr u32 serial_number = 12;
inline constexpr u32 week = 16;
inline constexpr u32 year = 17;
inline constexpr u32 version = 18;
inline constexpr u32 revision = 19;
inline constexpr u32 video_input = 20;
inline constexpr u32 h_size_cm = 21;
inline constexpr u32 v_size_cm = 22;
inline constexpr u32 gamma = 23;
inline constexpr u32 features = 24;
inline constexpr u32 chromaticity = 25;
inline constexpr u32 est_timings_1 = 35;
inline constexpr u32 est_timings_2 = 36;
inline constexpr u32 man_timings = 37;
inline constexpr u32 standard_timings = 38;
inline constexpr u32 descriptors = 54;
inline constexpr u32 extension_count = 126;

inline constexpr u32 standard_timing_count = 8;
inline constexpr u32 descriptor_count = 4;

/// A letter of the manufacturer ID is its distance from this character, in 5 bits; the first stands highest.
inline constexpr u32 letter_base = 0x40;
inline constexpr u32 letter_mask = 0x1F;
inline constexpr u32 letter_shifts[3] = {10, 5, 0};

inline constexpr u8 supported_version = 1;
inline constexpr u8 least_revision = 3;

constexpr bool is_supported(u8 version_byte, u8 revision_byte) {
  return version_byte == supported_version && revision_byte >= least_revision;
}

inline constexpr u32 year_base = 1990;
inline constexpr u8 digital_input = 0x80;

inline constexpr u8 rgb_color_display = 0x08;
inline constexpr flag_t feature_flags[] = {
    {&edid_t::standby, 0x80},          {&edid_t::suspend, 0x40},
    {&edid_t::active_off, 0x20},       {&edid_t::standard_colorspace, 0x04},
    {&edid_t::preferred_timing, 0x02}, {&edid_t::gtf, 0x01},
};

/// Low 2 bits in bytes 25 and 26, high 8 bits in a byte of their own.
inline constexpr split_field_t<edid_t> chromaticity_fields[] = {
    {&edid_t::red_x, {25, 6, 2}, {27, 0, 8}},   {&edid_t::red_y, {25, 4, 2}, {28, 0, 8}},
    {&edid_t::green_x, {25, 2, 2}, {29, 0, 8}}, {&edid_t::green_y, {25, 0, 2}, {30, 0, 8}},
    {&edid_t::blue_x, {26, 6, 2}, {31, 0, 8}},  {&edid_t::blue_y, {26, 4, 2}, {32, 0, 8}},
    {&edid_t::white_x, {26, 2, 2}, {33, 0, 8}}, {&edid_t::white_y, {26, 0, 2}, {34, 0, 8}},
};

}  // namespace edid_composer::base_block
