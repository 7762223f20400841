// What every stage of a composition decides from.
#pragma once

#include "linked_list/entry_arena.h"

namespace edid_composer {

struct inputs_t {
  const edid_t &sink;  ///< The sink's record; empty without a readable sink.
  const platform_values_t &platform;
  const compose_cfg_t &settings;
  entry_arena_t *arena;  ///< Where the lists of the composition take their entries from.
};

/// Numbers that explain a reason; see compose_reason.
struct reason_values_t {
  i32 first = 0;
  i32 second = 0;
  i32 third = 0;
  i32 fourth = 0;
};

template <typename... numbers_t>
constexpr reason_values_t reason_values(numbers_t... numbers) {
  return {static_cast<i32>(numbers)...};
}

}  // namespace edid_composer
