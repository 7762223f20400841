// What every target defines, and what they share.
#pragma once

#include <cstddef>
#include <cstdio>
#include <cstdlib>

#include "edid_composer.h"

/// Called by libFuzzer, or by the replay driver, with one input after the other.
extern "C" int LLVMFuzzerTestOneInput(const u8 *data, std::size_t size);

/// Ends the process when a promise of the library is broken.
#define FUZZ_REQUIRE(condition)                                                            \
  do {                                                                                     \
    if (!(condition)) {                                                                    \
      std::fprintf(stderr, "%s:%d: broken promise: %s\n", __FILE__, __LINE__, #condition); \
      std::abort();                                                                        \
    }                                                                                      \
  } while (false)
