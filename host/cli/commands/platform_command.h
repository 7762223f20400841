// "platform": the default platform configuration.
#pragma once

#include "commands/command.h"

namespace edid_cli {

command_t platform_command();

}  // namespace edid_cli
