#include "edid_decode_encode/short_audio.h"

#include "bytes.h"
#include "diagnostics.h"

namespace edid_composer {
namespace {

constexpr u32 format_shift = 3;
constexpr u32 format_mask = 0x0F;
constexpr u32 channels_mask = 0x07;
constexpr u32 frequencies_mask = 0x7F;
constexpr u32 pcm_bits_mask = 0x07;
constexpr u32 wma_profile_mask = 0x07;
constexpr u32 bitrate_unit = 8;
constexpr u32 extension_shift = 3;

constexpr u32 pcm = 1;
constexpr u32 last_with_bitrate = 8;
constexpr u32 last_with_value = 13;
constexpr u32 wma_pro = 14;
constexpr u32 extension_escape = 15;
/// Extension code 1 is type 16, and so on up to extension code 3.
constexpr u32 extended_type_base = 15;
constexpr u32 last_extension = 3;

/// The extension code of a type; 0 for a type without one.
constexpr u32 extension_code(u32 type) {
  const u32 code = type - extended_type_base;
  return code <= last_extension ? code : 0;
}

}  // namespace

u32 short_audio_type(u8 byte1, u8 byte3) {
  const u32 format = u32{byte1} >> format_shift & format_mask;
  if (format != extension_escape) return format;
  const u32 extension = u32{byte3} >> extension_shift;
  return extension >= 1 && extension <= last_extension ? extended_type_base + extension : 0;
}

bool _encode_edid_short_audio(u8 *cea_block, short_audio_desc_t *audio) {
  REPORTS_AS(_encode_edid_short_audio);
  if (audio->type == 0 || audio->type == extension_escape) {
    LOG_ERROR("Audio type is not recognied. Type:%d", audio->type);
    return false;
  }
  const u32 extension = extension_code(audio->type);
  // kept: the caller's entry is changed.
  if (extension != 0) audio->type = extension_escape;

  const u32 type = audio->type;
  cea_block[0] = low_byte((type & format_mask) << format_shift | ((audio->channels - 1) & channels_mask));
  cea_block[1] = low_byte(audio->frequencies & frequencies_mask);
  if (type == pcm) {
    cea_block[2] = low_byte(audio->pcm_bits & pcm_bits_mask);
  } else if (type <= last_with_bitrate) {
    cea_block[2] = low_byte(audio->max_bitrate / bitrate_unit);
  } else if (type <= last_with_value) {
    cea_block[2] = low_byte(audio->value);
  } else if (type == wma_pro) {
    cea_block[2] = low_byte(audio->wma_profile);
  } else if (extension != 0) {
    cea_block[2] = low_byte(extension << extension_shift);
  } else {
    LOG_ERROR("Invalid extended audio type:%d", extension);
    return false;
  }
  return true;
}

}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

u8 decode_edid_short_audio(u8 byte1, u8 byte2, u8 byte3, short_audio_desc_t *audio) {
  REPORTS_AS(decode_edid_short_audio);
  if (audio == nullptr) {
    LOG_ERROR("Function called with \"audio\" parameter set to NULL. audio=%s", address(audio).text);
    return 0;
  }
  const u32 format = u32{byte1} >> format_shift & format_mask;
  *audio = {};
  audio->type = short_audio_type(byte1, byte3);
  audio->channels = (byte1 & channels_mask) + 1;
  audio->frequencies = byte2 & frequencies_mask;

  if (format == 0) {
    LOG_ERROR("Unrecognized audio type found in audio format. Expected:1-15 Received:%d", format);
    return 0;
  }
  if (format == pcm) {
    audio->pcm_bits = byte3 & pcm_bits_mask;
  } else if (format <= last_with_bitrate) {
    audio->max_bitrate = byte3 * bitrate_unit;
  } else if (format <= last_with_value) {
    audio->value = byte3;
  } else if (format == wma_pro) {
    audio->wma_profile = byte3 & wma_profile_mask;
  }
  return 1;
}
