// Reading a composed EDID, byte by byte and without the library.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace host_test {

class composed_edid_t {
 public:
  explicit composed_edid_t(std::string bytes) : bytes_(std::move(bytes)) {}

  /// 256 bytes, both headers, both blocks summing to 0.
  bool is_well_formed() const;

  u8 at(std::size_t offset) const { return static_cast<u8>(bytes_.at(offset)); }
  /// The text of the base block's name descriptor.
  std::string monitor_name() const;
  /// The video identification codes of the video data block.
  std::vector<u8> vics() const;
  /// The format codes of the audio data block.
  std::vector<u8> audio_formats() const;
  /// The payload of the HDMI block from the physical address on.
  std::string hdmi() const;
  /// "a.b.c.d".
  std::string physical_address() const;

 private:
  /// The payload of the first data block of a kind.
  std::string data_block(u8 tag) const;

  std::string bytes_;
};

}  // namespace host_test
