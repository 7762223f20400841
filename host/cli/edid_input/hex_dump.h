// Dumps whose lines begin with an offset, as xxd, hexdump -C and od -t x1 write them.
#pragma once

#include <span>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "text/text_lines.h"

namespace edid_cli {

/// Returns by the first line whether a text is such a dump.
bool is_hex_dump(std::span<const text_line_t> lines);

/// The bytes of a dump: what stands between offsets and text columns, and lines repeated where "*" stands for them.
/// Each offset must be that of its bytes. Throws bad_input_t.
std::vector<u8> read_hex_dump(std::span<const text_line_t> lines, const std::string &name);

}  // namespace edid_cli
