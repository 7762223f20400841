// One composition through the shared library, with what it printed.
#pragma once

#include <string>
#include <vector>

#include "edid_composer.h"

namespace end_to_end {

struct composition_t {
  bool composed = false;
  std::vector<u8> bytes;  ///< All 256.
  u8 spa_offset = 0;
  std::string output;  ///< Masked.
};

/// Composes below @p sink (empty: no sink), from @p values or, when they are null, from the current configuration tree.
/// Also checks what holds for every composition: nothing but the output and the offset was written.
composition_t compose(const std::vector<u8> &sink, const compose_cfg_t &cfg, const platform_values_t *values,
                      bool traced);

/// The 128 bytes of a block sum to 0 in both blocks, and they begin as base block and CEA-861 extension.
void expect_valid_edid(const std::vector<u8> &edid);

}  // namespace end_to_end
