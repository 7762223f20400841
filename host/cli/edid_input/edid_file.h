// Reading an EDID, raw or as hexadecimal text, from a file or from a connector of this machine.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "io/bad_input.h"

namespace edid_cli {

inline constexpr u32 edid_block_size = 128;
/// The base block counts the blocks that follow it in one byte.
inline constexpr std::size_t max_edid_size = std::size_t{256} * edid_block_size;

/// A file that could be read, but holds no EDID in any form.
class not_an_edid_t : public bad_input_t {
 public:
  using bad_input_t::bad_input_t;
};

/// The bytes of an EDID: one or more whole blocks. What they say is not looked at. Throws bad_input_t, which begins
/// with
/// @p name, or not_an_edid_t.
std::vector<u8> edid_of(const std::string &content, const std::string &name);

/// The same from a file.
std::vector<u8> read_edid_file(const std::string &file);

/// The same from a file, from standard input, or, where there is no file of that name, from the connector of that name.
std::vector<u8> read_edid(const std::string &source, const std::string &drm_directory);

/// The same; no bytes where there is no source.
std::vector<u8> read_sink(const std::optional<std::string> &source, const std::string &drm_directory);

}  // namespace edid_cli
