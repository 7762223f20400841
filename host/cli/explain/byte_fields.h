// Naming the bytes of an EDID, from one end to the other.
#pragma once

#include <span>
#include <string>
#include <vector>

#include "explain/byte_names.h"

namespace edid_cli {

/// A field's place. Bytes outside of the EDID read as 0.
struct field_place_t {
  std::span<const u8> edid;
  std::size_t base;    ///< Where the block or descriptor begins that the field is in.
  std::size_t offset;  ///< Where the field begins.

  unsigned at(std::size_t place) const { return place < edid.size() ? edid[place] : 0U; }
  unsigned here(std::size_t index = 0) const { return at(offset + index); }
  unsigned of_base(std::size_t index) const { return at(base + index); }
};

/// A field of a fixed layout.
struct field_row_t {
  std::size_t size;
  const char *name;
  std::string (*meaning)(const field_place_t &place);
};

class byte_naming_t {
 public:
  explicit byte_naming_t(std::span<const u8> edid) : edid_(edid), end_(edid.size()) {}

  std::size_t position() const { return position_; }
  /// The byte that far after the position.
  unsigned next(std::size_t index = 0) const { return place(position_).here(index); }
  field_place_t place(std::size_t base) const { return {edid_, base, position_}; }
  /// The bytes from @p begin to before @p end that are there.
  std::span<const u8> bytes(std::size_t begin, std::size_t end) const;

  /// Names the next bytes, as many of them as there are before the end.
  void name(byte_block_t block, std::size_t size, const std::string &name, const std::string &meaning);
  /// Names the fields of a layout that begins here, up to @p end.
  void name(byte_block_t block, std::span<const field_row_t> rows, std::size_t end);
  /// Further bytes stop here, until the end is set anew.
  void set_end(std::size_t end) { end_ = end; }
  std::size_t end() const { return end_; }

  std::vector<byte_field_t> take() && { return std::move(fields_); }

 private:
  std::span<const u8> edid_;
  std::size_t position_ = 0;
  std::size_t end_;
  std::vector<byte_field_t> fields_;
};

/// The last byte of the block that begins at @p base.
std::string checksum_meaning(const field_place_t &place);

/// A number and its unit: "12 lines".
std::string number_text(unsigned number, const char *unit);
/// A number as printf writes it.
[[gnu::format(printf, 1, 2)]] std::string field_text(const char *format, ...);

struct field_bit_t {
  unsigned mask;
  const char *name;
};
/// The names of the bits that are set, or @p none.
std::string set_bit_names(unsigned value, std::span<const field_bit_t> bits, const char *none = "none");

}  // namespace edid_cli
