// The 18 bytes of a detailed timing (EDID 1.3, section 3.10.2), field by field, for tests of both directions.
#pragma once

#include "edid_composer.h"

namespace codec_test {

/// A run of bits of one byte and what it stands for.
struct timing_bits_t {
  u32 byte;
  u32 lowest_bit;
  u32 bits;
  const char *field;
  u32 weight;  ///< Of the lowest bit.
};

inline constexpr timing_bits_t timing_layout[] = {
    {2, 0, 8, "h_active", 1},         {4, 4, 4, "h_active", 256},       {3, 0, 8, "h_blanking", 1},
    {4, 0, 4, "h_blanking", 256},     {5, 0, 8, "v_active", 1},         {7, 4, 4, "v_active", 256},
    {6, 0, 8, "v_blanking", 1},       {7, 0, 4, "v_blanking", 256},     {8, 0, 8, "h_sync_offset", 1},
    {11, 6, 2, "h_sync_offset", 256}, {9, 0, 8, "h_sync_width", 1},     {11, 4, 2, "h_sync_width", 256},
    {10, 4, 4, "v_sync_offset", 1},   {11, 2, 2, "v_sync_offset", 16},  {10, 0, 4, "v_sync_width", 1},
    {11, 0, 2, "v_sync_width", 16},   {12, 0, 8, "h_image_size", 1},    {14, 4, 4, "h_image_size", 256},
    {13, 0, 8, "v_image_size", 1},    {14, 0, 4, "v_image_size", 256},  {15, 0, 8, "h_border", 1},
    {16, 0, 8, "v_border", 1},        {17, 1, 1, "h_sync_positive", 1}, {17, 2, 1, "v_sync_positive", 1},
};

}  // namespace codec_test
