// The lines that the library writes while it composes.
#pragma once

#include <string>

#include "edid_composer.h"

namespace edid_cli {

/// As the library writes it where nobody takes it: with its newline.
std::string printed(const compose_log_line_t &line);

/// Whether it reports something wrong.
bool is_diagnostic(const compose_log_line_t &line);

/// What a diagnostic says, without white space at both ends.
std::string message_of(const compose_log_line_t &line);

/// "ERROR", "WARNING" or "BUG".
const char *kind_of(const compose_log_line_t &line);

}  // namespace edid_cli
