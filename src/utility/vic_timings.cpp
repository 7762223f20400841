#include "utility/vic_timings.h"

namespace edid_composer {
namespace {

/// Stands for the picture aspect ratio, mm: 531 x 3/4 and 708 x 9/16 are both 398.
struct image_size_t {
  u32 width;
  u32 height;
};

constexpr image_size_t four_by_three_size{531, 398};
constexpr image_size_t sixteen_by_nine_size{708, 398};

constexpr u8 progressive = 1;
constexpr u8 interlaced = 0;
constexpr u8 positive = 1;
constexpr u8 negative = 0;

constexpr bool four_by_three = false;
constexpr bool sixteen_by_nine = true;

constexpr vic_timing_t row(u8 vic, u32 pixel_clock, const raster_t &horizontal, const raster_t &vertical, u8 scan,
                           u8 h_sync, u8 v_sync, bool wide) {
  return {
      .vic = vic,
      .progressive = scan == progressive,
      .h_sync_positive = h_sync == positive,
      .v_sync_positive = v_sync == positive,
      .wide = wide,
      .pixel_clock_10khz = static_cast<u16>(pixel_clock / 10000),
      .horizontal = horizontal,
      .vertical = vertical,
  };
}

}  // namespace

// kept: VIC 1 has a clock of 25.18 MHz, and a search that ends at the row of VIC 39 (the 1250-line raster) answers 20.
// Vertical values of interlaced rows are those of one field, without the half line of its blanking.
// clang-format off
constinit const vic_timing_t g_vic_dtd[g_vic_dtd_size] = {
    //       clock Hz  {h active, blanking, sync offset, width}, {v ...}, scan, h sync, v sync, picture aspect
    row( 1,  25180000, { 640,  160,   16,  96}, { 480, 45, 10, 2}, progressive, negative, negative, four_by_three),
    row( 2,  27000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three),
    row( 3,  27000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine),
    row( 4,  74250000, {1280,  370,  110,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine),
    row( 5,  74250000, {1920,  280,   88,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine),
    row( 6,  27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three),
    row( 7,  27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine),
    row( 8,  27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, progressive, negative, negative, four_by_three),
    row( 9,  27000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, progressive, negative, negative, sixteen_by_nine),
    row(10,  54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three),
    row(11,  54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine),
    row(12,  54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, progressive, negative, negative, four_by_three),
    row(13,  54000000, {2880,  552,   76, 248}, { 240, 22,  4, 3}, progressive, negative, negative, sixteen_by_nine),
    row(14,  54000000, {1440,  276,   32, 124}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three),
    row(15,  54000000, {1440,  276,   32, 124}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine),
    row(16, 148500000, {1920,  280,   88,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine),
    row(17,  27000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three),
    row(18,  27000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine),
    row(19,  74250000, {1280,  700,  440,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine),
    row(20,  74250000, {1920,  720,  528,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine),
    row(21,  27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three),
    row(22,  27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine),
    row(23,  27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, progressive, negative, negative, four_by_three),
    row(24,  27000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, progressive, negative, negative, sixteen_by_nine),
    row(25,  54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three),
    row(26,  54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine),
    row(27,  54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, progressive, negative, negative, four_by_three),
    row(28,  54000000, {2880,  576,   48, 252}, { 288, 24,  2, 3}, progressive, negative, negative, sixteen_by_nine),
    row(29,  54000000, {1440,  288,   24, 128}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three),
    row(30,  54000000, {1440,  288,   24, 128}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine),
    row(31, 148500000, {1920,  720,  528,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine),
    row(32,  74250000, {1920,  830,  638,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine),
    row(33,  74250000, {1920,  720,  528,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine),
    row(34,  74250000, {1920,  280,   88,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine),
    row(35, 108000000, {2880,  552,   64, 248}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three),
    row(36, 108000000, {2880,  552,   64, 248}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine),
    row(37, 108000000, {2880,  576,   48, 256}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three),
    row(38, 108000000, {2880,  576,   48, 256}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine),
    row(20,  72000000, {1920,  384,   32, 168}, { 540, 85, 23, 5}, interlaced,  positive, negative, sixteen_by_nine),
    row(40, 148500000, {1920,  720,  528,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine),
    row(41, 148500000, {1280,  700,  440,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine),
    row(42,  54000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three),
    row(43,  54000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine),
    row(44,  54000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three),
    row(45,  54000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine),
    row(46, 148500000, {1920,  280,   88,  44}, { 540, 22,  2, 5}, interlaced,  positive, positive, sixteen_by_nine),
    row(47, 148500000, {1280,  370,  110,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine),
    row(48,  54000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three),
    row(49,  54000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine),
    row(50,  54000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three),
    row(51,  54000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine),
    row(52, 108000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, four_by_three),
    row(53, 108000000, { 720,  144,   12,  64}, { 576, 49,  5, 5}, progressive, negative, negative, sixteen_by_nine),
    row(54, 108000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, four_by_three),
    row(55, 108000000, {1440,  288,   24, 126}, { 288, 24,  2, 3}, interlaced,  negative, negative, sixteen_by_nine),
    row(56, 108000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, four_by_three),
    row(57, 108000000, { 720,  138,   16,  62}, { 480, 45,  9, 6}, progressive, negative, negative, sixteen_by_nine),
    row(58, 108000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, four_by_three),
    row(59, 108000000, {1440,  276,   38, 124}, { 240, 22,  4, 3}, interlaced,  negative, negative, sixteen_by_nine),
    row(60,  59400000, {1280, 2020, 1760,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine),
    row(61,  74250000, {1280, 2680, 2420,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine),
    row(62,  74250000, {1280, 2020, 1760,  40}, { 720, 30,  5, 5}, progressive, positive, positive, sixteen_by_nine),
    row(63, 297000000, {1920,  280,   88,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine),
    row(64, 297000000, {1920,  720,  528,  44}, {1080, 45,  4, 5}, progressive, positive, positive, sixteen_by_nine),
};
// clang-format on

detailed_timing_t timing_of(const vic_timing_t &row) {
  const image_size_t &image_size = row.wide != 0 ? sixteen_by_nine_size : four_by_three_size;
  return {
      .valid = 1,
      .pixel_clock = row.pixel_clock(),
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
      .h_image_size = image_size.width,
      .v_image_size = image_size.height,
      .progressive = row.progressive,
      .stereo = 0,
      .h_sync_positive = row.h_sync_positive,
      .v_sync_positive = row.v_sync_positive,
  };
}

}  // namespace edid_composer
