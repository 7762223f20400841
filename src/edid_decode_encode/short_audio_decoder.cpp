#include "diagnostics.h"
#include "edid_decode_encode/cea_extension_layout.h"

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operation below is the namespace's API

u8 decode_edid_short_audio(u8 byte1, u8 byte2, u8 byte3, short_audio_desc_t *audio) {
  namespace layout = short_audio;
  if (audio == nullptr) {
    LOG_ERROR("Function called with \"audio\" parameter set to NULL. audio=%p", address(audio));
    return 0;
  }
  const u32 format = u32{byte1} >> layout::format_shift & layout::format_mask;
  *audio = {};
  audio->type = format;
  audio->channels = (byte1 & layout::channels_mask) + 1;
  audio->frequencies = byte2 & layout::frequencies_mask;

  if (format == layout::pcm) {
    audio->pcm_bits = byte3 & layout::pcm_bits_mask;
  } else if (format >= layout::first_with_bitrate && format <= layout::last_with_bitrate) {
    audio->max_bitrate = byte3 * layout::bitrate_unit;
  } else if (format >= layout::first_with_value && format <= layout::last_with_value) {
    audio->value = byte3;
  } else if (format == layout::wma_pro) {
    audio->wma_profile = byte3 & layout::wma_profile_mask;
  } else if (format == layout::extension_escape) {
    const u32 extension = u32{byte3} >> layout::extension_shift;
    const bool known = extension >= 1 && extension <= layout::last_extension;
    audio->type = known ? layout::extended_type_base + extension : 0;
  } else {
    LOG_ERROR("Unrecognized audio type found in audio format. Expected:1-15 Received:%d", format);
    return 0;
  }
  return 1;
}
