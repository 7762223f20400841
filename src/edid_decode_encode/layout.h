// What the decoder and the encoder agree on when a byte holds several fields: tables of fields and their bits.
#pragma once

#include <utility>

#include "bytes.h"

namespace edid_composer {

/// Size of the base block and of each extension, bytes.
inline constexpr u32 block_size = 128;

/// Calls @p visit with each row. Written out, not looped over: the rows' offsets and masks then are constants in the
/// code.
template <typename row_t, std::size_t count, typename visitor_t>
constexpr void for_each_row(const row_t (&rows)[count], visitor_t visit) {
  [&]<std::size_t... index>(std::index_sequence<index...>) {
    (visit(rows[index]), ...);
  }
  (std::make_index_sequence<count>{});
}

/// A boolean of the record and the bit that it has in a byte.
struct flag_t {
  u8 edid_t::*field;
  u8 mask;
};

template <u32 count>
void decode_flags(const flag_t (&flags)[count], u8 byte, edid_t *edid) {
  for_each_row(flags, [&](const flag_t &flag) { edid->*flag.field = (byte & flag.mask) != 0 ? 1 : 0; });
}

template <u32 count>
u8 encode_flags(const flag_t (&flags)[count], const edid_t &edid) {
  u32 byte = 0;
  for_each_row(flags, [&](const flag_t &flag) { byte |= edid.*flag.field != 0 ? flag.mask : 0U; });
  return low_byte(byte);
}

/// Bits of a byte.
struct bit_field_t {
  u8 byte;
  u8 shift;
  u8 width;

  constexpr u32 mask() const { return (1U << width) - 1; }
};

/// A number whose low bits and high bits stand in different bytes.
template <typename record_t>
struct split_field_t {
  u32 record_t::*field;
  bit_field_t low;
  bit_field_t high;
};

template <typename record_t, u32 count>
void decode_split_fields(const split_field_t<record_t> (&fields)[count], const byte_view_t &bytes, record_t *record) {
  for_each_row(fields, [&](const split_field_t<record_t> &row) {
    const u32 low_bits = u32{bytes[row.low.byte]} >> row.low.shift & row.low.mask();
    const u32 high_bits = u32{bytes[row.high.byte]} >> row.high.shift & row.high.mask();
    record->*row.field = high_bits << row.low.width | low_bits;
  });
}

/// Adds the fields to bytes that hold 0 where the fields go.
template <typename record_t, u32 count>
void encode_split_fields(const split_field_t<record_t> (&fields)[count], const record_t &record, u8 *bytes) {
  for_each_row(fields, [&](const split_field_t<record_t> &row) {
    const auto &[field, low, high] = row;
    const u32 value = record.*field;
    bytes[low.byte] = low_byte(bytes[low.byte] | (value & low.mask()) << low.shift);
    bytes[high.byte] = low_byte(bytes[high.byte] | (value >> low.width & high.mask()) << high.shift);
  });
}

}  // namespace edid_composer
