// The program's own table of a platform's file: what the command line need not say.
#pragma once

#include "composition/composition_options.h"
#include "platform/finding.h"

namespace edid_cli {

/// Its keys are the names of the options that are settings: "port", "audio-mask" and so on.
inline constexpr const char *settings_table = "edid-composer";

/// Takes from the platform that is loaded what the command line has not given. Returns what is wrong with the table.
findings_t take_platform_settings(composition_options_t &options);

/// The same; throws bad_input_t for the first that is wrong.
void require_platform_settings(composition_options_t &options);

}  // namespace edid_cli
