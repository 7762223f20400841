#include "edid_decode_encode/base_block_encoder.h"

#include "edid_decode_encode/base_block_layout.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/descriptor.h"
#include "edid_decode_encode/descriptor_layout.h"
#include "edid_decode_encode/standard_timing.h"

namespace edid_composer {
namespace {

REPORTS_AS(encode_edid);

constexpr u32 manufacturer_word(const char *letters) {
  u32 word = 0;
  for (u32 i = 0; i < 3; ++i) {
    const char letter = letters[i] >= 'a' && letters[i] <= 'z' ? static_cast<char>(letters[i] - 'a' + 'A') : letters[i];
    const u32 code = static_cast<u32>(letter) - base_block::letter_base;
    word |= (code & base_block::letter_mask) << base_block::letter_shifts[i];
  }
  return word;
}

void encode_identity(const edid_t &edid, byte_writer_t *block) {
  const u32 manufacturer = manufacturer_word(edid.manufacturer);
  block->put(base_block::header, sizeof base_block::header);
  block->put(low_byte(manufacturer >> 8));
  block->put(low_byte(manufacturer));
  block->put_little_endian_16(edid.product_code);
  block->put_little_endian_32(edid.serial_number);
  block->put(edid.week);
  block->put(low_byte(edid.year - base_block::year_base));
  block->put(edid.version);
  block->put(edid.revision);
}

void encode_features(const edid_t &edid, u8 *block) {
  // A size that isn't known is given as one of 16:9.
  const bool size_known = edid.h_size_cm != 0 && edid.v_size_cm != 0;
  block[base_block::video_input] = base_block::digital_input;
  block[base_block::h_size_cm] = size_known ? edid.h_size_cm : u8{160};
  block[base_block::v_size_cm] = size_known ? edid.v_size_cm : u8{90};
  block[base_block::gamma] = low_byte(edid.gamma);
  block[base_block::features] =
      low_byte(u32{base_block::rgb_color_display} | encode_flags(base_block::feature_flags, edid));
  encode_split_fields(base_block::chromaticity_fields, edid, block);
  block[base_block::est_timings_1] = low_byte(edid.est_timings_1);
  block[base_block::est_timings_2] = low_byte(edid.est_timings_2);
  block[base_block::man_timings] = low_byte(edid.man_timings);
}

void encode_standard_timings(const edid_t &edid, byte_writer_t *block) {
  block->seek(base_block::standard_timings);
  u32 free = base_block::standard_timing_count;
  for (const auto &timing : counted_elements<const std_timing_t>(edid.std_timings)) {
    if (free == 0) break;
    put_standard_timing(block, timing);
    --free;
  }
  for (; free > 0; --free)
    put_unused_standard_timing(block);
}

/// The first two detailed timings.
bool encode_timings(const edid_t &edid, byte_writer_t *block) {
  const i32 size = ll_size(&edid.dtd_list);
  if (size < base_block_timings) {
    LOG_ERROR("The function expects there to be at least 2 DTDs. Total DTDs:%d", size);
    return false;
  }
  i32 index = 0;
  for (const auto &timing : elements<const detailed_timing_t>(edid.dtd_list.head)) {
    if (index == base_block_timings) break;
    u8 descriptor[descriptor_size];
    if (!_encode_edid_dtd(descriptor, &timing)) {
      LOG_ERROR("Failed encoding DTD. index:%d Len:%d", index, size);
      return false;
    }
    block->put(descriptor, descriptor_size);
    ++index;
  }
  return true;
}

}  // namespace

bool encode_up_to_timings(const edid_t &edid, u8 *block, byte_writer_t *writer) {
  encode_identity(edid, writer);
  encode_features(edid, block);
  encode_standard_timings(edid, writer);
  return encode_timings(edid, writer);
}

void encode_range_limits(const edid_t &edid, byte_writer_t *block) {
  namespace layout = display_descriptor;
  if (edid.min_v_rate == 0 || edid.max_v_rate == 0 || edid.min_h_rate == 0 || edid.max_h_rate == 0 ||
      edid.max_pixel_clock == 0) {
    return;
  }
  const u8 descriptor[descriptor_size] = {
      0,
      0,
      0,
      layout::range_limits,
      0,
      edid.min_v_rate,
      edid.max_v_rate,
      edid.min_h_rate,
      edid.max_h_rate,
      low_byte(edid.max_pixel_clock / layout::max_pixel_clock_unit),
      0,  // no secondary timing formula
      layout::line_feed,
      layout::blank,
      layout::blank,
      layout::blank,
      layout::blank,
      layout::blank,
      layout::blank,
  };
  block->put(descriptor, descriptor_size);
}

bool encode_base_block(const edid_t &edid, u8 *block) {
  byte_writer_t writer(block, block_size);
  if (!encode_up_to_timings(edid, block, &writer)) return false;
  put_text_descriptor(&writer, display_descriptor::name_text, edid.monitor_name);
  encode_range_limits(edid, &writer);
  // kept: both bytes follow the last descriptor, so that they are bytes 126 and 127 only after all four.
  writer.put(1);
  writer.put(_calculate_checksum({block, block_size}));
  return true;
}

}  // namespace edid_composer
