// "check-platform": what a composition reads of a platform configuration, and its mistakes.
#pragma once

#include "commands/command.h"

namespace edid_cli {

command_t check_platform_command();

}  // namespace edid_cli
