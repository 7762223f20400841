// Reading and writing bytes within bounds: a byte that isn't there reads as 0, a byte without room is counted, not
// written.
#pragma once

#include <cstddef>

#include "edid_composer.h"

namespace edid_composer {

/// Bytes that came from outside, as many as the caller gave.
class byte_view_t {
 public:
  constexpr byte_view_t(const u8 *data, u32 size) : data_(data), size_(data == nullptr ? 0 : size) {}

  constexpr const u8 *data() const { return data_; }
  constexpr u32 size() const { return size_; }
  constexpr bool contains(u32 offset) const { return offset < size_; }
  constexpr u8 operator[](u32 offset) const { return contains(offset) ? data_[offset] : u8{0}; }

  /// What lies at @p offset and after it.
  constexpr byte_view_t from(u32 offset) const {
    return contains(offset) ? byte_view_t(data_ + offset, size_ - offset) : byte_view_t(data_, 0);
  }

  /// The first @p count bytes, as far as they are there: for a loop over all of them, which then needs no check of
  /// each.
  constexpr byte_view_t first(u32 count) const { return byte_view_t(data_, count < size_ ? count : size_); }
  constexpr const u8 *begin() const { return data_; }
  constexpr const u8 *end() const { return data_ + size_; }

  constexpr u32 little_endian_16(u32 offset) const { return u32{(*this)[offset]} | u32{(*this)[offset + 1]} << 8; }
  constexpr u32 little_endian_32(u32 offset) const {
    return little_endian_16(offset) | little_endian_16(offset + 2) << 16;
  }
  constexpr u32 big_endian_16(u32 offset) const { return u32{(*this)[offset]} << 8 | u32{(*this)[offset + 1]}; }

  /// Copies @p count bytes from @p offset on.
  void copy(u32 offset, u8 *destination, u32 count) const {
    for (u32 i = 0; i < count; ++i)
      destination[i] = (*this)[offset + i];
  }

 private:
  const u8 *data_;
  u32 size_;
};

/// The low 8 bits of a number.
constexpr u8 low_byte(u32 value) {
  return static_cast<u8>(value & 0xFF);
}

/// Writes bytes one after the other into a buffer of fixed size.
class byte_writer_t {
 public:
  constexpr byte_writer_t(u8 *data, u32 capacity) : data_(data), capacity_(capacity) {}

  /// Offset of the next byte; goes on past the end of the buffer, so that it shows what was needed.
  constexpr u32 position() const { return position_; }
  constexpr void seek(u32 position) { position_ = position; }

  constexpr void put(u8 value) { put_at(position_++, value); }
  constexpr void put(const u8 *values, u32 count) {
    for (u32 i = 0; i < count; ++i)
      put(values[i]);
  }
  constexpr void put_little_endian_16(u32 value) {
    put(low_byte(value));
    put(low_byte(value >> 8));
  }
  constexpr void put_little_endian_32(u32 value) {
    put_little_endian_16(value);
    put_little_endian_16(value >> 16);
  }

  /// Keeps a place for a byte that is known later.
  constexpr u32 reserve() { return position_++; }
  constexpr void put_at(u32 offset, u8 value) {
    if (offset < capacity_) data_[offset] = value;
  }

 private:
  u8 *data_;
  u32 capacity_;
  u32 position_ = 0;
};

}  // namespace edid_composer
