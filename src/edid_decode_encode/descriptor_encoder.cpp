#include "edid_decode_encode/descriptor_encoder.h"

#include <cstring>

#include "diagnostics.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/descriptor_layout.h"

namespace edid_composer {
namespace {

constexpr u32 lowest_pixel_clock = 25175000;

constexpr u32 extension_code(u32 type) {
  const u32 code = type - short_audio::extended_type_base;
  return code <= short_audio::last_extension ? code : 0;
}

}  // namespace

u8 _encode_edid_dtd(u8 *dtd_block, const detailed_timing_t *timing) {
  namespace layout = detailed_timing;
  if (dtd_block == nullptr) {
    LOG_ERROR("Function called with dtd_block set to NULL.");
    return 0;
  }
  if (timing == nullptr) {
    // kept: the words for the other parameter.
    LOG_ERROR("Function called with dtd_block set to NULL.");
    return 0;
  }
  if (timing->valid != 1) {
    LOG_ERROR("Called encode DTD with an invalid timing structure.");
    return 0;
  }
  if (timing->pixel_clock < lowest_pixel_clock) {
    LOG_ERROR("Called encode DTD with an invalid pixel clock:%d", timing->pixel_clock);
    return 0;
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
  return 1;
}

u8 _encode_edid_short_audio(u8 *cea_block, short_audio_desc_t *audio) {
  namespace layout = short_audio;
  if (cea_block == nullptr) {
    LOG_ERROR("Function called with cea_block set to NULL.");
    return 0;
  }
  if (audio == nullptr) {
    LOG_ERROR("Function called with audio set to NULL.");
    return 0;
  }
  if (audio->type == 0 || audio->type == layout::extension_escape) {
    LOG_ERROR("Audio type is not recognied. Type:%d", audio->type);
    return 0;
  }
  const u32 extension = extension_code(audio->type);
  // kept: the caller's entry is changed.
  if (extension != 0) audio->type = layout::extension_escape;

  const u32 type = audio->type;
  cea_block[0] =
      low_byte((type & layout::format_mask) << layout::format_shift | ((audio->channels - 1) & layout::channels_mask));
  cea_block[1] = low_byte(audio->frequencies & layout::frequencies_mask);
  if (type == layout::pcm) {
    cea_block[2] = low_byte(audio->pcm_bits & layout::pcm_bits_mask);
  } else if (type <= layout::last_with_bitrate) {
    cea_block[2] = low_byte(audio->max_bitrate / layout::bitrate_unit);
  } else if (type <= layout::last_with_value) {
    cea_block[2] = low_byte(audio->value);
  } else if (type == layout::wma_pro) {
    cea_block[2] = low_byte(audio->wma_profile);
  } else if (extension != 0) {
    cea_block[2] = low_byte(extension << layout::extension_shift);
  } else {
    LOG_ERROR("Invalid extended audio type:%d", extension);
    return 0;
  }
  return 1;
}

u8 _encode_string(u8 *block, u8 tag, const char *string) {
  namespace layout = display_descriptor;
  constexpr std::size_t shortest = 2;
  std::size_t length = strnlen(string, layout::text_length);
  if (string[0] == layout::blank || length < shortest) return 0;
  while (length > 1 && string[length - 1] == layout::blank)
    --length;

  std::memset(block, 0, layout::data);
  block[layout::tag] = tag;
  std::memset(block + layout::data, layout::blank, layout::text_length);
  std::memcpy(block + layout::data, string, length);
  // Behind a text of 13 characters this is the first byte after the descriptor.
  block[layout::data + length] = layout::line_feed;
  return descriptor_size;
}

void put_text_descriptor(byte_writer_t *block, u8 tag, const char *text) {
  u8 descriptor[descriptor_size + 1] = {};
  const u8 written = _encode_string(descriptor, tag, text);
  if (written == 0) return;
  block->put(descriptor, written);
  // The line feed behind a full text takes no room: what is written next may replace it.
  if (descriptor[written] != 0) block->put_at(block->position(), descriptor[written]);
}

}  // namespace edid_composer

u8 encode_edid_latency_value(u16 latency_ms) {
  constexpr u16 not_supported_ms = 65535;
  constexpr u8 not_supported = 255;
  constexpr u16 longest_ms = 500;
  constexpr u8 longest = 251;
  if (latency_ms == not_supported_ms) return not_supported;
  if (latency_ms <= longest_ms) return edid_composer::low_byte(latency_ms / 2U + 1);
  LOG_TRACE("latency = %d exceed 500ms", latency_ms);
  return longest;
}
