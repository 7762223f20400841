#include "linked_list/entry_arena.h"

#include "linked_list/linked_list.h"

namespace edid_composer {

entry_arena_t::~entry_arena_t() {
  while (blocks_ != nullptr) {
    ll_entry_t *const next = blocks_->next;
    ll_delete_entry(blocks_);
    blocks_ = next;
  }
}

bool entry_arena_t::add_block() {
  ll_entry_t *const block = create_unfilled_entry(block_bytes, 0, nullptr);
  if (block == nullptr) return false;
  block->next = blocks_;
  blocks_ = block;
  next_ = static_cast<u8 *>(block->data);
  left_ = block_bytes;
  return true;
}

}  // namespace edid_composer
