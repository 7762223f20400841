// Writing a file so that nobody ever sees half of it.
#pragma once

#include <string>
#include <string_view>

namespace edid_cli {

/// Whether a file has to be on the disk before the program goes on, or only before the system next writes out.
enum class durability_t { at_once, later };

/// Replaces the content of @p file, or makes it, in one step: on failure it is what it was before. What is no regular
/// file (a pipe, a device) is written to directly. Throws bad_input_t.
void write_file_atomically(const std::string &file, std::string_view content, durability_t durability);

/// Writes to a file as above, at once, or to standard output for standard_stream ("-"). Throws bad_input_t.
void write_output(const std::string &file, std::string_view content);

}  // namespace edid_cli
