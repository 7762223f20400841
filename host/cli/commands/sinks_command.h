// "sinks": the connectors of this machine and their displays.
#pragma once

#include "commands/command.h"

namespace edid_cli {

command_t sinks_command();

}  // namespace edid_cli
