// Records that a composition keeps for itself, many to a list entry: one heap block serves for dozens of them.
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

template <typename record_t, u32 capacity>
inline constexpr const char *element_type_name<record_block_t<record_t, capacity>> = "record_block_t";

/// Grows at its end and frees all when it goes. Addresses of records stay valid.
/// As many as a block of some 1000 bytes holds, which the heap keeps at hand for the next composition.
template <typename record_t>
inline constexpr u32 records_per_block = 960 / sizeof(record_t);

template <typename record_t, u32 capacity = records_per_block<record_t>>
class record_blocks_t {
  using block_t = record_block_t<record_t, capacity>;

 public:
  record_blocks_t() { static_cast<void>(init_list<block_t>(&blocks_)); }
  ~record_blocks_t() { ll_delete_list(&blocks_); }
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
    ll_entry_t *entry = nullptr;
    entry = create_unfilled_entry(sizeof(block_t), element_tag<block_t>, &entry, this);
    if (entry == nullptr) {
      log_error(site, line, "%s", new_entry_texts.creation_failed);
      return false;
    }
    ll_add_entry_to_front(&blocks_, entry);
    auto *const block = static_cast<block_t *>(entry->data);
    block->previous = last_;
    block->next = nullptr;
    block->count = 0;
    (last_ == nullptr ? first_ : last_->next) = block;
    last_ = block;
    return true;
  }

  ll_list_t blocks_{};
  block_t *first_ = nullptr;
  block_t *last_ = nullptr;
};

}  // namespace edid_composer
