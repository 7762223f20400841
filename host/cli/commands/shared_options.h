// The options that several commands have.
#pragma once

#include <string>
#include <vector>

#include "commands/option.h"
#include "composition/composition_options.h"

namespace edid_cli {

// The targets must outlive the options.

/// "--drm-dir", of commands that read EDIDs.
option_t drm_directory_option(std::string &directory);

/// An EDID that must be given.
option_t edid_operand(const std::string &name, std::string &source);

/// Platform, sink, port and settings, of commands that compose; @p target gets the defaults.
std::vector<option_t> composition_options(composition_options_t &target);

/// Throws bad_input_t for what does not go together.
void check_composition_options(const composition_options_t &options);

}  // namespace edid_cli
