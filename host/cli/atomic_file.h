// Writing a file so that nobody ever sees half of it.
#pragma once

#include <span>
#include <string>

#include "edid_composer.h"

namespace edid_cli {

/// Whether a file has to be on the disk before the program goes on, or only before the system next writes out.
enum class durability_t { at_once, later };

/// Replaces the content of @p file, or makes it, in one step: on failure it is what it was before. What is no regular
/// file (a pipe, a device) is written to directly. Throws bad_input_t.
void write_file_atomically(const std::string &file, std::span<const u8> bytes,
                           durability_t durability = durability_t::at_once);

/// Writes all bytes to an open descriptor. @p name is what failures call it. Throws bad_input_t.
void write_all(int descriptor, std::span<const u8> bytes, const std::string &name);

}  // namespace edid_cli
