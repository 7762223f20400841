// What the tests of decoding, encoding and reporting share: buffers that end where they say, blank EDIDs, and the lines
// of the codec's own module.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "record_fields.h"
#include "support/edid_builder.h"
#include "support/output_capture.h"
#include "support/records.h"

namespace codec_test {

using test_support::append;
using test_support::bytes_t;
using test_support::elements_of;
using test_support::output_of;
using test_support::scoped_edid_t;
using test_support::trace_line;
using test_support::traced_output_of;

/// Bytes in a heap block of exactly their number: AddressSanitizer reports each byte read after them, and the pointer
/// isn't null when there are none.
class exact_bytes_t {
 public:
  explicit exact_bytes_t(const bytes_t &bytes) : exact_bytes_t(bytes, bytes.size()) {}
  /// The first @p size of @p bytes.
  exact_bytes_t(const bytes_t &bytes, std::size_t size) : data_(new u8[size]), size_(static_cast<u32>(size)) {
    std::copy_n(bytes.begin(), size, data_.get());
  }
  u8 *data() const { return data_.get(); }
  u32 size() const { return size_; }

 private:
  std::unique_ptr<u8[]> data_;
  u32 size_;
};

inline u8 byte_of(u32 value) {
  return static_cast<u8>(value & 0xFF);
}

inline u8 decode_base_block(const bytes_t &block, edid_t *edid) {
  return decode_edid_block_0(exact_bytes_t(block).data(), edid);
}

inline u8 decode_extension(const bytes_t &extension, edid_t *edid) {
  const exact_bytes_t bytes(extension);
  return decode_edid_extensions(bytes.data(), bytes.size(), edid);
}

/// A base block whose decoding leaves every field 0 or empty but for those that it must set: bytes 8 to 37 are 0 except
/// version 1, revision 3 and the digital bit; no standard timings, four dummy descriptors.
inline test_support::base_block_builder_t blank_base_block() {
  test_support::base_block_builder_t builder;
  for (u32 offset = 8; offset <= 37; ++offset)
    builder.byte(offset, 0);
  return builder.byte(18, 1).byte(19, 3).byte(20, 0x80);
}

/// A CEA-861 extension: header with the given flags, the data block collection, @p behind it, zeros, checksum.
inline bytes_t extension_of(const bytes_t &collection, u8 flags = 0, const bytes_t &behind = {}) {
  bytes_t extension = {0x02, 0x03, byte_of(static_cast<u32>(4 + collection.size())), flags};
  extension.insert(extension.end(), collection.begin(), collection.end());
  extension.insert(extension.end(), behind.begin(), behind.end());
  EXPECT_LE(extension.size(), 127u);
  extension.resize(128, 0);
  test_support::mend_checksum(extension, 0);
  return extension;
}

/// The bytes of several parts, one after the other.
inline bytes_t all_of(const std::vector<bytes_t> &parts) {
  bytes_t bytes;
  for (const bytes_t &part : parts)
    bytes.insert(bytes.end(), part.begin(), part.end());
  return bytes;
}

/// What decoding changes in a record; the stored checksum, which each change of a byte moves, left out.
inline fields_t changes(const fields_t &before, const fields_t &after) {
  fields_t changed = difference(before, after);
  changed.erase("checksum");
  return changed;
}

inline void append_video(edid_t *edid, u32 vic, u32 stereo = 0, u8 native = 0) {
  append(edid->video_list, short_video_desc_t{native, vic, stereo});
}

/// Tags of the lists' element types: the bytes of their names, XORed together in groups of four.
constexpr const char *std_timing_tag = "0x42567A69";
constexpr const char *detailed_timing_tag = "0x371F134F";
constexpr const char *short_video_tag = "0x27054358";
constexpr const char *short_audio_tag = "0x3B124F58";

/// A list whose head says that it holds something else, for as long as this lives; it refuses new entries.
class mistyped_list_t {
 public:
  static constexpr u32 wrong_tag = 0x0000ABCD;

  explicit mistyped_list_t(ll_list_t &list) : list_(list), tag_(list.type) { list_.type = wrong_tag; }
  ~mistyped_list_t() { list_.type = tag_; }
  mistyped_list_t(const mistyped_list_t &) = delete;
  mistyped_list_t &operator=(const mistyped_list_t &) = delete;

  /// What the list prints when an entry with @p entry_tag is refused.
  static std::string refusal(const std::string &entry_tag) {
    return test_support::bug_line("linked_list", "ll_add_entry_to_back",
                                  "This entry represents a different type and cannot be added to this list. "
                                  "List:0x0000ABCD Entry:" +
                                      entry_tag);
  }

 private:
  ll_list_t &list_;
  u32 tag_;
};

/// Lines of the codec's own module.
inline std::string codec_error(const std::string &function, const std::string &message) {
  return test_support::error_line("edid_decode_encode", function, message);
}
inline std::string codec_warning(const std::string &function, const std::string &message) {
  return test_support::warning_line("edid_decode_encode", function, message);
}
inline std::string codec_bug(const std::string &function, const std::string &message) {
  return test_support::bug_line("edid_decode_encode", function, message);
}

}  // namespace codec_test
