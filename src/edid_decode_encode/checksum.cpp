#include "edid_decode_encode/checksum.h"

#include <cstring>

namespace edid_composer {

u8 _calculate_checksum(const byte_view_t &block) {
  // A whole block, with 0 for what isn't there: a loop of known length adds up many bytes at a time.
  u8 bytes[block_size] = {};
  const byte_view_t summed = block.first(checksum_offset);
  if (summed.size() != 0) std::memcpy(bytes, summed.data(), summed.size());
  u8 sum = 0;
  for (const u8 byte : bytes)
    sum = static_cast<u8>(sum + byte);
  return static_cast<u8>(-sum);
}

}  // namespace edid_composer
