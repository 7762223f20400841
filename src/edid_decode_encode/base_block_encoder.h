// Encoding of the base block (EDID 1.3, section 3).
#pragma once

#include "diagnostics.h"

namespace edid_composer {

/// What became of a base block.
struct base_block_result_t {
  bool complete;        ///< False: a hard failure, encoding ends.
  bool all_found;       ///< False: a standard timing was left out.
  u32 timings_written;  ///< Number of detailed timings.
};

/// Writes the 128 bytes of @p block, which hold 0, in the name of @p site.
base_block_result_t encode_base_block(const site_t &site, const edid_t &edid, u8 *block);

}  // namespace edid_composer
