#include "diagnostics.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/decoder.h"
#include "edid_decode_encode/descriptor_decoder.h"
#include "edid_decode_encode/descriptor_layout.h"
#include "edid_decode_encode/hdmi_vendor_block_decoder.h"
#include "linked_list/new_entry.h"

namespace edid_composer {
namespace {

namespace layout = cea_extension;

constexpr new_entry_texts_t video_texts{"Failed creating new entry.", "Failed adding entry to the back.",
                                        "Failed deleting unused entry."};

compose_extension_status verify(const site_t &site, const byte_view_t &extension) {
  if (extension[layout::tag] != layout::cea_tag) {
    LOG_ERROR_AS(site, "The extension is not a CEA extension. Expected=0x2 Received=0x%X", extension[layout::tag]);
    return COMPOSE_EXTENSION_NOT_CEA;
  }
  if (extension[layout::revision] != layout::supported_revision) {
    LOG_ERROR_AS(site, "Extension is the wrong version. Expected=0x3 Received=0x%X", extension[layout::revision]);
    return COMPOSE_EXTENSION_REVISION_UNSUPPORTED;
  }
  const u8 calculated = _calculate_checksum(extension);
  if (calculated != extension[checksum_offset]) {
    LOG_ERROR_AS(site, "Edid failed the checksum. Calculated:0x%02X Received:0x%02X", calculated,
                 extension[checksum_offset]);
    return COMPOSE_EXTENSION_CHECKSUM_INVALID;
  }
  if (extension[layout::timings_offset] > layout::largest_timings_offset) {
    LOG_ERROR_AS(site, "EDID DTD offset value is larger than the block. Offset:%d\n",
                 extension[layout::timings_offset]);
    return COMPOSE_EXTENSION_OFFSET_UNSUPPORTED;
  }
  return COMPOSE_EXTENSION_READ;
}

/// Decodes the detailed timings behind the data blocks. A malformed one only logs.
void decode_timings(const byte_view_t &extension, edid_t *edid) {
  std::size_t offset = extension[layout::timings_offset];
  for (; offset + descriptor_size < extension.size(); offset += descriptor_size) {
    _decode_edid_dtd(extension.from(static_cast<u32>(offset)), edid);
  }
}

/// The last short audio descriptor of a payload that isn't a multiple of three bytes ends behind its block.
bool decode_audio_block(const site_t &site, const byte_view_t &payload, u32 length, edid_t *edid) {
  for (u32 i = 0; i < length; i += short_audio::size) {
    short_audio_desc_t audio{};
    if (decode_edid_short_audio(payload[i], payload[i + 1], payload[i + 2], &audio) != 1) {
      // kept: the labels stand in the reverse of the bytes' order.
      LOG_WARNING_AS(site, "Failed to decode audio format. Index:%d byte3:0x%02X byte2:0x%02X byte1:0x%02X", i,
                     payload[i], payload[i + 1], payload[i + 2]);
      continue;
    }
    if (!append(&edid->audio_list, audio, HERE_AS(site))) return false;
  }
  return true;
}

bool decode_video_block(const site_t &site, const byte_view_t &payload, u32 length, edid_t *edid) {
  for (u32 i = 0; i < length; ++i) {
    const short_video_desc_t video{
        .native = (payload[i] & short_video::native) != 0 ? u8{1} : u8{0},
        .vic = static_cast<u32>(payload[i] & short_video::vic_mask),
        .stereo = 0,
    };
    if (!append(&edid->video_list, video, HERE_AS(site), video_texts)) return false;
  }
  return true;
}

void decode_speaker_block(const site_t &site, const byte_view_t &payload, u32 length, edid_t *edid) {
  if (length != data_block::speaker_length) {
    LOG_WARNING_AS(site, "Speaker allocation block is longer than expected. Expected=3 Actual=%d Continuing...",
                   length);
    return;
  }
  payload.copy(0, edid->speaker, data_block::speaker_length);
}

void decode_extended_block(const site_t &site, const byte_view_t &payload, u32 length, edid_t *edid) {
  const u8 extended_tag = payload[0];
  if (extended_tag != data_block::extended_colorimetry) {
    LOG_TRACE_AS(site, "Extended Data block. Ignoring. ExtTag:0x%x Len=%d", extended_tag, length);
    return;
  }
  decode_flags(data_block::colorimetry_flags, payload[1], edid);
}

/// Decodes the block whose header byte is the first of @p block. False when an entry could not be kept.
bool decode_data_block(const site_t &site, const byte_view_t &block, u32 tag, u32 length, edid_t *edid) {
  const byte_view_t payload = block.from(1);
  switch (tag) {
    case data_block::reserved_0:
      LOG_TRACE_AS(site, "Reserved code. Len=%d", length);
      break;
    case data_block::audio:
      LOG_TRACE_AS(site, "Audio Data Block. Len=%d", length);
      return decode_audio_block(site, payload, length, edid);
    case data_block::video:
      LOG_TRACE_AS(site, "Video Data Block. Len=%d", length);
      return decode_video_block(site, payload, length, edid);
    case data_block::vendor_specific:
      LOG_TRACE_AS(site, "Vendor Specific Data Block. Len=%d", length);
      _decode_edid_vendor_block(block, edid);
      break;
    case data_block::speaker_allocation:
      LOG_TRACE_AS(site, "Speaker Allocation Data Block. Len=%d", length);
      decode_speaker_block(site, payload, length, edid);
      break;
    case data_block::vesa_dtc:
      LOG_TRACE_AS(site, "VESA DTC Data Block. Ignoring. Len=%d", length);
      break;
    case data_block::reserved_6:
      LOG_TRACE_AS(site, "Reserved Code:6. Ignoring. Len=%d", length);
      break;
    case data_block::extended:
      decode_extended_block(site, payload, length, edid);
      break;
  }
  return true;
}

extension_outcome_t decode_data_blocks(const site_t &site, const byte_view_t &extension, edid_t *edid) {
  const u32 timings_offset = extension[layout::timings_offset];
  // An offset that points into the extension's header makes the collection's size wrap: the walk then has no bound but
  // the bytes that are there.
  const bool wraps = timings_offset < layout::data_blocks;
  const u32 size = timings_offset - layout::data_blocks;
  for (u32 i = 0; i < size;) {
    const u32 offset = layout::data_blocks + i;
    const u32 tag = u32{extension[offset]} >> data_block::tag_shift;
    const u32 length = extension[offset] & data_block::length_mask;
    if (i + length >= size || (wraps && !extension.contains(offset))) {
      LOG_ERROR_AS(site,
                   "Malformed EDID: The CEA extension data block specifies a tag with a length whose total bytes "
                   "exceeds the length of the CEA extension's data block. Tag:%d Len:%d Current Byte:%d Data Block "
                   "Len:%d",
                   tag, length, i, size);
      return {COMPOSE_EXTENSION_MALFORMED, offset};
    }
    if (!decode_data_block(site, extension.from(offset), tag, length, edid))
      return {COMPOSE_EXTENSION_OUT_OF_MEMORY, 0};
    i += length + 1;
  }
  return {COMPOSE_EXTENSION_READ, 0};
}

}  // namespace

extension_outcome_t decode_cea_extension(const u8 *edid_extension, u32 length, edid_t *edid) {
  constexpr site_t site{EDID_COMPOSER_MODULE, "decode_edid_extensions", 0};
  const byte_view_t extension(edid_extension, length);
  const compose_extension_status status = verify(site, extension);
  if (status != COMPOSE_EXTENSION_READ) return {status, 0};
  decode_flags(layout::support_flags, extension[layout::flags], edid);
  decode_timings(extension, edid);
  return decode_data_blocks(site, extension, edid);
}

}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

u8 decode_edid_extensions(const u8 *edid_extension, u32 length, edid_t *edid) {
  if (edid_extension == nullptr) {
    LOG_ERROR("Function called with edid_extension set to NULL.");
    return 0;
  }
  if (edid == nullptr) {
    LOG_ERROR("Function called with edid set to NULL.");
    return 0;
  }
  return decode_cea_extension(edid_extension, length, edid).status == COMPOSE_EXTENSION_READ ? 1 : 0;
}
