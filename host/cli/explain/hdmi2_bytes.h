// The data blocks that came with HDMI 2, HDR and wide colour.
#pragma once

#include "explain/byte_fields.h"

namespace edid_cli {

/// A data block that is known by its tag and by what its payload begins with.
struct known_block_t {
  byte_block_t block;
  const char *name;
  unsigned tag;
  std::size_t identifier_size;
  u8 identifier[4];  ///< Extended tag, then the bytes of the IEEE identifier as they are stored.
  void (*name_payload)(byte_naming_t &naming, std::size_t end);
};

/// The block with that payload; nullptr for any other.
const known_block_t *find_hdmi2_block(std::span<const u8> payload, unsigned tag);

}  // namespace edid_cli
