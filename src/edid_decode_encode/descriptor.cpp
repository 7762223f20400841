#include "edid_decode_encode/descriptor.h"

#include <cstring>

#include "edid_decode_encode/descriptor_layout.h"

namespace edid_composer {
namespace {

constexpr new_entry_texts_t timing_texts{"Failed creating an entry.", "Failed adding entry to the back."};

constexpr u32 lowest_pixel_clock = 25175000;

template <u32 size>
void decode_text(const byte_view_t &descriptor, char (&text)[size]) {
  static_assert(size == display_descriptor::text_length + 1);
  auto *const characters = reinterpret_cast<u8 *>(text);
  descriptor.copy(display_descriptor::data, characters, display_descriptor::text_length);
  _replace_all_chars(characters, static_cast<i32>(size), display_descriptor::line_feed, '\0');
  text[display_descriptor::text_length] = '\0';
}

void decode_range_limits(const byte_view_t &descriptor, edid_t *edid) {
  edid->min_v_rate = descriptor[display_descriptor::min_v_rate];
  edid->max_v_rate = descriptor[display_descriptor::max_v_rate];
  edid->min_h_rate = descriptor[display_descriptor::min_h_rate];
  edid->max_h_rate = descriptor[display_descriptor::max_h_rate];
  edid->max_pixel_clock = descriptor[display_descriptor::max_pixel_clock] * display_descriptor::max_pixel_clock_unit;
}

bool decode_display_descriptor(const byte_view_t &descriptor, edid_t *edid) {
  REPORTS_AS(_decode_edid_dtd);
  const u8 zero_1 = descriptor[display_descriptor::zero_1];
  const u8 zero_2 = descriptor[display_descriptor::zero_2];
  if (zero_1 != 0 || zero_2 != 0) {
    LOG_ERROR(
        "Malformed DTD: The DTD's pixel clock is 0 indicating that the byte 0x2 and byte 0x4 should be zero, "
        "but they are not. Byte2:0x%02X Byte4:0x%02X",
        zero_1, zero_2);
    return false;
  }
  const u8 tag = descriptor[display_descriptor::tag];
  switch (tag) {
    case display_descriptor::serial_text:
      decode_text(descriptor, edid->serial_string);
      break;
    case display_descriptor::data_text:
      decode_text(descriptor, edid->data_string);
      break;
    case display_descriptor::range_limits:
      decode_range_limits(descriptor, edid);
      break;
    case display_descriptor::name_text:
      decode_text(descriptor, edid->monitor_name);
      break;
    case display_descriptor::color_point:
      LOG_WARNING("Additional monitor color point specified. Ignoring.");
      break;
    case display_descriptor::standard_timings:
      LOG_WARNING("Additional standard timings specified. Ignoring.");
      break;
    case display_descriptor::dummy:
    case display_descriptor::manufacturer_0:
      break;
    default:
      LOG_WARNING("Unknown data tag within DTD timing. Ignoring. tag=0x%x", tag);
  }
  return true;
}

}  // namespace

bool is_display_descriptor(const byte_view_t &descriptor) {
  return descriptor.little_endian_16(detailed_timing::pixel_clock) == 0;
}

appender_t<detailed_timing_t> detailed_timing_appender(edid_t *edid, entry_arena_t *arena) {
  REPORTS_AS(_decode_edid_dtd);
  return appender_t<detailed_timing_t>(&edid->dtd_list, arena, site, timing_texts);
}

bool _decode_edid_dtd(const byte_view_t &dtd, appender_t<detailed_timing_t> *timings, edid_t *edid) {
  REPORTS_AS(_decode_edid_dtd);
  namespace layout = detailed_timing;
  if (is_display_descriptor(dtd)) return decode_display_descriptor(dtd, edid);

  const u8 flags = dtd[layout::flags];
  const u32 sync_type = static_cast<u32>(flags & layout::sync_type) >> layout::sync_type_shift;
  if (sync_type != layout::digital_separate_sync) {
    LOG_TRACE("Detailed timing is not set to digital. Val:0x%x Continuing.", sync_type);
  }
  detailed_timing_t timing{};
  timing.valid = 1;
  timing.pixel_clock = dtd.little_endian_16(layout::pixel_clock) * layout::pixel_clock_unit;
  decode_split_fields(layout::split_fields, dtd, &timing);
  timing.h_border = dtd[layout::h_border];
  timing.v_border = dtd[layout::v_border];
  timing.progressive = (flags & layout::interlaced) == 0;
  timing.stereo = (flags & layout::stereo) != 0;
  timing.h_sync_positive = (flags & layout::h_sync_positive) != 0;
  timing.v_sync_positive = (flags & layout::v_sync_positive) != 0;
  if (!timings->append(timing)) return false;
  LOG_TRACE("Added DTD: WxH=%dx%d%s pixel:%d", timing.h_active, timing.v_active, timing.progressive != 0 ? "p" : "i",
            timing.pixel_clock);
  return true;
}

void _replace_all_chars(u8 *string, i32 length, u8 from, u8 to) {
  for (i32 i = 0; i < length; ++i) {
    if (string[i] == from) string[i] = to;
  }
}

bool _encode_edid_dtd(u8 *dtd_block, const detailed_timing_t *timing) {
  REPORTS_AS(_encode_edid_dtd);
  namespace layout = detailed_timing;
  if (timing->valid != 1) {
    LOG_ERROR("Called encode DTD with an invalid timing structure.");
    return false;
  }
  if (timing->pixel_clock < lowest_pixel_clock) {
    LOG_ERROR("Called encode DTD with an invalid pixel clock:%d", timing->pixel_clock);
    return false;
  }
  byte_writer_t descriptor(dtd_block, descriptor_size);
  std::memset(dtd_block, 0, descriptor_size);
  descriptor.put_little_endian_16((timing->pixel_clock + layout::pixel_clock_unit / 2) / layout::pixel_clock_unit);
  encode_split_fields(layout::split_fields, *timing, dtd_block);
  dtd_block[layout::h_border] = timing->h_border;
  dtd_block[layout::v_border] = timing->v_border;
  // The stereo bits stay 0, whatever the timing says.
  u32 flags = layout::digital_separate_sync << layout::sync_type_shift;
  if (timing->progressive != 1) flags |= layout::interlaced;
  if (timing->h_sync_positive != 0) flags |= layout::h_sync_positive;
  if (timing->v_sync_positive != 0) flags |= layout::v_sync_positive;
  dtd_block[layout::flags] = low_byte(flags);
  return true;
}

bool _encode_string(u8 *block, u8 tag, const char *string) {
  namespace layout = display_descriptor;
  constexpr std::size_t shortest = 2;
  std::size_t length = strnlen(string, layout::text_length);
  if (string[0] == layout::blank || length < shortest) return false;
  while (length > 1 && string[length - 1] == layout::blank)
    --length;

  std::memset(block, 0, layout::data);
  block[layout::tag] = tag;
  std::memset(block + layout::data, layout::blank, layout::text_length);
  std::memcpy(block + layout::data, string, length);
  // After a text of 13 characters this is the first byte after the descriptor.
  block[layout::data + length] = layout::line_feed;
  return true;
}

void put_text_descriptor(byte_writer_t *block, u8 tag, const char *text) {
  u8 descriptor[descriptor_size + 1] = {};
  if (!_encode_string(descriptor, tag, text)) return;
  block->put(descriptor, descriptor_size);
  // The line feed after a full text takes no room: what is written next may replace it.
  if (descriptor[descriptor_size] != 0) block->put_at(block->position(), descriptor[descriptor_size]);
}

}  // namespace edid_composer
