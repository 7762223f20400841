// The EDID of a display in text that the registry's editor of Windows has exported: "EDID"=hex:00,ff,...
#pragma once

#include <span>
#include <string>
#include <vector>

#include "edid_composer.h"
#include "text/text_lines.h"

namespace edid_cli {

/// Returns by the first line whether a text is such an export.
bool has_registry_value(std::span<const text_line_t> lines);

/// The bytes of the value named EDID, whose lines end in a backslash but for the last. Throws bad_input_t, also when
/// there is none, or more than one.
std::vector<u8> read_registry_value(std::span<const text_line_t> lines, const std::string &name);

}  // namespace edid_cli
