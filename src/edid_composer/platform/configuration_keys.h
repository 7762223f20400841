// Every key that the library reads of the platform configuration, as data that the reader walks.
#pragma once

#include <cstddef>
#include <span>

#include "utility/configuration.h"

namespace edid_composer {

/// A key, and what only the library needs to know of it.
struct platform_key_t {
  configuration_key_t key;
  std::size_t field;  ///< Where the value goes: offset of the member of platform_values_t or hdmi2_values_t.
  /// Of a number: replaces what has no meaning although it is within the limits. Null where all have one.
  void (*settle)(configuration_outcome_t *number) = nullptr;
};

/// In the order in which they are read.
std::span<const platform_key_t> platform_keys();

/// The member that the value of a key goes to.
template <typename member_t, typename values_t>
member_t *member_of(values_t *values, const platform_key_t &row) {
  return reinterpret_cast<member_t *>(reinterpret_cast<u8 *>(values) + row.field);
}

template <typename member_t, typename values_t>
const member_t *member_of(const values_t *values, const platform_key_t &row) {
  return reinterpret_cast<const member_t *>(reinterpret_cast<const u8 *>(values) + row.field);
}

}  // namespace edid_composer
