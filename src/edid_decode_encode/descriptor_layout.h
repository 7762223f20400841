// The bytes of the 18-byte descriptor (EDID 1.3, section 3.10).
#pragma once

#include "edid_decode_encode/layout.h"

namespace edid_composer {

inline constexpr u32 descriptor_size = 18;

/// A detailed timing (section 3.10.2).
namespace detailed_timing {

inline constexpr u32 pixel_clock = 0;  ///< In units of 10 kHz, little-endian.
inline constexpr u32 pixel_clock_unit = 10000;
inline constexpr u32 h_border = 15;
inline constexpr u32 v_border = 16;
inline constexpr u32 flags = 17;

inline constexpr u8 interlaced = 0x80;
inline constexpr u8 stereo = 0x60;
inline constexpr u8 sync_type = 0x18;
inline constexpr u32 sync_type_shift = 3;
inline constexpr u32 digital_separate_sync = 3;
inline constexpr u8 v_sync_positive = 0x04;
inline constexpr u8 h_sync_positive = 0x02;

inline constexpr split_field_t<detailed_timing_t> split_fields[] = {
    {&detailed_timing_t::h_active, {2, 0, 8}, {4, 4, 4}},
    {&detailed_timing_t::h_blanking, {3, 0, 8}, {4, 0, 4}},
    {&detailed_timing_t::v_active, {5, 0, 8}, {7, 4, 4}},
    {&detailed_timing_t::v_blanking, {6, 0, 8}, {7, 0, 4}},
    {&detailed_timing_t::h_sync_offset, {8, 0, 8}, {11, 6, 2}},
    {&detailed_timing_t::h_sync_width, {9, 0, 8}, {11, 4, 2}},
    {&detailed_timing_t::v_sync_offset, {10, 4, 4}, {11, 2, 2}},
    {&detailed_timing_t::v_sync_width, {10, 0, 4}, {11, 0, 2}},
    {&detailed_timing_t::h_image_size, {12, 0, 8}, {14, 4, 4}},
    {&detailed_timing_t::v_image_size, {13, 0, 8}, {14, 0, 4}},
};

}  // namespace detailed_timing

/// A display descriptor (section 3.10.3): its pixel clock is 0.
namespace display_descriptor {

inline constexpr u32 zero_1 = 2;
inline constexpr u32 tag = 3;
inline constexpr u32 zero_2 = 4;
inline constexpr u32 data = 5;
inline constexpr u32 text_length = 13;

inline constexpr u8 serial_text = 0xFF;
inline constexpr u8 data_text = 0xFE;
inline constexpr u8 range_limits = 0xFD;
inline constexpr u8 name_text = 0xFC;
inline constexpr u8 color_point = 0xFB;
inline constexpr u8 standard_timings = 0xFA;
inline constexpr u8 dummy = 0x10;
inline constexpr u8 manufacturer_0 = 0x00;

inline constexpr u8 line_feed = 0x0A;
inline constexpr u8 blank = 0x20;

/// Range limits.
inline constexpr u32 min_v_rate = 5;
inline constexpr u32 max_v_rate = 6;
inline constexpr u32 min_h_rate = 7;
inline constexpr u32 max_h_rate = 8;
inline constexpr u32 max_pixel_clock = 9;
inline constexpr u32 max_pixel_clock_unit = 10;

}  // namespace display_descriptor

}  // namespace edid_composer
