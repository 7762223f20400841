// Writes bytes as commented hexadecimal text, in order, each field or data block on a line of its own.
#pragma once

#include <cstddef>
#include <span>
#include <string>

#include "edid_composer.h"

namespace golden {

class annotated_hex_t {
 public:
  explicit annotated_hex_t(std::span<const u8> bytes) : bytes_(bytes) {}

  /// How many bytes have been written.
  std::size_t position() const { return position_; }
  std::size_t remaining() const { return bytes_.size() - position_; }
  /// The bytes that were not written yet. Those outside of what there is read as 0.
  u8 next(std::size_t offset = 0) const;
  std::span<const u8> rest() const { return bytes_.subspan(position_); }

  void blank_line() { text_ += "\n"; }
  /// A line of comment.
  void remark(const std::string &text);
  /// Writes the next @p count bytes; the comment stands on the first of their lines.
  void field(std::size_t count, const std::string &comment);

  const std::string &text() const { return text_; }

 private:
  std::span<const u8> bytes_;
  std::size_t position_ = 0;
  std::string text_;
};

}  // namespace golden
