#include "edid_decode_encode/checksum.h"

namespace edid_composer {

u8 _calculate_checksum(const byte_view_t &block) {
  u32 sum = 0;
  for (const u8 byte : block.first(checksum_offset))
    sum += byte;
  return low_byte(0x100 - (sum & 0xFF));
}

}  // namespace edid_composer
