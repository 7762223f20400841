// Makes blocks pass the first checks of the decoders, so that a fuzzer's bytes get past them.
#pragma once

#include <cstddef>

#include "edid_composer.h"

namespace fuzz {

inline constexpr u32 block_size = 128;
/// A base block and the 255 extensions that it can announce.
inline constexpr std::size_t longest_sink = 256 * block_size;

inline void mend_checksum(u8 *block) {
  u32 sum = 0;
  for (u32 i = 0; i < block_size - 1; ++i)
    sum += block[i];
  block[block_size - 1] = static_cast<u8>((0x100 - (sum & 0xFF)) & 0xFF);
}

/// Header, version 1.3 and checksum (EDID 1.3, section 3).
inline void mend_base_block(u8 *block) {
  for (u32 i = 0; i < 8; ++i)
    block[i] = i == 0 || i == 7 ? 0x00 : 0xFF;
  block[18] = 1;
  block[19] = 3;
  mend_checksum(block);
}

/// Tag, revision and checksum (CEA-861, section 7.5).
inline void mend_extension(u8 *block) {
  block[0] = 0x02;
  block[1] = 0x03;
  mend_checksum(block);
}

}  // namespace fuzz
