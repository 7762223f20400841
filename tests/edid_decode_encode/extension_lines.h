// What decode_edid_extensions prints.
#pragma once

#include "codec_fixture.h"

namespace codec_test::extension_lines {

constexpr const char *function = "decode_edid_extensions";

inline std::string error(const std::string &message) {
  return codec_error(function, message);
}

inline std::string trace(const std::string &message) {
  return trace_line(function, message);
}

/// Of a data block that overruns its collection, whose size is @p collection.
inline std::string malformed(u32 tag, u32 length, u32 index, i32 collection) {
  return error(
      "Malformed EDID: The CEA extension data block specifies a tag with a length whose total bytes exceeds the length "
      "of the CEA extension's data block. Tag:" +
      std::to_string(tag) + " Len:" + std::to_string(length) + " Current Byte:" + std::to_string(index) +
      " Data Block Len:" + std::to_string(collection));
}

}  // namespace codec_test::extension_lines
