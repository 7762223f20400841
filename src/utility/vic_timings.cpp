#include "utility/vic_timings.h"

#include "diagnostics.h"

namespace edid_composer {
namespace {

constexpr bool progressive = true;
constexpr bool interlaced = false;
constexpr bool positive = true;
constexpr bool negative = false;

/// Stands for the picture aspect ratio, mm: 531 x 3/4 and 708 x 9/16 are both 398.
constexpr image_size_t four_by_three{531, 398};
constexpr image_size_t sixteen_by_nine{708, 398};

}  // namespace

// kept: VIC 1 has a clock of 25.18 MHz, and a search that ends at the row of VIC 39 (the 1250-line raster) returns 20.
// Vertical values of interlaced rows are those of one field, without the half line of its blanking.
// clang-format off
constinit const vic_timing_t g_vic_dtd[g_vic_dtd_size] = {
    //       clock Hz  {h active, blanking, sync offset, width}, {v ...}, scan, h sync, v sync, picture aspect
    { 1,  25180000, { 640,  160,   16,  96}, { 480, 45, 10, 2}, progressive, negative, negative, four_by_three},
    { 2,  27000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three},
    { 3,  27000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine},
    { 4,  74250000, {1280,  370,  110,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine},
    { 5,  74250000, {1920,  280,   88,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine},
    { 6,  27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three},
    { 7,  27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine},
    { 8,  27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, progressive, negative, negative, four_by_three},
    { 9,  27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, progressive, negative, negative, sixteen_by_nine},
    {10,  54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three},
    {11,  54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine},
    {12,  54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, progressive, negative, negative, four_by_three},
    {13,  54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, progressive, negative, negative, sixteen_by_nine},
    {14,  54000000, {1440,  276,   32, 124}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three},
    {15,  54000000, {1440,  276,   32, 124}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine},
    {16, 148500000, {1920,  280,   88,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine},
    {17,  27000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three},
    {18,  27000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine},
    {19,  74250000, {1280,  700,  440,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine},
    {20,  74250000, {1920,  720,  528,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine},
    {21,  27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three},
    {22,  27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine},
    {23,  27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, progressive, negative, negative, four_by_three},
    {24,  27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, progressive, negative, negative, sixteen_by_nine},
    {25,  54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three},
    {26,  54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine},
    {27,  54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, progressive, negative, negative, four_by_three},
    {28,  54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, progressive, negative, negative, sixteen_by_nine},
    {29,  54000000, {1440,  288,   24, 128}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three},
    {30,  54000000, {1440,  288,   24, 128}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine},
    {31, 148500000, {1920,  720,  528,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine},
    {32,  74250000, {1920,  830,  638,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine},
    {33,  74250000, {1920,  720,  528,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine},
    {34,  74250000, {1920,  280,   88,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine},
    {35, 108000000, {2880,  552,   64, 248}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three},
    {36, 108000000, {2880,  552,   64, 248}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine},
    {37, 108000000, {2880,  576,   48, 256}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three},
    {38, 108000000, {2880,  576,   48, 256}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine},
    {20,  72000000, {1920,  384,   32, 168}, { 540, 85, 23, 5}, interlaced,  positive, negative, sixteen_by_nine},
    {40, 148500000, {1920,  720,  528,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine},
    {41, 148500000, {1280,  700,  440,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine},
    {42,  54000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three},
    {43,  54000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine},
    {44,  54000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three},
    {45,  54000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine},
    {46, 148500000, {1920,  280,   88,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine},
    {47, 148500000, {1280,  370,  110,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine},
    {48,  54000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three},
    {49,  54000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine},
    {50,  54000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three},
    {51,  54000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine},
    {52, 108000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three},
    {53, 108000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine},
    {54, 108000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three},
    {55, 108000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine},
    {56, 108000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three},
    {57, 108000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine},
    {58, 108000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three},
    {59, 108000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine},
    {60,  59400000, {1280, 2020, 1760,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine},
    {61,  74250000, {1280, 2680, 2420,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine},
    {62,  74250000, {1280, 2020, 1760,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine},
    {63, 297000000, {1920,  280,   88,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine},
    {64, 297000000, {1920,  720,  528,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine},
};
// clang-format on

detailed_timing_t timing_of(const vic_timing_t &row) {
  return {
      .valid = 1,
      .pixel_clock = row.pixel_clock,
      .h_active = row.horizontal.active,
      .h_blanking = row.horizontal.blanking,
      .h_sync_offset = row.horizontal.sync_offset,
      .h_sync_width = row.horizontal.sync_width,
      .h_border = 0,
      .v_active = row.vertical.active,
      .v_blanking = row.vertical.blanking,
      .v_sync_offset = row.vertical.sync_offset,
      .v_sync_width = row.vertical.sync_width,
      .v_border = 0,
      .h_image_size = row.image_size.width,
      .v_image_size = row.image_size.height,
      .progressive = row.progressive,
      .stereo = 0,
      .h_sync_positive = row.h_sync_positive,
      .v_sync_positive = row.v_sync_positive,
  };
}

}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

u8 convert_vic_to_dtd(u32 vic, detailed_timing_t *timing) {
  REPORTS_AS(convert_vic_to_dtd);
  if (timing == nullptr) {
    LOG_ERROR("\"timing\" parameter is NULL. timing:%s", address(timing).text);
    return 0;
  }
  if (vic < 1 || vic > g_vic_dtd_size) {
    // kept: the range begins at 0.
    LOG_WARNING("Invalid vic requested for conversion to a DTD. Requested VIC:%d Range:%d-%d", vic, 0, g_vic_dtd_size);
    return 0;
  }
  *timing = timing_of(g_vic_dtd[vic - 1]);
  return 1;
}
