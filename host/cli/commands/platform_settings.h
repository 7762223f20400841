// The program's own table of a platform's file: what the command line need not say.
#pragma once

#include <span>

#include "composition/composition_options.h"
#include "platform/platform_check.h"

namespace edid_cli {

/// Its keys are the names of the options that are settings: "port", "audio-mask" and so on.
inline constexpr const char *settings_table = "edid-composer";

/// Takes from the platform that is loaded what the command line has not given. Returns what is wrong with the table.
findings_t take_platform_settings(composition_options_t &options);

/// The same; throws bad_input_t for the first that is wrong.
void require_platform_settings(composition_options_t &options);

/// Checks the platform that is loaded with the settings of its table, which is checked as well; see check_platform().
platform_check_t check_platform_with_settings(std::span<const named_sink_t> sinks);

}  // namespace edid_cli
