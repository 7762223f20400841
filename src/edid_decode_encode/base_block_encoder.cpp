#include "edid_decode_encode/base_block_encoder.h"

#include "edid_decode_encode/base_block_layout.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/descriptor_encoder.h"
#include "edid_decode_encode/descriptor_layout.h"

namespace edid_composer {
namespace {

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

/// False when an entry of the list could not be had; its slot stays 0.
bool encode_standard_timings(const site_t &site, const edid_t &edid, byte_writer_t *block) {
  namespace layout = standard_timing;
  bool all_found = true;
  const i32 size = ll_size(&edid.std_timings);
  block->seek(base_block::standard_timings);
  for (i32 i = 0; i < static_cast<i32>(base_block::standard_timing_count); ++i) {
    void *payload = nullptr;
    if (i >= size) {
      block->put(layout::unused);
      block->put(layout::unused);
    } else if (ll_entry_at(&edid.std_timings, i, &payload)) {
      const auto &timing = *static_cast<const std_timing_t *>(payload);
      block->put(low_byte(timing.h_active / layout::h_active_unit - layout::h_active_base));
      block->put(low_byte((timing.refresh_rate - layout::refresh_base) | timing.aspect_ratio << layout::aspect_shift));
    } else {
      LOG_ERROR_AS(site, "Failed to locate index #%d in the list.", i);
      block->seek(block->position() + 2);
      all_found = false;
    }
  }
  return all_found;
}

/// The first two detailed timings.
bool encode_timings(const site_t &site, const edid_t &edid, byte_writer_t *block, u32 *written) {
  constexpr i32 expected = 2;
  const i32 size = ll_size(&edid.dtd_list);
  if (size < expected) {
    LOG_ERROR_AS(site, "The function expects there to be at least 2 DTDs. Total DTDs:%d", size);
    return false;
  }
  for (i32 i = 0; i < expected; ++i) {
    void *payload = nullptr;
    if (!ll_entry_at(&edid.dtd_list, i, &payload)) {
      LOG_ERROR_AS(site, "Failed to locate index #%d in the list.", i);
      return false;
    }
    u8 descriptor[descriptor_size];
    if (_encode_edid_dtd(descriptor, static_cast<const detailed_timing_t *>(payload)) != 1) {
      LOG_ERROR_AS(site, "Failed encoding DTD. index:%d Len:%d", i, size);
      return false;
    }
    block->put(descriptor, descriptor_size);
    ++*written;
  }
  return true;
}

/// Range limits (EDID 1.3, section 3.10.3), when all five are known.
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

}  // namespace

base_block_result_t encode_base_block(const site_t &site, const edid_t &edid, u8 *block) {
  base_block_result_t result{.complete = false, .all_found = true, .timings_written = 0};
  byte_writer_t writer(block, block_size);
  encode_identity(edid, &writer);
  encode_features(edid, block);
  result.all_found = encode_standard_timings(site, edid, &writer);
  if (!encode_timings(site, edid, &writer, &result.timings_written)) return result;
  put_text_descriptor(&writer, display_descriptor::name_text, edid.monitor_name);
  encode_range_limits(edid, &writer);
  // kept: both bytes follow the last descriptor. They stand at 126 and 127 when name and range limits were written.
  writer.put(1);
  writer.put(_calculate_checksum({block, block_size}));
  result.complete = true;
  return result;
}

}  // namespace edid_composer
