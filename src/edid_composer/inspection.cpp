#include "diagnostics.h"
#include "edid_decode_encode/layout.h"
#include "output.h"

namespace edid_composer {
namespace {

REPORTS_AS(print_edid);

constexpr u32 smallest_size = block_size;
constexpr u32 largest_size = 2 * block_size;

/// The formats of an audio mask, from bit 0 on. kept: bit 9, enhanced AC-3, has the name of bit 1, AC-3.
constexpr const char *audio_mask_names[] = {
    "pcm ", "ac3 ",    "mpeg1 ", "mp3 ", "mpeg2 ",   "aac ",    "dts ",     "atrac ",         "dsd ",
    "ac3 ", "dts_hd ", "mlp ",   "dst ", "wma_pro ", "he_aac ", "he_aac2 ", "mpeg_surround ",
};

bool decode(const u8 *edid_block, u32 size, edid_t *edid) {
  if (decode_edid_block_0(edid_block, edid) != 1) {
    LOG_ERROR("Failed decoding EDID block 0.");
    return false;
  }
  if (size >= largest_size && decode_edid_extensions(edid_block + block_size, size - block_size, edid) != 1) {
    LOG_ERROR("Failed decoding EDID block 1.");
    return false;
  }
  return true;
}

}  // namespace
}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

void print_edid(const u8 *edid_block, u32 size, u8 brief, const char *title) {
  if (edid_block == nullptr) {
    LOG_ERROR("\"edid_block\" memory block parameter is NULL. Exiting. edid_block:%s", address(edid_block).text);
    return;
  }
  if (size % block_size != 0) {
    LOG_ERROR("Edid size is not an valid value. edid_bytes=%d Range=(%d-%d)", size, smallest_size, largest_size);
    return;
  }
  edid_t edid;
  // GCOVR_EXCL_START: a list of the record would have to stand at one of the few addresses whose magic is 0.
  if (edid_prepare(&edid) != 1) {
    LOG_ERROR("Failed preparing edid.");
    return;
  }
  // GCOVR_EXCL_STOP
  if (decode(edid_block, size, &edid)) print_edid_struct(&edid, brief, title);
  edid_destroy(&edid);
}

void print_edid_audio_mask(u32 mask) {
  constexpr u32 all_formats = 0xFFFFFFFF;
  print("EDID: Audio mask: 0x%08X => ", mask);
  if (mask == all_formats) {
    print("All audio formats supported");
  } else if (mask == 0) {
    print("No audio formats");
  } else {
    u32 bit = 1;
    for (const auto &name : audio_mask_names) {
      if ((mask & bit) != 0) print("%s", name);
      bit <<= 1;
    }
  }
  print("\n");
}
