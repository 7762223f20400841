// What the tests of the encoder share: a record with nothing but what it needs, and its 256 bytes.
#pragma once

#include <cstring>
#include <functional>
#include <map>

#include "codec_fixture.h"

namespace codec_test {

/// A prepared record of maker "TST" and year 2024 with the timings of VICs 16 and 4.
class minimal_record_t {
 public:
  minimal_record_t() {
    std::memcpy(edid_->manufacturer, "TST", 4);
    edid_->year = 2024;
    edid_->version = 1;
    edid_->revision = 3;
    append(edid_->dtd_list, test_support::timing_of_vic(16));
    append(edid_->dtd_list, test_support::timing_of_vic(4));
  }
  edid_t *get() { return edid_.get(); }
  edid_t *operator->() { return edid_.get(); }

 private:
  scoped_edid_t edid_;
};

inline void set_range_limits(edid_t *edid) {
  edid->min_v_rate = 24;
  edid->max_v_rate = 75;
  edid->min_h_rate = 15;
  edid->max_h_rate = 135;
  edid->max_pixel_clock = 300;
}

template <std::size_t size>
void set_text(char (&field)[size], const std::string &text) {
  ASSERT_LE(text.size(), size);
  std::memset(field, 0, size);
  std::copy(text.begin(), text.end(), field);
}

/// The payload of an entry that is there.
template <typename record_t>
record_t &element_at(ll_list_t &list, u32 index) {
  ll_entry_t *entry = list.head;
  for (; index > 0; --index)
    entry = entry->next;
  return *static_cast<record_t *>(entry->data);
}

/// The two descriptors of a minimal record, and the timing of VIC 1, which every extension holds.
inline const bytes_t vic_16_descriptor = {0x02, 0x3A, 0x80, 0x18, 0x71, 0x38, 0x2D, 0x40, 0x58,
                                          0x2C, 0x45, 0x00, 0xC4, 0x8E, 0x21, 0x00, 0x00, 0x1E};
inline const bytes_t vic_4_descriptor = {0x01, 0x1D, 0x00, 0x72, 0x51, 0xD0, 0x1E, 0x20, 0x6E,
                                         0x28, 0x55, 0x00, 0xC4, 0x8E, 0x21, 0x00, 0x00, 0x1E};
inline const bytes_t vic_1_descriptor = {0xD6, 0x09, 0x80, 0xA0, 0x20, 0xE0, 0x2D, 0x10, 0x10,
                                         0x60, 0xA2, 0x00, 0x13, 0x8E, 0x21, 0x00, 0x00, 0x18};
inline const bytes_t range_limits = {0,  0, 0,    0xFD, 0,    24,   75,   15,   135,
                                     30, 0, 0x0A, 0x20, 0x20, 0x20, 0x20, 0x20, 0x20};

struct encoding_t {
  bytes_t bytes;  ///< The 256 bytes, which were 0xA5 before.
  u8 result;
  std::string output;
  u8 spa_offset;
};

/// Encodes into a block of exactly 256 bytes.
inline encoding_t encode(edid_t *edid, i32 native_bit = 0, bool tracing = false) {
  platform_values_t values{};
  values.native_bit = native_bit;
  const exact_bytes_t block(bytes_t(256, 0xA5));
  encoding_t encoding{{}, 0, "", 0xA5};
  const auto action = [&] { encoding.result = encode_edid(block.data(), 256, edid, &encoding.spa_offset, &values); };
  encoding.output = tracing ? traced_output_of(action) : output_of(action);
  encoding.bytes.assign(block.data(), block.data() + 256);
  return encoding;
}

/// The bytes of an encoding that succeeds without a word.
inline bytes_t encoded(edid_t *edid, i32 native_bit = 0) {
  const encoding_t encoding = encode(edid, native_bit);
  EXPECT_EQ(encoding.result, 1);
  EXPECT_EQ(encoding.output, "");
  EXPECT_EQ(test_support::block_sum(encoding.bytes.data()), 0);
  EXPECT_EQ(test_support::block_sum(encoding.bytes.data() + 128), 0);
  return encoding.bytes;
}

inline bytes_t slice(const bytes_t &bytes, std::size_t from, std::size_t count) {
  return bytes_t(bytes.begin() + static_cast<std::ptrdiff_t>(from),
                 bytes.begin() + static_cast<std::ptrdiff_t>(from + count));
}

/// The data blocks of an encoded EDID: bytes 132 up to the first detailed timing.
inline bytes_t collection_of(const bytes_t &edid) {
  return slice(edid, 132, edid[130] - 4u);
}

}  // namespace codec_test
