// Random numbers that are the same on every machine for the same seed: as long as no two are drawn in one expression
// that leaves their order to the compiler, as arguments of a call do.
#pragma once

#include <array>
#include <cstdint>
#include <vector>

#include "edid_composer.h"

namespace properties {

/// SplitMix64.
class random_source_t {
 public:
  explicit random_source_t(std::uint64_t seed) : state_(seed) {}

  std::uint64_t next() {
    state_ += 0x9E3779B97F4A7C15;
    std::uint64_t mixed = state_;
    mixed = (mixed ^ mixed >> 30) * 0xBF58476D1CE4E5B9;
    mixed = (mixed ^ mixed >> 27) * 0x94D049BB133111EB;
    return mixed ^ mixed >> 31;
  }

  /// A number from @p min to @p max, both included.
  u32 between(u32 min, u32 max) { return min + static_cast<u32>(next() % (std::uint64_t{max} - min + 1)); }
  u8 byte() { return static_cast<u8>(next() & 0xFF); }
  /// 1 or 0.
  u8 flag() { return static_cast<u8>(next() & 1); }
  bool chance(u32 percent) { return between(1, 100) <= percent; }

  template <typename element_t, std::size_t size>
  element_t one_of(const std::array<element_t, size> &elements) {
    return elements[between(0, static_cast<u32>(size) - 1)];
  }

 private:
  std::uint64_t state_;
};

}  // namespace properties
