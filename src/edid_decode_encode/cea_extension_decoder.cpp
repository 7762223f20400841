#include "diagnostics.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/data_blocks.h"
#include "edid_decode_encode/decoder.h"
#include "edid_decode_encode/descriptor.h"
#include "edid_decode_encode/descriptor_layout.h"
#include "edid_decode_encode/hdmi_vendor_block_decoder.h"
#include "edid_decode_encode/short_audio.h"
#include "linked_list/typed_list.h"

namespace edid_composer {
namespace {

REPORTS_AS(decode_edid_extensions);

namespace layout = cea_extension;

constexpr new_entry_texts_t video_texts{"Failed creating new entry.", "Failed adding entry to the back."};

compose_extension_status verify(const byte_view_t &extension, u32 largest_timings_offset) {
  const compose_extension_status status = status_of_extension(extension, largest_timings_offset);
  switch (status) {
    case COMPOSE_EXTENSION_NOT_CEA:
      LOG_ERROR("The extension is not a CEA extension. Expected=0x2 Received=0x%X", extension[layout::tag]);
      break;
    case COMPOSE_EXTENSION_REVISION_UNSUPPORTED:
      LOG_ERROR("Extension is the wrong version. Expected=0x3 Received=0x%X", extension[layout::revision]);
      break;
    case COMPOSE_EXTENSION_CHECKSUM_INVALID:
      LOG_ERROR("Edid failed the checksum. Calculated:0x%02X Received:0x%02X", _calculate_checksum(extension),
                extension[checksum_offset]);
      break;
    case COMPOSE_EXTENSION_OFFSET_UNSUPPORTED:
      LOG_ERROR("EDID DTD offset value is larger than the block. Offset:%d\n", extension[layout::timings_offset]);
      break;
    default:
      break;
  }
  return status;
}

/// Decodes the detailed timings after the data blocks. A malformed one only logs.
void decode_timings(const byte_view_t &extension, edid_t *edid, entry_arena_t *arena) {
  appender_t<detailed_timing_t> timings = detailed_timing_appender(edid, arena);
  std::size_t offset = extension[layout::timings_offset];
  for (; offset + descriptor_size < extension.size(); offset += descriptor_size) {
    _decode_edid_dtd(extension.from(static_cast<u32>(offset)), &timings, edid);
  }
}

/// The lists that data blocks add to, and the ends that their blocks have in common.
struct block_lists_t {
  appender_t<short_video_desc_t> modes;
  appender_t<short_audio_desc_t> formats;
};

/// The last short audio descriptor of a payload that isn't a multiple of three bytes ends after its block.
bool decode_audio_block(const byte_view_t &payload, u32 length, appender_t<short_audio_desc_t> *formats) {
  for (u32 i = 0; i < length; i += short_audio_size) {
    short_audio_desc_t audio{};
    if (decode_edid_short_audio(payload[i], payload[i + 1], payload[i + 2], &audio) != 1) {
      // kept: the labels are in the reverse order of the bytes.
      LOG_WARNING("Failed to decode audio format. Index:%d byte3:0x%02X byte2:0x%02X byte1:0x%02X", i, payload[i],
                  payload[i + 1], payload[i + 2]);
      continue;
    }
    if (!formats->append(audio)) return false;
  }
  return true;
}

bool decode_video_block(const byte_view_t &payload, u32 length, appender_t<short_video_desc_t> *modes) {
  for (u32 i = 0; i < length; ++i) {
    const u8 native = (payload[i] & short_video::native) != 0;
    const u32 vic = payload[i] & short_video::vic_mask;
    if (!modes->append({.native = native, .vic = vic, .stereo = 0})) return false;
  }
  return true;
}

void decode_speaker_block(const byte_view_t &payload, u32 length, edid_t *edid) {
  if (length != data_block::speaker_length) {
    LOG_WARNING("Speaker allocation block is longer than expected. Expected=3 Actual=%d Continuing...", length);
    return;
  }
  payload.copy(0, edid->speaker, data_block::speaker_length);
}

void decode_extended_block(const byte_view_t &payload, u32 length, edid_t *edid) {
  const u8 extended_tag = payload[0];
  if (extended_tag != data_block::extended_colorimetry) {
    LOG_TRACE("Extended Data block. Ignoring. ExtTag:0x%x Len=%d", extended_tag, length);
    return;
  }
  decode_flags(data_block::colorimetry_flags, payload[1], edid);
}

/// Decodes the block whose header byte is the first of @p block. False when an entry could not be kept.
bool decode_data_block(const byte_view_t &block, u32 tag, u32 length, block_lists_t *lists, edid_t *edid) {
  const byte_view_t payload = block.from(1);
  switch (tag) {
    case data_block::reserved_0:
      LOG_TRACE("Reserved code. Len=%d", length);
      break;
    case data_block::audio:
      LOG_TRACE("Audio Data Block. Len=%d", length);
      return decode_audio_block(payload, length, &lists->formats);
    case data_block::video:
      LOG_TRACE("Video Data Block. Len=%d", length);
      return decode_video_block(payload, length, &lists->modes);
    case data_block::vendor_specific:
      LOG_TRACE("Vendor Specific Data Block. Len=%d", length);
      _decode_edid_vendor_block(block, lists->modes, edid);
      break;
    case data_block::speaker_allocation:
      LOG_TRACE("Speaker Allocation Data Block. Len=%d", length);
      decode_speaker_block(payload, length, edid);
      break;
    case data_block::vesa_dtc:
      LOG_TRACE("VESA DTC Data Block. Ignoring. Len=%d", length);
      break;
    case data_block::reserved_6:
      LOG_TRACE("Reserved Code:6. Ignoring. Len=%d", length);
      break;
    case data_block::extended:
      decode_extended_block(payload, length, edid);
      break;
  }
  return true;
}

extension_outcome_t decode_data_blocks(const byte_view_t &extension, edid_t *edid, entry_arena_t *arena) {
  block_lists_t lists{.modes = appender_t<short_video_desc_t>(&edid->video_list, arena, site, video_texts),
                      .formats = appender_t<short_audio_desc_t>(&edid->audio_list, arena, site)};
  data_blocks_t blocks(extension);
  while (blocks.next()) {
    if (!decode_data_block(extension.from(blocks->offset), blocks->tag, blocks->length, &lists, edid)) {
      return {COMPOSE_EXTENSION_OUT_OF_MEMORY, 0};
    }
  }
  if (!blocks.overruns()) return {COMPOSE_EXTENSION_READ, 0};
  LOG_ERROR(
      "Malformed EDID: The CEA extension data block specifies a tag with a length whose total bytes exceeds the length "
      "of the CEA extension's data block. Tag:%d Len:%d Current Byte:%d Data Block Len:%d",
      blocks->tag, blocks->length, blocks->offset - layout::data_blocks, blocks.size());
  return {COMPOSE_EXTENSION_MALFORMED, blocks->offset};
}

}  // namespace

compose_extension_status status_of_extension(const byte_view_t &extension, u32 largest_timings_offset) {
  if (extension[layout::tag] != layout::cea_tag) return COMPOSE_EXTENSION_NOT_CEA;
  if (extension[layout::revision] != layout::supported_revision) return COMPOSE_EXTENSION_REVISION_UNSUPPORTED;
  if (_calculate_checksum(extension) != extension[checksum_offset]) return COMPOSE_EXTENSION_CHECKSUM_INVALID;
  if (extension[layout::timings_offset] > largest_timings_offset) return COMPOSE_EXTENSION_OFFSET_UNSUPPORTED;
  return COMPOSE_EXTENSION_READ;
}

extension_outcome_t decode_cea_extension(const u8 *edid_extension, u32 length, edid_t *edid, entry_arena_t *arena,
                                         u32 largest_timings_offset) {
  const byte_view_t extension(edid_extension, length);
  const compose_extension_status status = verify(extension, largest_timings_offset);
  if (status != COMPOSE_EXTENSION_READ) return {status, 0};
  decode_flags(layout::support_flags, extension[layout::flags], edid);
  decode_timings(extension, edid, arena);
  return decode_data_blocks(extension, edid, arena);
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
  return decode_cea_extension(edid_extension, length, edid, nullptr).status == COMPOSE_EXTENSION_READ ? 1 : 0;
}
