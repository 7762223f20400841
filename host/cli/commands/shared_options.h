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

/// Port and settings, which the platform's file may give as well; see platform_settings.h.
std::vector<option_t> setting_options(composition_options_t &target);
/// "audio-mask" of the option "--audio-mask".
std::string setting_name(const option_t &option);

/// Platform, sink, port and settings, of commands that compose.
std::vector<option_t> composition_options(composition_options_t &target);

/// Throws bad_input_t for what does not go together.
void check_composition_options(const composition_options_t &options);

}  // namespace edid_cli
