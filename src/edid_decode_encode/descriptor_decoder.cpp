#include "edid_decode_encode/descriptor_decoder.h"

#include "diagnostics.h"
#include "edid_decode_encode/descriptor_layout.h"
#include "linked_list/new_entry.h"

namespace edid_composer {
namespace {

constexpr new_entry_texts_t timing_texts{"Failed creating an entry.", "Failed adding entry to the back.",
                                         "Failed deleting unused entry."};

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

u8 decode_display_descriptor(const site_t &site, const byte_view_t &descriptor, edid_t *edid) {
  const u8 zero_1 = descriptor[display_descriptor::zero_1];
  const u8 zero_2 = descriptor[display_descriptor::zero_2];
  if (zero_1 != 0 || zero_2 != 0) {
    LOG_ERROR_AS(site,
                 "Malformed DTD: The DTD's pixel clock is 0 indicating that the byte 0x2 and byte 0x4 should be zero, "
                 "but they are not. Byte2:0x%02X Byte4:0x%02X",
                 zero_1, zero_2);
    return 0;
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
      LOG_WARNING_AS(site, "Additional monitor color point specified. Ignoring.");
      break;
    case display_descriptor::standard_timings:
      LOG_WARNING_AS(site, "Additional standard timings specified. Ignoring.");
      break;
    case display_descriptor::dummy:
    case display_descriptor::manufacturer_0:
      break;
    default:
      LOG_WARNING_AS(site, "Unknown data tag within DTD timing. Ignoring. tag=0x%x", tag);
  }
  return 1;
}

}  // namespace

u8 _decode_edid_dtd(const byte_view_t &dtd, edid_t *edid) {
  namespace layout = detailed_timing;
  const u32 pixel_clock = dtd.little_endian_16(layout::pixel_clock) * layout::pixel_clock_unit;
  if (pixel_clock == 0) return decode_display_descriptor(HERE, dtd, edid);

  new_entry_t<detailed_timing_t> timing(HERE, timing_texts);
  if (!timing) return 0;
  const u8 flags = dtd[layout::flags];
  timing->valid = 1;
  timing->pixel_clock = pixel_clock;
  decode_split_fields(layout::split_fields, dtd, &*timing);
  timing->h_border = dtd[layout::h_border];
  timing->v_border = dtd[layout::v_border];
  timing->progressive = (flags & layout::interlaced) == 0 ? 1 : 0;
  timing->stereo = (flags & layout::stereo) != 0 ? 1 : 0;
  timing->h_sync_positive = (flags & layout::h_sync_positive) != 0 ? 1 : 0;
  timing->v_sync_positive = (flags & layout::v_sync_positive) != 0 ? 1 : 0;

  const u32 sync_type = static_cast<u32>(flags & layout::sync_type) >> layout::sync_type_shift;
  if (sync_type != layout::digital_separate_sync) {
    LOG_TRACE("Detailed timing is not set to digital. Val:0x%x Continuing.", sync_type);
  }
  if (!timing.add_to_back(&edid->dtd_list)) return 0;
  LOG_TRACE("Added DTD: WxH=%dx%d%s pixel:%d", timing->h_active, timing->v_active, timing->progressive != 0 ? "p" : "i",
            timing->pixel_clock);
  return 1;
}

u8 _decode_edid_standard_timing(u8 byte_a, u8 byte_b, edid_t *edid) {
  namespace layout = standard_timing;
  if (byte_a == layout::unused && byte_b == layout::unused) return 1;
  const std_timing_t timing{
      .h_active = (byte_a + layout::h_active_base) * layout::h_active_unit,
      .aspect_ratio = static_cast<u32>(byte_b) >> layout::aspect_shift,
      .refresh_rate = (byte_b & layout::refresh_mask) + layout::refresh_base,
  };
  return append(&edid->std_timings, timing, HERE) ? 1 : 0;
}

void _replace_all_chars(u8 *string, i32 length, u8 from, u8 to) {
  if (string == nullptr) {
    LOG_ERROR("String parameter is NULL.");
    return;
  }
  for (i32 i = 0; i < length; ++i) {
    if (string[i] == from) string[i] = to;
  }
}

}  // namespace edid_composer
