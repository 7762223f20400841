// EDIDs made byte by byte, for tests.
#pragma once

#include <array>
#include <string>
#include <utility>
#include <vector>

#include "edid_composer.h"

namespace test_support {

using bytes_t = std::vector<u8>;

/// Makes the last byte of the 128-byte block at @p offset its checksum.
void mend_checksum(bytes_t &edid, std::size_t offset);

/// The sum of the 128 bytes at @p block, mod 256.
u8 block_sum(const u8 *block);

/// The 18 bytes of descriptors. A stereo timing is written with stereo bits 01, every timing with digital separate
/// sync.
bytes_t timing_descriptor(const detailed_timing_t &timing);
/// A text of up to 13 characters; a shorter one is ended by a line feed and padded with blanks.
bytes_t text_descriptor(u8 tag, const std::string &text);
bytes_t range_limits_descriptor(u8 min_v, u8 max_v, u8 min_h, u8 max_h, u8 clock_in_10_mhz);
bytes_t dummy_descriptor();

/// A data block of the CEA-861 extension: header byte and payload.
bytes_t data_block(u8 tag, const bytes_t &payload);
bytes_t video_block(const bytes_t &descriptors);
bytes_t audio_block(const bytes_t &descriptors);
/// An HDMI vendor-specific data block; @p payload_behind_oui begins with the two bytes of the physical address.
bytes_t hdmi_block(const bytes_t &payload_behind_oui);

/// A valid base block: manufacturer "TST", digital, version 1.3, four dummy descriptors, no timings; every byte can be
/// changed before build().
class base_block_builder_t {
 public:
  base_block_builder_t();
  base_block_builder_t &byte(u32 offset, u8 value);
  base_block_builder_t &standard_timing(u32 slot, u8 a, u8 b);
  base_block_builder_t &descriptor(u32 slot, const bytes_t &descriptor);
  base_block_builder_t &extensions(u8 count);
  /// The 128 bytes with a right checksum.
  bytes_t build() const;

 private:
  std::array<u8, 128> bytes_;
};

/// A valid CEA-861 extension of revision 3.
class extension_builder_t {
 public:
  /// Set last of all: overrides what build() would write there. The checksum is made right afterwards, unless it is the
  /// byte that is overridden.
  extension_builder_t &byte(u32 offset, u8 value);
  extension_builder_t &flags(u8 value);  ///< Byte 3.
  extension_builder_t &block(const bytes_t &data_block);
  extension_builder_t &timing(const bytes_t &descriptor);
  /// The 128 bytes. Throws std::length_error when data blocks and timings have no room.
  bytes_t build() const;

 private:
  u8 flags_ = 0;
  bytes_t blocks_;
  bytes_t timings_;
  std::vector<std::pair<u32, u8>> overrides_;
};

/// One after the other.
bytes_t join(const bytes_t &a, const bytes_t &b);

/// A copy of the VIC's timing.
detailed_timing_t timing_of_vic(u32 vic);

}  // namespace test_support
