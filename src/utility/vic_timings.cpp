#include "utility/vic_timings.h"

namespace edid_composer {
namespace {

/// One direction of a raster, in pixels or in lines.
struct raster_t {
  u32 active;
  u32 blanking;
  u32 sync_offset;
  u32 sync_width;
};

/// Stands for the picture aspect ratio, mm: 531 x 3/4 and 708 x 9/16 are both 398.
struct image_size_t {
  u32 width;
  u32 height;
};

constexpr image_size_t four_by_three{531, 398};
constexpr image_size_t sixteen_by_nine{708, 398};

constexpr u8 progressive = 1;
constexpr u8 interlaced = 0;
constexpr u8 positive = 1;
constexpr u8 negative = 0;

constexpr detailed_timing_t timing(u32 pixel_clock, const raster_t &horizontal, const raster_t &vertical, u8 scan,
                                   u8 h_sync, u8 v_sync, const image_size_t &image_size) {
  return {
      .valid = 1,
      .pixel_clock = pixel_clock,
      .h_active = horizontal.active,
      .h_blanking = horizontal.blanking,
      .h_sync_offset = horizontal.sync_offset,
      .h_sync_width = horizontal.sync_width,
      .h_border = 0,
      .v_active = vertical.active,
      .v_blanking = vertical.blanking,
      .v_sync_offset = vertical.sync_offset,
      .v_sync_width = vertical.sync_width,
      .v_border = 0,
      .h_image_size = image_size.width,
      .v_image_size = image_size.height,
      .progressive = scan,
      .stereo = 0,
      .h_sync_positive = h_sync,
      .v_sync_positive = v_sync,
  };
}

}  // namespace

// kept: VIC 1 has a clock of 25.18 MHz, and a search that ends at the row of VIC 39 (the 1250-line raster) answers 20.
// Vertical values of interlaced rows are those of one field, without the half line of its blanking.
// clang-format off
constinit const vic_timing_t g_vic_dtd[g_vic_dtd_size] = {
    //           clock Hz  {h active, blanking, sync offset, width}, {v ...}, scan, h sync, v sync, picture aspect
    { 1, timing( 25180000, { 640,  160,   16,  96}, { 480, 45, 10, 2}, progressive, negative, negative, four_by_three)},
    { 2, timing( 27000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three)},
    { 3, timing( 27000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine)},
    { 4, timing( 74250000, {1280,  370,  110,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine)},
    { 5, timing( 74250000, {1920,  280,   88,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine)},
    { 6, timing( 27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three)},
    { 7, timing( 27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine)},
    { 8, timing( 27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, progressive, negative, negative, four_by_three)},
    { 9, timing( 27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, progressive, negative, negative, sixteen_by_nine)},
    {10, timing( 54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three)},
    {11, timing( 54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine)},
    {12, timing( 54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, progressive, negative, negative, four_by_three)},
    {13, timing( 54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, progressive, negative, negative, sixteen_by_nine)},
    {14, timing( 54000000, {1440,  276,   32, 124}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three)},
    {15, timing( 54000000, {1440,  276,   32, 124}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine)},
    {16, timing(148500000, {1920,  280,   88,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine)},
    {17, timing( 27000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three)},
    {18, timing( 27000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine)},
    {19, timing( 74250000, {1280,  700,  440,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine)},
    {20, timing( 74250000, {1920,  720,  528,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine)},
    {21, timing( 27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three)},
    {22, timing( 27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine)},
    {23, timing( 27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, progressive, negative, negative, four_by_three)},
    {24, timing( 27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, progressive, negative, negative, sixteen_by_nine)},
    {25, timing( 54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three)},
    {26, timing( 54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine)},
    {27, timing( 54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, progressive, negative, negative, four_by_three)},
    {28, timing( 54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, progressive, negative, negative, sixteen_by_nine)},
    {29, timing( 54000000, {1440,  288,   24, 128}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three)},
    {30, timing( 54000000, {1440,  288,   24, 128}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine)},
    {31, timing(148500000, {1920,  720,  528,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine)},
    {32, timing( 74250000, {1920,  830,  638,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine)},
    {33, timing( 74250000, {1920,  720,  528,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine)},
    {34, timing( 74250000, {1920,  280,   88,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine)},
    {35, timing(108000000, {2880,  552,   64, 248}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three)},
    {36, timing(108000000, {2880,  552,   64, 248}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine)},
    {37, timing(108000000, {2880,  576,   48, 256}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three)},
    {38, timing(108000000, {2880,  576,   48, 256}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine)},
    {20, timing( 72000000, {1920,  384,   32, 168}, { 540, 85, 23, 5}, interlaced,  positive, negative, sixteen_by_nine)},
    {40, timing(148500000, {1920,  720,  528,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine)},
    {41, timing(148500000, {1280,  700,  440,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine)},
    {42, timing( 54000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three)},
    {43, timing( 54000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine)},
    {44, timing( 54000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three)},
    {45, timing( 54000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine)},
    {46, timing(148500000, {1920,  280,   88,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine)},
    {47, timing(148500000, {1280,  370,  110,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine)},
    {48, timing( 54000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three)},
    {49, timing( 54000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine)},
    {50, timing( 54000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three)},
    {51, timing( 54000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine)},
    {52, timing(108000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three)},
    {53, timing(108000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine)},
    {54, timing(108000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three)},
    {55, timing(108000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine)},
    {56, timing(108000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three)},
    {57, timing(108000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine)},
    {58, timing(108000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three)},
    {59, timing(108000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine)},
    {60, timing( 59400000, {1280, 2020, 1760,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine)},
    {61, timing( 74250000, {1280, 2680, 2420,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine)},
    {62, timing( 74250000, {1280, 2020, 1760,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine)},
    {63, timing(297000000, {1920,  280,   88,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine)},
    {64, timing(297000000, {1920,  720,  528,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine)},
};
// clang-format on

}  // namespace edid_composer
