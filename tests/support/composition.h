// A whole composition in which everything around what the library may write is watched.
#pragma once

#include "support/edid_builder.h"

namespace test_support {

struct composition_t {
  bool result = false;
  bytes_t bytes;         ///< The 256 bytes of the caller's buffer; 0xA5 each where nothing was written.
  u8 spa_offset = 0xA5;  ///< What the offset of the physical address was set to.
  /// Whether the bytes around the buffer and around the offset, the sink's EDID, the settings and the platform values
  /// are what they were.
  bool rest_untouched = false;
};

/// Composes; an empty @p sink is none. Without @p values the configuration tree is read. The settings' own spa_offset
/// is replaced.
composition_t compose(const bytes_t &sink, compose_cfg_t cfg, const platform_values_t *values = nullptr);

}  // namespace test_support
