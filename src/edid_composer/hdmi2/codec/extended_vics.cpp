#include "edid_composer/hdmi2/codec/extended_vics.h"

namespace edid_composer {
namespace {

constexpr u32 first_low = 65;
constexpr u32 last_low = 127;
constexpr u32 first_high = 193;
constexpr u32 last_high = 219;
constexpr u32 vic_count = last_low - first_low + 1 + last_high - first_high + 1;

constexpr picture_aspect_t a16x9{16, 9};
constexpr picture_aspect_t a64x27{64, 27};
constexpr picture_aspect_t a256x135{256, 135};

// clang-format off
constexpr extended_timing_t timings[vic_count] = {
    //  clock kHz  {h active, blanking, sync offset, width}, {v ...}, picture aspect
    { 65,   59400, { 1280, 2020, 1760,  40}, { 720,  30,  5,  5}, a64x27},
    { 66,   74250, { 1280, 2680, 2420,  40}, { 720,  30,  5,  5}, a64x27},
    { 67,   74250, { 1280, 2020, 1760,  40}, { 720,  30,  5,  5}, a64x27},
    { 68,   74250, { 1280,  700,  440,  40}, { 720,  30,  5,  5}, a64x27},
    { 69,   74250, { 1280,  370,  110,  40}, { 720,  30,  5,  5}, a64x27},
    { 70,  148500, { 1280,  700,  440,  40}, { 720,  30,  5,  5}, a64x27},
    { 71,  148500, { 1280,  370,  110,  40}, { 720,  30,  5,  5}, a64x27},
    { 72,   74250, { 1920,  830,  638,  44}, {1080,  45,  4,  5}, a64x27},
    { 73,   74250, { 1920,  720,  528,  44}, {1080,  45,  4,  5}, a64x27},
    { 74,   74250, { 1920,  280,   88,  44}, {1080,  45,  4,  5}, a64x27},
    { 75,  148500, { 1920,  720,  528,  44}, {1080,  45,  4,  5}, a64x27},
    { 76,  148500, { 1920,  280,   88,  44}, {1080,  45,  4,  5}, a64x27},
    { 77,  297000, { 1920,  720,  528,  44}, {1080,  45,  4,  5}, a64x27},
    { 78,  297000, { 1920,  280,   88,  44}, {1080,  45,  4,  5}, a64x27},
    { 79,   59400, { 1680, 1620, 1360,  40}, { 720,  30,  5,  5}, a64x27},
    { 80,   59400, { 1680, 1488, 1228,  40}, { 720,  30,  5,  5}, a64x27},
    { 81,   59400, { 1680,  960,  700,  40}, { 720,  30,  5,  5}, a64x27},
    { 82,   82500, { 1680,  520,  260,  40}, { 720,  30,  5,  5}, a64x27},
    { 83,   99000, { 1680,  520,  260,  40}, { 720,  30,  5,  5}, a64x27},
    { 84,  165000, { 1680,  320,   60,  40}, { 720, 105,  5,  5}, a64x27},
    { 85,  198000, { 1680,  320,   60,  40}, { 720, 105,  5,  5}, a64x27},
    { 86,   99000, { 2560, 1190,  998,  44}, {1080,  20,  4,  5}, a64x27},
    { 87,   90000, { 2560,  640,  448,  44}, {1080,  45,  4,  5}, a64x27},
    { 88,  118800, { 2560,  960,  768,  44}, {1080,  45,  4,  5}, a64x27},
    { 89,  185625, { 2560,  740,  548,  44}, {1080,  45,  4,  5}, a64x27},
    { 90,  198000, { 2560,  440,  248,  44}, {1080,  20,  4,  5}, a64x27},
    { 91,  371250, { 2560,  410,  218,  44}, {1080, 170,  4,  5}, a64x27},
    { 92,  495000, { 2560,  740,  548,  44}, {1080, 170,  4,  5}, a64x27},
    { 93,  297000, { 3840, 1660, 1276,  88}, {2160,  90,  8, 10}, a16x9},
    { 94,  297000, { 3840, 1440, 1056,  88}, {2160,  90,  8, 10}, a16x9},
    { 95,  297000, { 3840,  560,  176,  88}, {2160,  90,  8, 10}, a16x9},
    { 96,  594000, { 3840, 1440, 1056,  88}, {2160,  90,  8, 10}, a16x9},
    { 97,  594000, { 3840,  560,  176,  88}, {2160,  90,  8, 10}, a16x9},
    { 98,  297000, { 4096, 1404, 1020,  88}, {2160,  90,  8, 10}, a256x135},
    { 99,  297000, { 4096, 1184,  968,  88}, {2160,  90,  8, 10}, a256x135},
    {100,  297000, { 4096,  304,   88,  88}, {2160,  90,  8, 10}, a256x135},
    {101,  594000, { 4096, 1184,  968,  88}, {2160,  90,  8, 10}, a256x135},
    {102,  594000, { 4096,  304,   88,  88}, {2160,  90,  8, 10}, a256x135},
    {103,  297000, { 3840, 1660, 1276,  88}, {2160,  90,  8, 10}, a64x27},
    {104,  297000, { 3840, 1440, 1056,  88}, {2160,  90,  8, 10}, a64x27},
    {105,  297000, { 3840,  560,  176,  88}, {2160,  90,  8, 10}, a64x27},
    {106,  594000, { 3840, 1440, 1056,  88}, {2160,  90,  8, 10}, a64x27},
    {107,  594000, { 3840,  560,  176,  88}, {2160,  90,  8, 10}, a64x27},
    {108,   90000, { 1280, 1220,  960,  40}, { 720,  30,  5,  5}, a16x9},
    {109,   90000, { 1280, 1220,  960,  40}, { 720,  30,  5,  5}, a64x27},
    {110,   99000, { 1680, 1070,  810,  40}, { 720,  30,  5,  5}, a64x27},
    {111,  148500, { 1920,  830,  638,  44}, {1080,  45,  4,  5}, a16x9},
    {112,  148500, { 1920,  830,  638,  44}, {1080,  45,  4,  5}, a64x27},
    {113,  198000, { 2560, 1190,  998,  44}, {1080,  20,  4,  5}, a64x27},
    {114,  594000, { 3840, 1660, 1276,  88}, {2160,  90,  8, 10}, a16x9},
    {115,  594000, { 4096, 1404, 1020,  88}, {2160,  90,  8, 10}, a256x135},
    {116,  594000, { 3840, 1660, 1276,  88}, {2160,  90,  8, 10}, a64x27},
    {117, 1188000, { 3840, 1440, 1056,  88}, {2160,  90,  8, 10}, a16x9},
    {118, 1188000, { 3840,  560,  176,  88}, {2160,  90,  8, 10}, a16x9},
    {119, 1188000, { 3840, 1440, 1056,  88}, {2160,  90,  8, 10}, a64x27},
    {120, 1188000, { 3840,  560,  176,  88}, {2160,  90,  8, 10}, a64x27},
    {121,  396000, { 5120, 2380, 1996,  88}, {2160,  40,  8, 10}, a64x27},
    {122,  396000, { 5120, 2080, 1696,  88}, {2160,  40,  8, 10}, a64x27},
    {123,  396000, { 5120,  880,  664,  88}, {2160,  40,  8, 10}, a64x27},
    {124,  742500, { 5120, 1130,  746,  88}, {2160, 315,  8, 10}, a64x27},
    {125,  742500, { 5120, 1480, 1096,  88}, {2160,  90,  8, 10}, a64x27},
    {126,  742500, { 5120,  380,  164,  88}, {2160,  90,  8, 10}, a64x27},
    {127, 1485000, { 5120, 1480, 1096,  88}, {2160,  90,  8, 10}, a64x27},
    {193, 1485000, { 5120,  380,  164,  88}, {2160,  90,  8, 10}, a64x27},
    {194, 1188000, { 7680, 3320, 2552, 176}, {4320, 180, 16, 20}, a16x9},
    {195, 1188000, { 7680, 3120, 2352, 176}, {4320,  80, 16, 20}, a16x9},
    {196, 1188000, { 7680, 1320,  552, 176}, {4320,  80, 16, 20}, a16x9},
    {197, 2376000, { 7680, 3320, 2552, 176}, {4320, 180, 16, 20}, a16x9},
    {198, 2376000, { 7680, 3120, 2352, 176}, {4320,  80, 16, 20}, a16x9},
    {199, 2376000, { 7680, 1320,  552, 176}, {4320,  80, 16, 20}, a16x9},
    {200, 4752000, { 7680, 2880, 2112, 176}, {4320, 180, 16, 20}, a16x9},
    {201, 4752000, { 7680, 1120,  352, 176}, {4320, 180, 16, 20}, a16x9},
    {202, 1188000, { 7680, 3320, 2552, 176}, {4320, 180, 16, 20}, a64x27},
    {203, 1188000, { 7680, 3120, 2352, 176}, {4320,  80, 16, 20}, a64x27},
    {204, 1188000, { 7680, 1320,  552, 176}, {4320,  80, 16, 20}, a64x27},
    {205, 2376000, { 7680, 3320, 2552, 176}, {4320, 180, 16, 20}, a64x27},
    {206, 2376000, { 7680, 3120, 2352, 176}, {4320,  80, 16, 20}, a64x27},
    {207, 2376000, { 7680, 1320,  552, 176}, {4320,  80, 16, 20}, a64x27},
    {208, 4752000, { 7680, 2880, 2112, 176}, {4320, 180, 16, 20}, a64x27},
    {209, 4752000, { 7680, 1120,  352, 176}, {4320, 180, 16, 20}, a64x27},
    {210, 1485000, {10240, 2260, 1492, 176}, {4320, 630, 16, 20}, a64x27},
    {211, 1485000, {10240, 3260, 2492, 176}, {4320,  80, 16, 20}, a64x27},
    {212, 1485000, {10240,  760,  288, 176}, {4320, 180, 16, 20}, a64x27},
    {213, 2970000, {10240, 2260, 1492, 176}, {4320, 630, 16, 20}, a64x27},
    {214, 2970000, {10240, 3260, 2492, 176}, {4320,  80, 16, 20}, a64x27},
    {215, 2970000, {10240,  760,  288, 176}, {4320, 180, 16, 20}, a64x27},
    {216, 5940000, {10240, 2960, 2192, 176}, {4320, 180, 16, 20}, a64x27},
    {217, 5940000, {10240,  760,  288, 176}, {4320, 180, 16, 20}, a64x27},
    {218, 1188000, { 4096, 1184,  800,  88}, {2160,  90,  8, 10}, a256x135},
    {219, 1188000, { 4096,  304,   88,  88}, {2160,  90,  8, 10}, a256x135},
};
// clang-format on

/// Row of a VIC; vic_count for one that the table does not have.
constexpr u32 row_of(u32 vic) {
  if (vic >= first_low && vic <= last_low) return vic - first_low;
  if (vic >= first_high && vic <= last_high) return vic - first_high + last_low - first_low + 1;
  return vic_count;
}

static_assert([] {
  for (u32 row = 0; row < vic_count; ++row) {
    if (row_of(timings[row].vic) != row) return false;
  }
  return true;
}());

constexpr u32 longest_name = sizeof "4096x2160p120Hz256x135";

struct name_t {
  char text[longest_name];
};

/// Writes a name from left to right. One that is too long for it does not compile.
struct name_writer_t {
  name_t name{};
  u32 length = 0;

  constexpr void put(char character) { name.text[length++] = character; }
  constexpr void put(const char *text) {
    while (*text != '\0')
      put(*text++);
  }
  constexpr void put(u32 number) {
    if (number >= 10) put(number / 10);
    put(static_cast<char>('0' + number % 10));
  }
};

constexpr name_t name_of(const extended_timing_t &timing) {
  name_writer_t writer;
  writer.put(u32{timing.horizontal.active});
  writer.put('x');
  writer.put(u32{timing.vertical.active});
  writer.put('p');
  writer.put(frame_rate(timing));
  writer.put("Hz");
  writer.put(u32{timing.aspect.width});
  writer.put('x');
  writer.put(u32{timing.aspect.height});
  writer.put('\0');
  return writer.name;
}

struct names_t {
  name_t rows[vic_count];
};

/// The names of the table's rows, which follow from their timings.
constexpr names_t names = [] {
  names_t result{};
  for (u32 row = 0; row < vic_count; ++row)
    result.rows[row] = name_of(timings[row]);
  return result;
}();

}  // namespace

const extended_timing_t *timing_of_extended_vic(u32 vic) {
  const u32 row = row_of(vic);
  return row < vic_count ? &timings[row] : nullptr;
}

bool fits_detailed_timing(const extended_timing_t &timing) {
  constexpr u32 most_clock_khz = 655350;
  constexpr u32 most_size = 4095;
  constexpr u32 most_h_sync = 1023;
  constexpr u32 most_v_sync = 63;
  const raster_t &horizontal = timing.horizontal;
  const raster_t &vertical = timing.vertical;
  return timing.pixel_clock_khz <= most_clock_khz && horizontal.active <= most_size &&
         horizontal.blanking <= most_size && horizontal.sync_offset <= most_h_sync &&
         horizontal.sync_width <= most_h_sync && vertical.active <= most_size && vertical.blanking <= most_size &&
         vertical.sync_offset <= most_v_sync && vertical.sync_width <= most_v_sync;
}

detailed_timing_t detailed_timing_of(const extended_timing_t &timing) {
  // Stands for the picture aspect ratio of most televisions, as that of the other detailed timings.
  constexpr image_size_t image_size{708, 398};
  return {.valid = 1,
          .pixel_clock = timing.pixel_clock_khz * 1000,
          .h_active = timing.horizontal.active,
          .h_blanking = timing.horizontal.blanking,
          .h_sync_offset = timing.horizontal.sync_offset,
          .h_sync_width = timing.horizontal.sync_width,
          .h_border = 0,
          .v_active = timing.vertical.active,
          .v_blanking = timing.vertical.blanking,
          .v_sync_offset = timing.vertical.sync_offset,
          .v_sync_width = timing.vertical.sync_width,
          .v_border = 0,
          .h_image_size = image_size.width,
          .v_image_size = image_size.height,
          .progressive = 1,
          .stereo = 0,
          .h_sync_positive = 1,
          .v_sync_positive = 1};
}

}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

const char *extended_vic_string(u32 vic) {
  const u32 row = row_of(vic);
  return row < vic_count ? names.rows[row].text : "Unknown Value";
}
