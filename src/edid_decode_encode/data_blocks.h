// The data blocks of a CEA-861 extension (CEA-861, section 7.5), one after the other.
#pragma once

#include "edid_decode_encode/cea_extension_layout.h"

namespace edid_composer {

struct data_block_t {
  u32 offset;  ///< Of the header byte within the extension.
  u32 tag;
  u32 length;  ///< Of the payload, bytes.
};

/// Goes through the data blocks that end before the detailed timings:
///
///   data_blocks_t blocks(extension);
///   while (blocks.next()) decode(*blocks);
class data_blocks_t {
 public:
  /// An offset of the timings that points into the extension's header bounds nothing but by the bytes that are there.
  explicit data_blocks_t(const byte_view_t &extension)
      : extension_(extension), size_(extension[cea_extension::timings_offset] - cea_extension::data_blocks) {}

  /// Moves to the next block. False at the end, and at a block that does not end within the collection.
  bool next() {
    if (position_ >= size_) return false;
    const u32 offset = cea_extension::data_blocks + position_;
    const u32 header = extension_[offset];
    block_ = {offset, header >> data_block::tag_shift, header & data_block::length_mask};
    const bool unbounded = extension_[cea_extension::timings_offset] < cea_extension::data_blocks;
    overruns_ = position_ + block_.length >= size_ || (unbounded && !extension_.contains(offset));
    if (overruns_) return false;
    position_ += block_.length + 1;
    return true;
  }

  const data_block_t &operator*() const { return block_; }
  const data_block_t *operator->() const { return &block_; }
  /// Whether the walk ended at the current block, as that does not end within the collection.
  bool overruns() const { return overruns_; }
  /// Size of the collection, bytes.
  u32 size() const { return size_; }

 private:
  byte_view_t extension_;
  u32 size_;
  u32 position_ = 0;
  data_block_t block_{};
  bool overruns_ = false;
};

}  // namespace edid_composer
