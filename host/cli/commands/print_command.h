// "print": an EDID as a readable report.
#pragma once

#include "commands/command.h"

namespace edid_cli {

command_t print_command();

}  // namespace edid_cli
