// "diff": two EDIDs side by side.
#pragma once

#include "commands/command.h"

namespace edid_cli {

command_t diff_command();

}  // namespace edid_cli
