// The forms in which an EDID is written.
#pragma once

#include <span>
#include <string>

#include "edid_composer.h"

namespace edid_cli {

enum class edid_format_t { raw, hex };

/// What is written of an EDID. As hexadecimal text: 16 bytes a line.
std::string formatted(std::span<const u8> edid, edid_format_t format);

/// The ending of a file of that form, with its dot.
const char *file_ending(edid_format_t format);

}  // namespace edid_cli
