// The command line.
#pragma once

#include <string>
#include <variant>

#include "commands.h"

namespace edid_cli {

/// The user asked for help or for the version, which is this text.
struct help_t {
  std::string text;
};

using arguments_t = std::variant<help_t, compose_options_t, explain_options_t, print_options_t, diff_options_t,
                                 sinks_options_t, check_platform_options_t, audio_mask_options_t, platform_options_t>;

/// Throws bad_input_t.
arguments_t parse_arguments(int argument_count, char **arguments);

}  // namespace edid_cli
