// Composing for several sinks and ports.
#pragma once

#include "batch/compose_options.h"

namespace edid_cli {

/// Composes all that plan_tasks() lists with the platform that is loaded, and prints a summary. Returns
/// whether all succeeded. Throws bad_input_t.
bool compose_several(const compose_options_t &options);

}  // namespace edid_cli
