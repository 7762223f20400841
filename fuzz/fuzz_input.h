// Takes a fuzzer's bytes apart. When they run out, everything is 0.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <memory>
#include <string>

#include "edid_composer.h"

namespace fuzz {

class fuzz_input_t {
 public:
  fuzz_input_t(const u8 *data, std::size_t size) : data_(data), size_(size) {}

  std::size_t left() const { return size_ - position_; }

  u8 byte() { return position_ < size_ ? data_[position_++] : u8{0}; }
  bool flag() { return (byte() & 1) != 0; }
  u32 number() {
    u32 value = 0;
    for (int i = 0; i < 4; ++i)
      value = value << 8 | byte();
    return value;
  }
  /// A number below @p end.
  u32 below(u32 end) { return number() % end; }

  /// A text of up to @p longest characters, none of them NUL; a line feed ends it.
  std::string text(std::size_t longest) {
    std::string characters;
    while (characters.size() < longest && left() > 0) {
      const u8 character = byte();
      if (character == '\n' || character == '\0') break;
      characters.push_back(static_cast<char>(character));
    }
    return characters;
  }

  /// Bytes in a heap block of exactly their size, so that a sanitizer sees the first read after them.
  struct block_t {
    std::unique_ptr<u8[]> bytes;
    u32 size;
  };
  block_t block(std::size_t size) {
    block_t block{std::unique_ptr<u8[]>(new u8[size]()), static_cast<u32>(size)};
    const std::size_t available = std::min(size, left());
    if (available > 0) std::memcpy(block.bytes.get(), data_ + position_, available);
    position_ += available;
    return block;
  }
  block_t rest(std::size_t longest) { return block(std::min(left(), longest)); }

 private:
  const u8 *data_;
  std::size_t size_;
  std::size_t position_ = 0;
};

}  // namespace fuzz
