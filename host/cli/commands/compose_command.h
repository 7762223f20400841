// "compose": an EDID, or one for each of several sinks or ports.
#pragma once

#include "commands/command.h"

namespace edid_cli {

command_t compose_command();

}  // namespace edid_cli
