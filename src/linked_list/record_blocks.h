// Records that a composition keeps for itself, in blocks of its arena.
#pragma once

#include "linked_list/typed_list.h"

namespace edid_composer {

template <typename record_t, u32 capacity>
struct record_block_t {
  record_block_t *previous;
  record_block_t *next;
  u32 count;
  record_t records[capacity];
};

/// As many as a block of an arena has room for.
template <typename record_t>
inline constexpr u32 records_per_block = 960 / sizeof(record_t);

/// Grows at its end. Addresses of records stay valid as long as the arena that they come from.
template <typename record_t, u32 capacity = records_per_block<record_t>>
class record_blocks_t {
  using block_t = record_block_t<record_t, capacity>;
  static_assert(sizeof(block_t) <= entry_arena_t::block_bytes);

 public:
  explicit record_blocks_t(entry_arena_t *arena) : arena_(arena) {}
  record_blocks_t(const record_blocks_t &) = delete;
  record_blocks_t &operator=(const record_blocks_t &) = delete;

  /// Adds a copy and returns it; null, reported in the name of @p site, when there is no memory for it.
  [[nodiscard]] record_t *add(const record_t &record, const site_t &site, int line = __builtin_LINE()) {
    if ((last_ == nullptr || last_->count == capacity) && !add_block(site, line)) return nullptr;
    record_t &added = last_->records[last_->count++];
    added = record;
    return &added;
  }

  class iterator {
   public:
    iterator(block_t *block, u32 index) : block_(block), index_(index) {}
    record_t &operator*() const { return block_->records[index_]; }
    record_t *operator->() const { return &**this; }
    iterator &operator++() {
      if (++index_ == block_->count) {
        block_ = block_->next;
        index_ = 0;
      }
      return *this;
    }
    bool operator!=(const iterator &other) const { return block_ != other.block_; }

   private:
    block_t *block_;
    u32 index_;
  };

  iterator begin() const { return iterator(first_, 0); }
  iterator end() const { return iterator(nullptr, 0); }

  /// Visits the records from the last to the first.
  template <typename visitor_t>
  void visit_backwards(visitor_t visit) const {
    for (block_t *block = last_; block != nullptr; block = block->previous) {
      for (u32 i = block->count; i > 0; --i)
        visit(block->records[i - 1]);
    }
  }

 private:
  bool add_block(const site_t &site, int line) {
    auto *const block = static_cast<block_t *>(arena_->allocate(sizeof(block_t)));
    if (block == nullptr) {
      log_error(site, line, "%s", new_entry_texts.creation_failed);
      return false;
    }
    block->previous = last_;
    block->next = nullptr;
    block->count = 0;
    (last_ == nullptr ? first_ : last_->next) = block;
    last_ = block;
    return true;
  }

  entry_arena_t *arena_;
  block_t *first_ = nullptr;
  block_t *last_ = nullptr;
};

}  // namespace edid_composer
