// "explain": why an EDID offers what it offers.
#pragma once

#include "commands/command.h"

namespace edid_cli {

command_t explain_command();

}  // namespace edid_cli
