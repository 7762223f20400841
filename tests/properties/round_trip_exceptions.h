// What a record does not get back when it is encoded and decoded again.
#pragma once

#include <span>

#include "plain_record.h"
#include "support/edid_builder.h"

namespace properties {

/// An encoded record.
struct encoding_t {
  const plain_record_t &record;  ///< As it was.
  bool native_bit;               ///< The platform's.
  test_support::bytes_t bytes;   ///< The 256 bytes.
};

struct exception_t {
  const char *name;
  const char *reason;
  /// Makes of the expected record what the exception makes of it.
  void (*apply)(const encoding_t &encoding, plain_record_t &expected);
};

/// All exceptions, in the order in which they are to be applied.
std::span<const exception_t> exceptions();

/// Number of bytes that header, data blocks, detailed timing and serial descriptor of the extension need.
u32 extension_size(const plain_record_t &record);

/// Tells whether the extension can be decoded again: its blocks are not longer than their headers can say and fit.
bool is_extension_decodable(const plain_record_t &record);

/// Tells whether the encoder writes a text at all, and what it keeps of it.
bool is_written(const std::string &text);
std::string text_of(const char *field, std::size_t size);

}  // namespace properties
