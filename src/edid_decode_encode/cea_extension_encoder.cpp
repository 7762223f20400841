#include "edid_decode_encode/cea_extension_encoder.h"

#include <algorithm>

#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/descriptor_encoder.h"
#include "edid_decode_encode/descriptor_layout.h"
#include "edid_decode_encode/hdmi_vendor_block_encoder.h"

namespace edid_composer {
namespace {

namespace layout = cea_extension;

void encode_speaker_block(const edid_t &edid, byte_writer_t *extension) {
  extension->put(data_block::header(data_block::speaker_allocation, data_block::speaker_length));
  extension->put(edid.speaker, data_block::speaker_length);
}

bool encode_video_block(const site_t &site, const edid_t &edid, bool native_bit, byte_writer_t *extension) {
  constexpr i32 most = 32;
  constexpr i32 most_without_warning = 31;
  constexpr u8 only_vic = 1;
  const i32 size = ll_size(&edid.video_list);
  const u32 header = extension->reserve();
  const u8 first_native = native_bit ? short_video::native : u8{0};
  if (size == 0) extension->put(only_vic | first_native);
  for (i32 i = 0; i < std::min(size, most); ++i) {
    void *payload = nullptr;
    if (!ll_entry_at(&edid.video_list, i, &payload)) {
      LOG_ERROR_AS(site, "Failed trying to obtain index #%d list.", i);
      return false;
    }
    const auto &video = *static_cast<const short_video_desc_t *>(payload);
    const bool native = native_bit && (video.native != 0 || i == 0);
    extension->put(low_byte(video.vic | (native ? short_video::native : 0U)));
  }
  if (size > most_without_warning) {
    LOG_WARNING_AS(site,
                   "Requested too many short video descriptions. Truncating to the maximum allowed. Max:%d "
                   "Requested:%d",
                   most, size);
  }
  // kept: 32 descriptors wrap to a length of 0.
  const u32 length = extension->position() - header - 1;
  extension->put_at(header, data_block::header(data_block::video, length));
  return true;
}

/// Basic audio (CEA-861, section 7.5.2): what a sink without audio formats of its own declares.
bool encode_default_audio(const site_t &site, byte_writer_t *extension) {
  short_audio_desc_t audio{
      .type = 1, .channels = 2, .frequencies = 7, .pcm_bits = 5, .max_bitrate = 0, .value = 0, .wma_profile = 0};
  u8 descriptor[short_audio::size];
  if (_encode_edid_short_audio(descriptor, &audio) != 1) {
    LOG_ERROR_AS(site, "Failed encoding short audio. Type:%d", audio.type);
    return false;
  }
  extension->put(descriptor, short_audio::size);
  return true;
}

bool encode_audio_block(const site_t &site, const edid_t &edid, byte_writer_t *extension) {
  constexpr i32 most = 10;
  const i32 size = ll_size(&edid.audio_list);
  const u32 header = extension->reserve();
  if (size == 0 && !encode_default_audio(site, extension)) return false;
  for (i32 i = 0; i < std::min(size, most); ++i) {
    void *payload = nullptr;
    if (!ll_entry_at(&edid.audio_list, i, &payload)) {
      LOG_ERROR_AS(site, "Failed trying to access index #%d in the list.", i);
      return false;
    }
    auto *const audio = static_cast<short_audio_desc_t *>(payload);
    u8 descriptor[short_audio::size];
    if (_encode_edid_short_audio(descriptor, audio) != 1) {
      LOG_ERROR_AS(site, "Failed encoding short audio. Index:%d Type:%d", i, audio->type);
      return false;
    }
    extension->put(descriptor, short_audio::size);
  }
  if (size > most) {
    LOG_WARNING_AS(site,
                   "Requested too many short audio descriptions. Truncating to the maximum allowed. Max:%d "
                   "Requested:%d",
                   most, size);
  }
  const u32 length = extension->position() - header - 1;
  extension->put_at(header, data_block::header(data_block::audio, length));
  return true;
}

void encode_colorimetry_block(const edid_t &edid, byte_writer_t *extension) {
  constexpr u8 metadata_profile_0 = 0x01;
  if (edid.xvycc601 == 0 && edid.xvycc709 == 0) return;
  extension->put(data_block::header(data_block::extended, 3));
  extension->put(data_block::extended_colorimetry);
  extension->put(encode_flags(data_block::colorimetry_flags, edid));
  extension->put(metadata_profile_0);
}

/// The extension's detailed timing is that of VIC 1, whatever the record holds.
bool encode_timing(const site_t &site, byte_writer_t *extension) {
  constexpr u32 vic = 1;
  detailed_timing_t timing{};
  if (convert_vic_to_dtd(vic, &timing) != 1) {
    LOG_ERROR_AS(site, "Failed converting vic to dtd.");
    return false;
  }
  u8 descriptor[descriptor_size];
  if (_encode_edid_dtd(descriptor, &timing) != 1) {
    LOG_ERROR_AS(site, "Failed encoding DTD. Failing.");
    return false;
  }
  extension->put(descriptor, descriptor_size);
  return true;
}

}  // namespace

bool encode_cea_extension(const site_t &site, edid_t *edid, bool native_bit, u32 timings_written, u8 *extension,
                          u8 *spa_offset, extension_size_t *size) {
  constexpr i32 most_timings = 2;
  byte_writer_t writer(extension, block_size);
  writer.put(layout::cea_tag);
  writer.put(layout::supported_revision);
  writer.seek(layout::data_blocks);
  encode_speaker_block(*edid, &writer);
  const u32 video_block = writer.position();
  if (!encode_video_block(site, *edid, native_bit, &writer)) return false;
  const u32 audio_block = writer.position();
  if (!encode_audio_block(site, *edid, &writer)) return false;
  const u32 hdmi_block = writer.position();
  if (!encode_hdmi_vendor_block(site, edid, &writer, spa_offset)) return false;
  size->longest_block = std::max(audio_block - video_block, writer.position() - hdmi_block) - 1;
  encode_colorimetry_block(*edid, &writer);
  writer.put_at(layout::timings_offset, low_byte(writer.position()));

  if (const i32 timings = ll_size(&edid->dtd_list); timings > most_timings) {
    LOG_BUG_AS(site, "This function is only designed to handle up to 2 DTDs. num of dtds:%d", timings);
    return false;
  }
  if (!encode_timing(site, &writer)) return false;
  ++timings_written;
  put_text_descriptor(&writer, display_descriptor::serial_text, edid->serial_string);

  const u32 support =
      (edid->underscan != 0 ? layout::underscan : 0U) | layout::basic_audio | layout::ycbcr_444 | layout::ycbcr_422;
  writer.put_at(layout::flags, low_byte(support | (timings_written & layout::native_timings_mask)));
  size->bytes = writer.position();
  if (writer.position() > checksum_offset) {
    LOG_ERROR_AS(site, "The CEA extension needs %d bytes, but has %d before its checksum. The rest is left out.",
                 writer.position(), checksum_offset);
  }
  writer.put_at(checksum_offset, _calculate_checksum({extension, block_size}));
  return true;
}

}  // namespace edid_composer
