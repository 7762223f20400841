// Reading whole files, and standard input.
#pragma once

#include <string>

namespace edid_cli {

/// As a file name: standard input, or standard output.
inline constexpr const char *standard_stream = "-";

/// What messages call an input.
std::string input_name(const std::string &file);

/// The whole content of a file or of standard input, of at most 1 MiB. Throws bad_input_t.
std::string read_input(const std::string &file);

}  // namespace edid_cli
