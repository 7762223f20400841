// The library's table of configuration keys, for tests.
#pragma once

#include <vector>

#include "edid_composer.h"

namespace test_support {

/// The keys in the order in which they are read; with @p is_wanted, those that it returns true for.
template <typename wanted_t>
std::vector<const configuration_key_t *> configuration_keys(wanted_t is_wanted) {
  std::vector<const configuration_key_t *> keys;
  for (u32 index = 0; const configuration_key_t *key = configuration_key(index); ++index) {
    if (is_wanted(*key)) keys.push_back(key);
  }
  return keys;
}

inline std::vector<const configuration_key_t *> configuration_keys() {
  return configuration_keys([](const configuration_key_t &) { return true; });
}

}  // namespace test_support
