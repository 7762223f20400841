// How often a loop over random or exhaustive inputs goes round.
#pragma once

#include <cstdlib>

namespace test_support {

/// @p usually, as many as have found faults; @p in_long_runs with EDID_COMPOSER_LONG_LOOPS in the environment, as
/// scripts/soak.sh sets it.
inline unsigned rounds(unsigned usually, unsigned in_long_runs) {
  return std::getenv("EDID_COMPOSER_LONG_LOOPS") == nullptr ? usually : in_long_runs;
}

}  // namespace test_support
