#include "edid_composer/raw_dump.h"

#include "edid_decode_encode/checksum.h"
#include "output.h"

namespace edid_composer {

void _dump_raw_edid_block(const u8 *bytes, i32 blocks) {
  constexpr u32 bytes_per_line = 16;
  if (!debug_enabled()) return;
  for (i32 block = 0; block < blocks; ++block) {
    if (block > 0) print("\n");
    for (u32 i = 0; i < block_size; ++i) {
      print("%02X ", *bytes++);
      if (i % bytes_per_line == bytes_per_line - 1) print("\n");
    }
  }
}

}  // namespace edid_composer
