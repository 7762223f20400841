// The memory of a composition's own lists: taken from the heap in blocks of some 1000 bytes, which the heap keeps at
// hand for the next composition, and given back all at once. An entry of such a list is unlinked, never freed.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

class entry_arena_t {
 public:
  /// What one block holds.
  static constexpr u32 block_bytes = 1000;

  entry_arena_t() = default;
  ~entry_arena_t();
  entry_arena_t(const entry_arena_t &) = delete;
  entry_arena_t &operator=(const entry_arena_t &) = delete;

  /// Uninitialised room for up to block_bytes, aligned to 8; null, with the lines of ll_create_entry, without memory.
  void *allocate(u32 bytes) {
    const u32 taken = (bytes + 7) & ~7U;
    if (taken > left_ && !add_block()) return nullptr;
    left_ -= taken;
    u8 *const room = next_;
    next_ += taken;
    return room;
  }

 private:
  bool add_block();

  ll_entry_t *blocks_ = nullptr;
  u8 *next_ = nullptr;
  u32 left_ = 0;
};

}  // namespace edid_composer
