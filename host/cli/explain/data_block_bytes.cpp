#include "explain/data_block_bytes.h"

#include <algorithm>

#include "edid_text/mode_names.h"
#include "edid_text/speaker_names.h"
#include "explain/hdmi2_bytes.h"
#include "explain/hdmi_bytes.h"

namespace edid_cli {
namespace {

constexpr field_bit_t rate_bits[] = {{0x01, "32 kHz"}, {0x02, "44.1 kHz"},  {0x04, "48 kHz"}, {0x08, "88.2 kHz"},
                                     {0x10, "96 kHz"}, {0x20, "176.4 kHz"}, {0x40, "192 kHz"}};
constexpr field_bit_t size_bits[] = {{0x01, "16 bits"}, {0x02, "20 bits"}, {0x04, "24 bits"}};

/// What the third byte of an audio descriptor says depends on its format.
std::string audio_detail(unsigned format, unsigned byte) {
  constexpr unsigned pcm = 1;
  constexpr unsigned last_with_bitrate = 8;
  constexpr unsigned wma_pro = 14;
  constexpr unsigned extension = 15;
  if (format == pcm) {
    return set_bit_names(byte, size_bits);
  }
  if (format == extension) {
    return "extension code " + std::to_string(byte >> 3) + ": " + audio_type_name((byte >> 3) + extension);
  }
  return format <= last_with_bitrate ? number_text(byte * 8, "kbit/s")
         : format == wma_pro         ? "profile " + std::to_string(byte & 7U)
                                     : "value " + std::to_string(byte);
}

void name_audio(byte_naming_t &naming, std::size_t end) {
  constexpr byte_block_t block = byte_block_t::audio;
  for (int number = 1; naming.position() + 3 <= end; ++number) {
    const std::string name = "Audio descriptor " + std::to_string(number);
    const unsigned format = naming.next() >> 3 & 15U;
    naming.name(block, 1, name + ": format and channels",
                audio_type_name(format) + ", " + number_text((naming.next() & 7U) + 1, "channels"));
    naming.name(block, 1, name + ": sample rates", set_bit_names(naming.next(), rate_bits));
    naming.name(block, 1, name + ": detail", audio_detail(format, naming.next()));
  }
}

void name_video(byte_naming_t &naming, std::size_t end) {
  for (int number = 1; naming.position() < end; ++number) {
    const svd_t svd = decoded_svd(naming.next());
    naming.name(byte_block_t::video, 1, "Video descriptor " + std::to_string(number),
                video_mode_name(svd.vic) + (svd.native ? ", native" : ""));
  }
}

void name_speakers(byte_naming_t &naming, std::size_t) {
  const unsigned speakers = naming.next() | naming.next(1) << 8;
  std::string names;
  for (const speaker_name_t &speaker : speaker_names) {
    names += (speakers & speaker.bit) == 0 ? "" : (names.empty() ? "" : ", ") + std::string(speaker.name);
  }
  naming.name(byte_block_t::speakers, 3, "Speakers", names.empty() ? "none" : names);
}

void name_vendor(byte_naming_t &naming, std::size_t end) {
  if (naming.next(0) == 0x03 && naming.next(1) == 0x0C && naming.next(2) == 0x00) {
    name_hdmi_block(naming, end);
  }
}

void name_nothing(byte_naming_t &, std::size_t) {}

struct data_block_t {
  byte_block_t block;
  const char *name;
  void (*name_payload)(byte_naming_t &naming, std::size_t end);
};

/// By tag.
constexpr data_block_t data_blocks[8] = {
    {byte_block_t::other, "Reserved", name_nothing},
    {byte_block_t::audio, "Audio", name_audio},
    {byte_block_t::video, "Video", name_video},
    {byte_block_t::hdmi, "Vendor-specific", name_vendor},
    {byte_block_t::speakers, "Speaker allocation", name_speakers},
    {byte_block_t::other, "VESA DTC", name_nothing},
    {byte_block_t::other, "Reserved", name_nothing},
    {byte_block_t::other, "Extended", name_nothing},
};

data_block_t kind_of(unsigned tag, std::span<const u8> payload) {
  const known_block_t *const known = find_hdmi2_block(payload, tag);
  return known != nullptr ? data_block_t{known->block, known->name, known->name_payload} : data_blocks[tag];
}

}  // namespace

void name_data_block(byte_naming_t &naming) {
  const unsigned header = naming.next();
  const std::size_t begin = naming.position() + 1;
  const std::size_t end = std::max(begin, std::min(begin + (header & 0x1FU), naming.end()));
  const data_block_t kind = kind_of(header >> 5, naming.bytes(begin, end));
  naming.name(kind.block, 1, std::string(kind.name) + " data block", number_text(header & 0x1FU, "bytes follow"));
  kind.name_payload(naming, end);
  if (naming.position() < end) {
    naming.name(kind.block, end - naming.position(), "Not known", "not looked at");
  }
}

}  // namespace edid_cli
