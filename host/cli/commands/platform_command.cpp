#include "commands/platform_command.h"

#include <cstdio>

#include "commands/exit_status.h"
#include "config_store.h"

namespace edid_cli {

command_t platform_command() {
  return {"platform", "Print the default platform configuration", {}, [] {
            std::fputs(config_store_default_text(), stdout);
            return done_status;
          }};
}

}  // namespace edid_cli
