#include "edid_decode_encode/cea_extension_encoder.h"

#include <algorithm>

#include "diagnostics.h"
#include "edid_decode_encode/base_block_encoder.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/descriptor.h"
#include "edid_decode_encode/descriptor_layout.h"
#include "edid_decode_encode/hdmi_vendor_block_encoder.h"
#include "edid_decode_encode/hdmi_vendor_block_layout.h"
#include "edid_decode_encode/short_audio.h"

namespace edid_composer {
namespace {

REPORTS_AS(encode_edid);

namespace layout = cea_extension;

void encode_speaker_block(const edid_t &edid, byte_writer_t *extension) {
  extension->put(data_block::header(data_block::speaker_allocation, data_block::speaker_length));
  extension->put(edid.speaker, data_block::speaker_length);
}

/// Writes the header of the block that @p header keeps the place of, once its payload is written.
void finish_block(u32 tag, u32 header, byte_writer_t *extension) {
  extension->put_at(header, data_block::header(tag, extension->position() - header - 1));
}

void encode_video_block(const edid_t &edid, bool native_bit, byte_writer_t *extension) {
  constexpr i32 most = 32;
  constexpr i32 most_without_warning = 31;
  constexpr u8 only_vic = 1;
  const i32 size = ll_size(&edid.video_list);
  const u32 header = extension->reserve();
  if (size == 0) extension->put(native_bit ? short_video::native | only_vic : only_vic);
  i32 index = 0;
  for (const auto &video : elements<const short_video_desc_t>(size > 0 ? edid.video_list.head : nullptr)) {
    if (index == most) break;
    const bool native = native_bit && (video.native != 0 || index == 0);
    extension->put(low_byte(video.vic | (native ? short_video::native : 0U)));
    ++index;
  }
  if (size > most_without_warning) {
    LOG_WARNING("Requested too many short video descriptions. Truncating to the maximum allowed. Max:%d Requested:%d",
                most, size);
  }
  // kept: 32 descriptors are written, whose length wraps to 0.
  finish_block(data_block::video, header, extension);
}

/// Basic audio (CEA-861, section 7.5.2): what a sink without audio formats of its own declares.
void encode_default_audio(byte_writer_t *extension) {
  short_audio_desc_t audio{
      .type = 1, .channels = 2, .frequencies = 7, .pcm_bits = 5, .max_bitrate = 0, .value = 0, .wma_profile = 0};
  u8 descriptor[short_audio_size];
  _encode_edid_short_audio(descriptor, &audio);
  extension->put(descriptor, short_audio_size);
}

bool encode_audio_block(const edid_t &edid, byte_writer_t *extension) {
  constexpr i32 most = 10;
  const i32 size = ll_size(&edid.audio_list);
  const u32 header = extension->reserve();
  if (size == 0) encode_default_audio(extension);
  i32 index = 0;
  for (auto &audio : elements<short_audio_desc_t>(size > 0 ? edid.audio_list.head : nullptr)) {
    if (index == most) break;
    u8 descriptor[short_audio_size];
    if (!_encode_edid_short_audio(descriptor, &audio)) {
      LOG_ERROR("Failed encoding short audio. Index:%d Type:%d", index, audio.type);
      return false;
    }
    extension->put(descriptor, short_audio_size);
    ++index;
  }
  if (size > most) {
    LOG_WARNING("Requested too many short audio descriptions. Truncating to the maximum allowed. Max:%d Requested:%d",
                most, size);
  }
  finish_block(data_block::audio, header, extension);
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

}  // namespace

bool encode_up_to_hdmi_block(edid_t *edid, bool native_bit, byte_writer_t *extension, encoding_t *encoding) {
  extension->put(layout::cea_tag);
  extension->put(layout::supported_revision);
  extension->seek(layout::data_blocks);
  encode_speaker_block(*edid, extension);
  const u32 video_block = extension->position();
  encode_video_block(*edid, native_bit, extension);
  const u32 audio_block = extension->position();
  if (!encode_audio_block(*edid, extension)) return false;
  const u32 hdmi_block = extension->position();
  encoding->physical_address_offset = low_byte(block_size + hdmi_block + hdmi_vendor_block::physical_address);
  encode_hdmi_vendor_block(edid, extension);
  encoding->longest_block = std::max(audio_block - video_block, extension->position() - hdmi_block) - 1;
  return true;
}

void encode_extension_timing(byte_writer_t *extension) {
  constexpr u32 vic = 1;
  detailed_timing_t timing{};
  convert_vic_to_dtd(vic, &timing);
  u8 descriptor[descriptor_size];
  _encode_edid_dtd(descriptor, &timing);
  extension->put(descriptor, descriptor_size);
}

void encode_extension_flags(const edid_t &edid, byte_writer_t *extension) {
  constexpr u32 native_timings = base_block_timings + 1;
  const u32 support = layout::basic_audio | layout::ycbcr_444 | layout::ycbcr_422;
  extension->put_at(layout::flags, low_byte((edid.underscan != 0 ? layout::underscan : 0U) | support | native_timings));
}

bool encode_cea_extension(edid_t *edid, bool native_bit, u8 *extension, encoding_t *encoding) {
  byte_writer_t writer(extension, block_size);
  if (!encode_up_to_hdmi_block(edid, native_bit, &writer, encoding)) return false;
  encode_colorimetry_block(*edid, &writer);
  writer.put_at(layout::timings_offset, low_byte(writer.position()));

  if (const i32 timings = ll_size(&edid->dtd_list); timings > base_block_timings) {
    LOG_BUG("This function is only designed to handle up to 2 DTDs. num of dtds:%d", timings);
    return false;
  }
  encode_extension_timing(&writer);
  put_text_descriptor(&writer, display_descriptor::serial_text, edid->serial_string);
  encode_extension_flags(*edid, &writer);
  encoding->extension_bytes = writer.position();
  if (writer.position() > checksum_offset) {
    LOG_ERROR("The CEA extension needs %d bytes, but has %d before its checksum. The rest is left out.",
              writer.position(), checksum_offset);
  }
  writer.put_at(checksum_offset, _calculate_checksum({extension, block_size}));
  return true;
}

}  // namespace edid_composer
